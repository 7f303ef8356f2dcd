#pragma once

#include "document/records/comp_river_pos.h"

// The initial concentration of a component (KindFilter AllKinds).
class KOTA0_AD_API AD_Init_cond : public AD_Comp_RiverPos {
public:
    AD_Init_cond(); // global
    ~AD_Init_cond() override;

    void Save(void* file) override;
    void Load(void* keyword) override;

    double concentration = 0.0; // in the component's unit
};

// The initial condition of a component (KindFilter AllKinds) in stratified water: concentrations from the
// surface to the bottom, and two coefficients of the exchange between them, which the editor hands on as they
// are.
class KOTA0_AD_API AD_Init_cond_stra : public AD_Comp_RiverPos {
public:
    AD_Init_cond_stra(); // global
    ~AD_Init_cond_stra() override;

    void Save(void* file) override;
    void Load(void* keyword) override;

    double concS = 0.0; // in the component's unit, as the three below
    double conc2 = 0.0;
    double conc3 = 0.0;
    double concB = 0.0;
    double k2 = 0.0;
    double k3 = 0.0;
};
