#include "document/records/dispersion.h"

#include "document/records/parameters.h"

namespace {

constexpr auto parameters =
    kota::fileForm(&AD_Dispersion::riverName, &AD_Dispersion::chainage, &AD_Dispersion::dispFactor,
                   &AD_Dispersion::exponent, &AD_Dispersion::minCoef, &AD_Dispersion::maxCoef);

// Layer by layer, where the class goes value by value.
constexpr auto twoLayerParameters = kota::fileForm(
    &AD_Dispersion_K32::riverName, &AD_Dispersion_K32::chainage, &AD_Dispersion_K32::dispFactorTop,
    &AD_Dispersion_K32::exponentTop, &AD_Dispersion_K32::minCoefTop, &AD_Dispersion_K32::maxCoefTop,
    &AD_Dispersion_K32::dispFactorBottom, &AD_Dispersion_K32::exponentBottom,
    &AD_Dispersion_K32::minCoefBottom, &AD_Dispersion_K32::maxCoefBottom);

} // namespace

AD_Dispersion::AD_Dispersion() {
    isGlobal = 0;
}
AD_Dispersion::~AD_Dispersion() = default;

void AD_Dispersion::Save(void* file) {
    kota::saveKeyword(file, dataKeyword, *this, parameters);
}
void AD_Dispersion::Load(void* keyword) {
    kota::loadKeyword(keyword, *this, parameters);
}

AD_Dispersion_K32::AD_Dispersion_K32() {
    isGlobal = 0;
}
AD_Dispersion_K32::~AD_Dispersion_K32() = default;

void AD_Dispersion_K32::Save(void* file) {
    kota::saveKeyword(file, dataKeyword, *this, twoLayerParameters);
}
void AD_Dispersion_K32::Load(void* keyword) {
    kota::loadKeyword(keyword, *this, twoLayerParameters);
}
