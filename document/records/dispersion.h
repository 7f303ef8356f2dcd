#pragma once

#include "document/records/comp_river_pos.h"

// The dispersion at a place of a river, for all components: dispersion coefficient (m^2/s) = factor *
// velocity (m/s) to the power of the exponent, within the two bounds. Always local: on file it has no
// component and no triple.
class KOTA0_AD_API AD_Dispersion : public AD_Comp_RiverPos {
public:
    AD_Dispersion(); // local
    ~AD_Dispersion() override;

    void Save(void* file) override;
    void Load(void* keyword) override;

    double dispFactor = 0.0;
    double exponent = 0.0;
    double minCoef = 0.0; // m^2/s
    double maxCoef = 0.0; // m^2/s
};

// The same for two layers.
class KOTA0_AD_API AD_Dispersion_K32 : public AD_Comp_RiverPos {
public:
    AD_Dispersion_K32(); // local
    ~AD_Dispersion_K32() override;

    void Save(void* file) override;
    void Load(void* keyword) override;

    double dispFactorTop = 0.0;
    double dispFactorBottom = 0.0;
    double exponentTop = 0.0;
    double exponentBottom = 0.0;
    double minCoefTop = 0.0;    // m^2/s
    double minCoefBottom = 0.0; // m^2/s
    double maxCoefTop = 0.0;    // m^2/s
    double maxCoefBottom = 0.0; // m^2/s
};
