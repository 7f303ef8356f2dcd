#pragma once

#include "document/export.h"
#include "platform/framework/object.h"

// The values of a document of which there is one each. A member bears the name of its keyword on file; the
// defaults stand with the keywords, in the table that the constructor, Save and Load all walk.
class KOTA0_AD_API AD_Global_Var : public CObject {
public:
    AD_Global_Var();
    ~AD_Global_Var() override;

    // Adds the section "Global_Variables" to the open target of a file that is being built.
    void Save(void* file);
    // Reads the section from a target. Where it is missing, or one of the parts that older files lack, the
    // members stay as they are.
    void Load(void* target);

    // Carried along from file to file.
    int LastSelected;
    int LastLevel1;
    int G_Coli; // not 0: true, as G_Phos and G_K32Comp
    int G_Phos;
    int WQInter;
    int G_K32Comp;

    // Dispersion everywhere, where no local line holds.
    double G_disp_factor;
    double G_exponent;
    double G_min_disp_coef; // m^2/s
    double G_max_disp_coef; // m^2/s

    // The same for two layers: top, bottom.
    double K32_disp_factor[2];
    double K32_exponent[2];
    double K32_min_disp_coef[2]; // m^2/s
    double K32_max_disp_coef[2]; // m^2/s

    // The non-cohesive model.
    int model_type; // 1 Engelund - Fredsoe, 2 Van-Rijn
    double G_fact1;
    double G_fact2;
    double G_beta;
    double G_kin_visc; // 10^-6 m^2/s
    double G_porosity;
    double G_rel_dens;
    double G_thetac;

    // The ice model; carried along from file to file, and shown nowhere.
    double G_Ice_latitude;
    double G_Ice_dens_water;
    double G_Ice_spec_heat_water;
    double G_Ice_latent_heat_ice;
    double G_Ice_heat_flux;
    double G_Ice_dens_ice;
    int G_Ice_const_cross_A;
    int G_Ice_const_activate;
    double G_Ice_air_temp;
    double G_Ice_cloudness;
    int G_Ice_cloud_dens;
    double G_Ice_wind_speed;
    double G_Ice_visibility;
    double G_Ice_precipitation;
    double G_Ice_thickness;
    double G_Ice_width;
    int G_Ice_quality;

    // Additional output, not 0: wanted. T total, TA total accumulated, G grid, GA grid accumulated.
    int G_Add_MassT;
    int G_Add_MassTA;
    int G_Add_MassG;
    int G_Add_MassGA;
    int G_Add_MassBT; // mass balance
    int G_Add_MassBTA;
    int G_Add_MassBG;
    int G_Add_MassBGA;
    int G_Add_OrderT; // 1. order decay
    int G_Add_OrderTA;
    int G_Add_OrderG;
    int G_Add_OrderGA;
    int G_Add_MBranchT; // mass in branches
    int G_Add_MBranchTA;
    int G_Add_TransG; // transport, total
    int G_Add_TransGA;
    int G_Add_DispersG; // dispersive transport
    int G_Add_DispersGA;
    int G_Add_ConvG; // convective transport
    int G_Add_ConvGA;

    // Additional output for two layers, not 0: wanted; surface and bottom by turns. Arrays of 8: total, total
    // accumulated, grid, grid accumulated. Mass_branch: total, total accumulated. The others of 4: grid, grid
    // accumulated.
    int Convective_trans[4];
    int Decay_branch[8];
    int Dispersive_trans[4];
    int Entrain_branch[8];
    int Mass[8];
    int Mass_balance[8];
    int Mass_branch[4];
    int Transport_total[4];
};
