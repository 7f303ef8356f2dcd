#pragma once

#include "document/records/comp_river_pos.h"

// How a critical shear is given.
enum class ShearMode { Stress = 0, Velocity = 1 };

// The cohesive sediment parameters of a component (KindFilter CohesiveKinds), everywhere or at one place of a
// river.
class KOTA0_AD_API AD_Global_Const : public AD_Comp_RiverPos {
public:
    AD_Global_Const(); // global
    ~AD_Global_Const() override;

    // Adds the record's six keywords to the open section, which is the record's own.
    void Save(void* file) override;
    // Reads them from the record's section, each by its name.
    void Load(void* section) override;

    // Fall velocity.
    double cOffset = 10.0; // no unit
    double g = 4.5;        // dimensionless, as m and swi
    double m = 0.0;
    double w0 = 0.005; // m/s
    double swi = 0.000392;

    // Deposition.
    double timeCentering = 0.8; // dimensionless
    double critShearDep = 0.05; // N/m^2 or m/s, by depShearMode

    // Erosion, by layers.
    int instantErosion = 1;      // not 0: layer 1 erodes at once
    double critShearEro1 = 0.07; // N/m^2 or m/s, by eroShearMode
    double critShearEro2 = 0.3;  // as layer 1
    double critShearEro3 = 0.3;  // as layer 1
    double eroCoef1 = 0.2;       // g/(m^2 s)
    double eroCoef2 = 0.2;
    double eroCoef3 = 0.2;
    double eroExp1 = 3.0; // dimensionless, as the two below
    double eroExp2 = 3.0;
    double eroExp3 = 3.0;

    // Consolidation.
    double tran12 = 2.85;    // g/(m^2 s)
    double tran23 = 0.15;    // g/(m^2 s)
    double slidFrCoef = 5.0; // m^0.5/s

    int depShearMode = 0; // a ShearMode
    int eroShearMode = 0; // a ShearMode
};
