#include "document/records/init_cond.h"

#include "document/records/parameters.h"

namespace {

constexpr auto plainParameters =
    kota::fileForm(&AD_Init_cond::componentNum, &AD_Init_cond::concentration, kota::LocationTriple());

constexpr auto stratifiedParameters =
    kota::fileForm(&AD_Init_cond_stra::componentNum, &AD_Init_cond_stra::concS, &AD_Init_cond_stra::conc2,
                   &AD_Init_cond_stra::conc3, &AD_Init_cond_stra::concB, &AD_Init_cond_stra::k2,
                   &AD_Init_cond_stra::k3, kota::LocationTriple());

} // namespace

AD_Init_cond::AD_Init_cond() {
    isGlobal = 1;
}
AD_Init_cond::~AD_Init_cond() = default;

void AD_Init_cond::Save(void* file) {
    kota::saveKeyword(file, dataKeyword, *this, plainParameters);
}
void AD_Init_cond::Load(void* keyword) {
    kota::loadKeyword(keyword, *this, plainParameters);
}

AD_Init_cond_stra::AD_Init_cond_stra() {
    isGlobal = 1;
}
AD_Init_cond_stra::~AD_Init_cond_stra() = default;

void AD_Init_cond_stra::Save(void* file) {
    kota::saveKeyword(file, dataKeyword, *this, stratifiedParameters);
}
void AD_Init_cond_stra::Load(void* keyword) {
    kota::loadKeyword(keyword, *this, stratifiedParameters);
}
