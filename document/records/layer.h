#pragma once

#include "document/lists/adder_list.h"
#include "document/records/comp_river_pos.h"

// The initial condition of a cohesive sediment layer, with a table of its own of widths and layer heights.
// Its component goes by KindFilter SedimentKinds.
class KOTA0_AD_API AD_Cohesiv_ST_Init_Cond : public AD_Comp_RiverPos {
public:
    AD_Cohesiv_ST_Init_Cond(); // global
    // Deletes the records of the table.
    ~AD_Cohesiv_ST_Init_Cond() override;

    // The record alone; its list saves and loads the table.
    void Save(void* file) override;
    void Load(void* keyword) override;

    double height = 0.0;      // m
    double density = 1029.56; // kg/m^3
    double potFac = 0.0;      // potency factor
    int useTable = 0;         // not 0: the table holds instead of `height`
    int layer = 0;            // 0 upper, 1 middle, 2 lower, -1 none
    CAdderList adderList;
};
