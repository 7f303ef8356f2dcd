#include "document/records/boundary.h"

#include "document/records/parameters.h"

namespace {

constexpr auto parameters = kota::fileForm(&AD_Bondary::riverName, &AD_Bondary::chainage,
                                           &AD_Bondary::boundaryType, &AD_Bondary::kMix);

constexpr auto twoLayerParameters = kota::fileForm(
    &AD_Boundary_K32::riverName, &AD_Boundary_K32::chainage, &AD_Boundary_K32::boundaryTypeTop,
    &AD_Boundary_K32::kMixTop, &AD_Boundary_K32::boundaryTypeBottom, &AD_Boundary_K32::kMixBottom);

} // namespace

AD_Bondary::AD_Bondary() {
    isGlobal = 0;
}
AD_Bondary::~AD_Bondary() = default;

void AD_Bondary::Save(void* file) {
    kota::saveKeyword(file, dataKeyword, *this, parameters);
}
void AD_Bondary::Load(void* keyword) {
    kota::loadKeyword(keyword, *this, parameters);
}

AD_Boundary_K32::AD_Boundary_K32() {
    isGlobal = 0;
}
AD_Boundary_K32::~AD_Boundary_K32() = default;

void AD_Boundary_K32::Save(void* file) {
    kota::saveKeyword(file, dataKeyword, *this, twoLayerParameters);
}
void AD_Boundary_K32::Load(void* keyword) {
    kota::loadKeyword(keyword, *this, twoLayerParameters);
}
