#include "document/records/non_cohesive.h"

#include "document/records/parameters.h"

namespace {
constexpr auto parameters =
    kota::fileForm(&AD_NonCohesiv_ST_Data::componentNum, &AD_NonCohesiv_ST_Data::grainSize,
                   &AD_NonCohesiv_ST_Data::stdDev, kota::LocationTriple());
} // namespace

AD_NonCohesiv_ST_Data::AD_NonCohesiv_ST_Data() {
    isGlobal = 1;
}
AD_NonCohesiv_ST_Data::~AD_NonCohesiv_ST_Data() = default;

void AD_NonCohesiv_ST_Data::Save(void* file) {
    kota::saveKeyword(file, dataKeyword, *this, parameters);
}
void AD_NonCohesiv_ST_Data::Load(void* keyword) {
    kota::loadKeyword(keyword, *this, parameters);
}
