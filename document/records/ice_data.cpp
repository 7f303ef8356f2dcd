#include "document/records/ice_data.h"

#include "document/records/parameters.h"

namespace {
constexpr auto parameters =
    kota::fileForm(&AD_Ice_Data::riverName, &AD_Ice_Data::chainage, &AD_Ice_Data::iceThickness,
                   &AD_Ice_Data::iceWidth, &AD_Ice_Data::quality);
} // namespace

AD_Ice_Data::AD_Ice_Data() {
    isGlobal = 1;
}
AD_Ice_Data::~AD_Ice_Data() = default;

void AD_Ice_Data::Save(void* file) {
    kota::saveKeyword(file, dataKeyword, *this, parameters);
}
void AD_Ice_Data::Load(void* keyword) {
    kota::loadKeyword(keyword, *this, parameters);
}
