#include "document/records/layer.h"

#include "document/records/parameters.h"

namespace {
constexpr auto parameters =
    kota::fileForm(&AD_Cohesiv_ST_Init_Cond::componentNum, &AD_Cohesiv_ST_Init_Cond::height,
                   &AD_Cohesiv_ST_Init_Cond::density, &AD_Cohesiv_ST_Init_Cond::potFac,
                   kota::asBool(&AD_Cohesiv_ST_Init_Cond::useTable), &AD_Cohesiv_ST_Init_Cond::layer,
                   kota::LocationTriple());
} // namespace

AD_Cohesiv_ST_Init_Cond::AD_Cohesiv_ST_Init_Cond() {
    isGlobal = 1;
}
AD_Cohesiv_ST_Init_Cond::~AD_Cohesiv_ST_Init_Cond() {
    adderList.DeleteAll();
}

void AD_Cohesiv_ST_Init_Cond::Save(void* file) {
    kota::saveKeyword(file, dataKeyword, *this, parameters);
}
void AD_Cohesiv_ST_Init_Cond::Load(void* keyword) {
    kota::loadKeyword(keyword, *this, parameters);
}
