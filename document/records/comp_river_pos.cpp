#include "document/records/comp_river_pos.h"

#include "platform/kvs/kvs.h"

#include <utility>

AD_Comp_RiverPos::AD_Comp_RiverPos() = default;
AD_Comp_RiverPos::~AD_Comp_RiverPos() = default;

void AD_Comp_RiverPos::Save(void* /*file*/) {}
void AD_Comp_RiverPos::Load(void* /*keyword*/) {}

void AD_Comp_RiverPos::SaveLocation(void* file) {
    kvsAddBool(file, isGlobal != 0);
    kvsAddString(file, isGlobal ? std::string_view() : riverName.View());
    kvsAddDouble(file, isGlobal ? 0.0 : chainage);
}

int AD_Comp_RiverPos::GetComponentNum() const {
    return componentNum;
}
CString AD_Comp_RiverPos::GetRiverName() const {
    return riverName;
}
void AD_Comp_RiverPos::SetRiverName(CString name) {
    riverName = std::move(name);
}
double AD_Comp_RiverPos::GetChainage() const {
    return chainage;
}
void AD_Comp_RiverPos::SetChainage(double value) {
    chainage = value;
}
