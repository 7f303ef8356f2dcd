#pragma once

#include "document/records/comp_river_pos.h"

// A non-cohesive sediment fraction. Its component goes by KindFilter NonCohesiveKinds.
class KOTA0_AD_API AD_NonCohesiv_ST_Data : public AD_Comp_RiverPos {
public:
    AD_NonCohesiv_ST_Data(); // global
    ~AD_NonCohesiv_ST_Data() override;

    void Save(void* file) override;
    void Load(void* keyword) override;

    double grainSize = 0.001; // m
    double stdDev = 1.0;
};
