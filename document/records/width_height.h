#pragma once

#include "document/records/comp_river_pos.h"

// A line of a layer's table. A line counts only when both values are given.
class KOTA0_AD_API AD_ST_Init_Cond_data : public CObject {
public:
    AD_ST_Init_Cond_data();
    ~AD_ST_Init_Cond_data() override;

    // As those of AD_Comp_RiverPos.
    virtual void Save(void* file);
    virtual void Load(void* keyword);

    double width = notGiven;       // m
    double layerHeight = notGiven; // m
};
