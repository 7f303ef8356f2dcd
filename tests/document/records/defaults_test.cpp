#include "document/records/boundary.h"
#include "document/records/cohesive.h"
#include "document/records/decay.h"
#include "document/records/dispersion.h"
#include "document/records/ice_data.h"
#include "document/records/init_cond.h"
#include "document/records/layer.h"
#include "document/records/non_cohesive.h"
#include "document/records/width_height.h"

#include <gtest/gtest.h>

namespace {

// A member of a new record, and what its constructor has to give it.
struct Row {
    const char* name;
    double actual;
    double expected;
};

template <std::size_t Count>
void expectAll(const Row (&rows)[Count]) {
    for (const Row& row : rows)
        EXPECT_EQ(row.actual, row.expected) << row.name;
}

// clang-format off

TEST(RecordDefaults, OfTheLocation) {
    const AD_Comp_RiverPos record;

    EXPECT_TRUE(record.riverName.IsEmpty());
}

TEST(RecordDefaults, OfWhichRecordsAreGlobal) {
    expectAll({
        {"decay",                       double(AD_Decay().isGlobal),                1},
        {"initial condition",           double(AD_Init_cond().isGlobal),            1},
        {"stratified",                  double(AD_Init_cond_stra().isGlobal),       1},
        {"ice data",                    double(AD_Ice_Data().isGlobal),             1},
        {"cohesive constants",          double(AD_Global_Const().isGlobal),         1},
        {"layer",                       double(AD_Cohesiv_ST_Init_Cond().isGlobal), 1},
        {"non-cohesive",                double(AD_NonCohesiv_ST_Data().isGlobal),   1},
        {"dispersion",                  double(AD_Dispersion().isGlobal),           0},
        {"dispersion of two layers",    double(AD_Dispersion_K32().isGlobal),       0},
        {"boundary",                    double(AD_Bondary().isGlobal),              0},
        {"boundary of two layers",      double(AD_Boundary_K32().isGlobal),         0},
    });
}

TEST(RecordDefaults, OfDecayAndInitialConditions) {
    const AD_Decay decay;
    const AD_Init_cond init;
    const AD_Init_cond_stra stratified;

    expectAll({
        {"decayConst",    decay.decayConst,   0.0},
        {"concentration", init.concentration, 0.0},
        {"concS",         stratified.concS,   0.0},
        {"conc2",         stratified.conc2,   0.0},
        {"conc3",         stratified.conc3,   0.0},
        {"concB",         stratified.concB,   0.0},
        {"k2",            stratified.k2,      0.0},
        {"k3",            stratified.k3,      0.0},
    });
}

TEST(RecordDefaults, OfBoundariesAndIce) {
    const AD_Bondary boundary;
    const AD_Boundary_K32 twoLayer;
    const AD_Ice_Data ice;

    expectAll({
        {"kMix",               boundary.kMix,                      0.0},
        {"boundaryType",       double(boundary.boundaryType),      0},
        {"kMixTop",            twoLayer.kMixTop,                   0.0},
        {"kMixBottom",         twoLayer.kMixBottom,                0.0},
        {"boundaryTypeTop",    double(twoLayer.boundaryTypeTop),   0},
        {"boundaryTypeBottom", double(twoLayer.boundaryTypeBottom), 0},
        {"iceThickness",       ice.iceThickness,                   0.0},
        {"iceWidth",           ice.iceWidth,                       0.0},
        {"quality",            double(ice.quality),                0},
    });
}

TEST(RecordDefaults, OfCohesiveConstants) {
    const AD_Global_Const record;

    expectAll({
        {"chainage",       record.chainage,               0.0},
        {"cOffset",        record.cOffset,                10.0},
        {"g",              record.g,                      4.5},
        {"m",              record.m,                      0.0},
        {"w0",             record.w0,                     0.005},
        {"swi",            record.swi,                    0.000392},
        {"timeCentering",  record.timeCentering,          0.8},
        {"critShearDep",   record.critShearDep,           0.05},
        {"instantErosion", double(record.instantErosion), 1},
        {"critShearEro1",  record.critShearEro1,          0.07},
        {"critShearEro2",  record.critShearEro2,          0.3},
        {"critShearEro3",  record.critShearEro3,          0.3},
        {"eroCoef1",       record.eroCoef1,               0.2},
        {"eroCoef2",       record.eroCoef2,               0.2},
        {"eroCoef3",       record.eroCoef3,               0.2},
        {"eroExp1",        record.eroExp1,                3.0},
        {"eroExp2",        record.eroExp2,                3.0},
        {"eroExp3",        record.eroExp3,                3.0},
        {"tran12",         record.tran12,                 2.85},
        {"tran23",         record.tran23,                 0.15},
        {"slidFrCoef",     record.slidFrCoef,             5.0},
        {"depShearMode",   double(record.depShearMode),   0},
        {"eroShearMode",   double(record.eroShearMode),   0},
    });
}

TEST(RecordDefaults, OfALayer) {
    const AD_Cohesiv_ST_Init_Cond record;

    expectAll({
        {"height",   record.height,           0.0},
        {"density",  record.density,          1029.56},
        {"potFac",   record.potFac,           0.0},
        {"useTable", double(record.useTable), 0},
        {"layer",    double(record.layer),    0},
    });
    EXPECT_TRUE(record.adderList.IsEmpty());
}

TEST(RecordDefaults, OfALineOfALayersTableAreThatNothingIsGiven) {
    const AD_ST_Init_Cond_data record;

    expectAll({
        {"width",       record.width,       1e10},
        {"layerHeight", record.layerHeight, 1e10},
    });
}

TEST(RecordDefaults, OfNonCohesiveSediment) {
    const AD_NonCohesiv_ST_Data record;

    expectAll({
        {"grainSize", record.grainSize, 0.001},
        {"stdDev",    record.stdDev,    1.0},
    });
}

// clang-format on

} // namespace
