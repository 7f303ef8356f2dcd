#pragma once

#include "document/records/comp_river_pos.h"

// The ice cover at a place of a river. No page shows it: it is carried from file to file.
class KOTA0_AD_API AD_Ice_Data : public AD_Comp_RiverPos {
public:
    AD_Ice_Data(); // global in memory, local on file, where it has no triple
    ~AD_Ice_Data() override;

    void Save(void* file) override;
    void Load(void* keyword) override;

    double iceThickness = 0.0; // m
    double iceWidth = 0.0;     // m
    int quality = 0;
};
