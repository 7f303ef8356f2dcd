#pragma once

#include "document/records/comp_river_pos.h"

// The first-order decay of a component (KindFilter AllKinds).
class KOTA0_AD_API AD_Decay : public AD_Comp_RiverPos {
public:
    AD_Decay(); // global
    ~AD_Decay() override;

    void Save(void* file) override;
    void Load(void* keyword) override;

    double decayConst = 0.0; // 1/h
};
