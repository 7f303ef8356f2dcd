#include "document/records/component.h"

#include "document/records/comp_river_pos.h"
#include "document/records/parameters.h"

namespace {
constexpr auto parameters =
    kota::fileForm(&AD_Component::number, &AD_Component::name, &AD_Component::units, &AD_Component::kind);
} // namespace

AD_Component::AD_Component() = default;
AD_Component::~AD_Component() = default;

void AD_Component::Save(void* file) {
    kota::saveKeyword(file, dataKeyword, *this, parameters);
}
void AD_Component::Load(void* keyword) {
    kota::loadKeyword(keyword, *this, parameters);
}
