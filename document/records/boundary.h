#pragma once

#include "document/records/comp_river_pos.h"

// How a component leaves and enters the model at a boundary.
enum class BoundaryType { Closed = 0, OpenConcentration = 1, OpenTransport = 2 };

// A boundary of the model at a place of a river. Always local.
class KOTA0_AD_API AD_Bondary : public AD_Comp_RiverPos {
public:
    AD_Bondary(); // local
    ~AD_Bondary() override;

    void Save(void* file) override;
    void Load(void* keyword) override;

    double kMix = 0.0;    // 1/h
    int boundaryType = 0; // a BoundaryType
};

// The same for two layers.
class KOTA0_AD_API AD_Boundary_K32 : public AD_Comp_RiverPos {
public:
    AD_Boundary_K32(); // local
    ~AD_Boundary_K32() override;

    void Save(void* file) override;
    void Load(void* keyword) override;

    double kMixTop = 0.0;       // 1/h
    double kMixBottom = 0.0;    // 1/h
    int boundaryTypeTop = 0;    // a BoundaryType
    int boundaryTypeBottom = 0; // a BoundaryType
};
