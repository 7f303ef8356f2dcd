#pragma once

#include "document/records/global_var.h"

#include <algorithm>

namespace kota::test {

// The single values of AD_Global_Var in declared order, each with its default and another value that no other
// row has (true for the flags).
struct GlobalInt {
    const char* name;
    int AD_Global_Var::*member;
    int byDefault;
    int other;
};

struct GlobalDouble {
    const char* name;
    double AD_Global_Var::*member;
    double byDefault;
    double other;
};

// clang-format off

inline constexpr GlobalInt globalInts[] = {
    {"LastSelected",         &AD_Global_Var::LastSelected,         0, 21},
    {"LastLevel1",           &AD_Global_Var::LastLevel1,           1, 22},
    {"WQInter",              &AD_Global_Var::WQInter,              0, 23},
    {"model_type",           &AD_Global_Var::model_type,           1, 24},
    {"G_Ice_const_cross_A",  &AD_Global_Var::G_Ice_const_cross_A,  0, 25},
    {"G_Ice_const_activate", &AD_Global_Var::G_Ice_const_activate, 0, 26},
    {"G_Ice_cloud_dens",     &AD_Global_Var::G_Ice_cloud_dens,     0, 27},
    {"G_Ice_quality",        &AD_Global_Var::G_Ice_quality,        0, 28},
};

inline constexpr GlobalInt globalFlags[] = {
    {"G_Coli",          &AD_Global_Var::G_Coli,          0, 1},
    {"G_Phos",          &AD_Global_Var::G_Phos,          0, 1},
    {"G_K32Comp",       &AD_Global_Var::G_K32Comp,       0, 1},
    {"G_Add_MassT",     &AD_Global_Var::G_Add_MassT,     0, 1},
    {"G_Add_MassTA",    &AD_Global_Var::G_Add_MassTA,    0, 1},
    {"G_Add_MassG",     &AD_Global_Var::G_Add_MassG,     0, 1},
    {"G_Add_MassGA",    &AD_Global_Var::G_Add_MassGA,    0, 1},
    {"G_Add_MassBT",    &AD_Global_Var::G_Add_MassBT,    0, 1},
    {"G_Add_MassBTA",   &AD_Global_Var::G_Add_MassBTA,   0, 1},
    {"G_Add_MassBG",    &AD_Global_Var::G_Add_MassBG,    0, 1},
    {"G_Add_MassBGA",   &AD_Global_Var::G_Add_MassBGA,   0, 1},
    {"G_Add_OrderT",    &AD_Global_Var::G_Add_OrderT,    0, 1},
    {"G_Add_OrderTA",   &AD_Global_Var::G_Add_OrderTA,   0, 1},
    {"G_Add_OrderG",    &AD_Global_Var::G_Add_OrderG,    0, 1},
    {"G_Add_OrderGA",   &AD_Global_Var::G_Add_OrderGA,   0, 1},
    {"G_Add_MBranchT",  &AD_Global_Var::G_Add_MBranchT,  0, 1},
    {"G_Add_MBranchTA", &AD_Global_Var::G_Add_MBranchTA, 0, 1},
    {"G_Add_TransG",    &AD_Global_Var::G_Add_TransG,    0, 1},
    {"G_Add_TransGA",   &AD_Global_Var::G_Add_TransGA,   0, 1},
    {"G_Add_DispersG",  &AD_Global_Var::G_Add_DispersG,  0, 1},
    {"G_Add_DispersGA", &AD_Global_Var::G_Add_DispersGA, 0, 1},
    {"G_Add_ConvG",     &AD_Global_Var::G_Add_ConvG,     0, 1},
    {"G_Add_ConvGA",    &AD_Global_Var::G_Add_ConvGA,    0, 1},
};

inline constexpr GlobalDouble globalDoubles[] = {
    {"G_disp_factor",         &AD_Global_Var::G_disp_factor,         0.0,      1.5},
    {"G_exponent",            &AD_Global_Var::G_exponent,            0.0,      2.5},
    {"G_min_disp_coef",       &AD_Global_Var::G_min_disp_coef,       0.0,      3.5},
    {"G_max_disp_coef",       &AD_Global_Var::G_max_disp_coef,       100.0,    4.5},
    {"G_fact1",               &AD_Global_Var::G_fact1,               1.0,      5.5},
    {"G_fact2",               &AD_Global_Var::G_fact2,               1.0,      6.5},
    {"G_beta",                &AD_Global_Var::G_beta,                0.65,     7.5},
    {"G_kin_visc",            &AD_Global_Var::G_kin_visc,            1.0,      8.5},
    {"G_porosity",            &AD_Global_Var::G_porosity,            0.35,     9.5},
    {"G_rel_dens",            &AD_Global_Var::G_rel_dens,            2.65,     10.5},
    {"G_thetac",              &AD_Global_Var::G_thetac,              0.056,    11.5},
    {"G_Ice_latitude",        &AD_Global_Var::G_Ice_latitude,        51.0,     12.5},
    {"G_Ice_dens_water",      &AD_Global_Var::G_Ice_dens_water,      1000.0,   13.5},
    {"G_Ice_spec_heat_water", &AD_Global_Var::G_Ice_spec_heat_water, 4200.0,   14.5},
    {"G_Ice_latent_heat_ice", &AD_Global_Var::G_Ice_latent_heat_ice, 330000.0, 15.5},
    {"G_Ice_heat_flux",       &AD_Global_Var::G_Ice_heat_flux,       12.5,     16.5},
    {"G_Ice_dens_ice",        &AD_Global_Var::G_Ice_dens_ice,        917.0,    17.5},
    {"G_Ice_air_temp",        &AD_Global_Var::G_Ice_air_temp,        10.0,     18.5},
    {"G_Ice_cloudness",       &AD_Global_Var::G_Ice_cloudness,       0.0,      19.5},
    {"G_Ice_wind_speed",      &AD_Global_Var::G_Ice_wind_speed,      0.0,      20.5},
    {"G_Ice_visibility",      &AD_Global_Var::G_Ice_visibility,      25.0,     21.5},
    {"G_Ice_precipitation",   &AD_Global_Var::G_Ice_precipitation,   0.0,      22.5},
    {"G_Ice_thickness",       &AD_Global_Var::G_Ice_thickness,       0.0,      23.5},
    {"G_Ice_width",           &AD_Global_Var::G_Ice_width,           0.0,      24.5},
};

// clang-format on

// Calls `visit(name, array)` for each array of two-layer output flags, in declared order.
template <class Vars, class Visit>
void eachFlagArray(Vars& vars, const Visit& visit) {
    visit("Convective_trans", vars.Convective_trans);
    visit("Decay_branch", vars.Decay_branch);
    visit("Dispersive_trans", vars.Dispersive_trans);
    visit("Entrain_branch", vars.Entrain_branch);
    visit("Mass", vars.Mass);
    visit("Mass_balance", vars.Mass_balance);
    visit("Mass_branch", vars.Mass_branch);
    visit("Transport_total", vars.Transport_total);
}

// Calls `visit(name, pair)` for each pair of two-layer dispersion values, top before bottom.
template <class Vars, class Visit>
void eachLayerPair(Vars& vars, const Visit& visit) {
    visit("K32_disp_factor", vars.K32_disp_factor);
    visit("K32_exponent", vars.K32_exponent);
    visit("K32_min_disp_coef", vars.K32_min_disp_coef);
    visit("K32_max_disp_coef", vars.K32_max_disp_coef);
}

} // namespace kota::test
