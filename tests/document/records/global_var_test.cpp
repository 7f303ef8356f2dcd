#include "document/records/global_var.h"

#include "tests/document/records/global_var_rows.h"
#include "tests/support/kvs_text.h"

#include <gmock/gmock.h>

#include <numeric>

using namespace kota::test;
using testing::Each;
using testing::ElementsAre;

namespace {

std::string saved(AD_Global_Var& vars) {
    return savedTextOf([&](void* file) { vars.Save(file); });
}

void load(AD_Global_Var& vars, const std::string& text) {
    vars.Load(ParsedTarget(text).handle());
}

const std::string defaultText = R"(
  section Global_Variables {
    LastSelected = 0
    G_Coli = false
    G_Phos = false
    LastLevel1 = 1
    WQInter = 0
    G_disp_factor = 0.0
    G_exponent = 0.0
    G_min_disp_coef = 0.0
    G_max_disp_coef = 100.0
    G_fact1 = 1.0
    G_fact2 = 1.0
    G_beta = 0.65
    G_kin_visc = 1.0
    G_porosity = 0.35
    G_rel_dens = 2.65
    G_thetac = 0.056
    model_type = 1
    G_Ice_latitude = 51.0
    G_Ice_dens_water = 1000.0
    G_Ice_spec_heat_water = 4200.0
    G_Ice_latent_heat_ice = 330000.0
    G_Ice_heat_flux = 12.5
    G_Ice_dens_ice = 917.0
    G_Ice_const_cross_A = 0
    G_Ice_const_activate = 0
    G_Ice_air_temp = 10.0
    G_Ice_cloudness = 0.0
    G_Ice_cloud_dens = 0
    G_Ice_wind_speed = 0.0
    G_Ice_visibility = 25.0
    G_Ice_precipitation = 0.0
    G_Ice_thickness = 0.0
    G_Ice_width = 0.0
    G_Ice_quality = 0
    G_Add_ConvG = false
    G_Add_ConvGA = false
    G_Add_DispersG = false
    G_Add_DispersGA = false
    G_Add_MassBG = false
    G_Add_MassBGA = false
    G_Add_MassBT = false
    G_Add_MassBTA = false
    G_Add_MassG = false
    G_Add_MassGA = false
    G_Add_MassT = false
    G_Add_MassTA = false
    G_Add_MBranchT = false
    G_Add_MBranchTA = false
    G_Add_OrderG = false
    G_Add_OrderGA = false
    G_Add_OrderT = false
    G_Add_OrderTA = false
    G_Add_TransG = false
    G_Add_TransGA = false
    G_K32Comp = false
    section KOTA32_Additional {
      Mass = 0, 0, 0, 0, 0, 0, 0, 0
      Mass_balance = 0, 0, 0, 0, 0, 0, 0, 0
      Mass_branch = 0, 0, 0, 0
      Decay_branch = 0, 0, 0, 0, 0, 0, 0, 0
      Entrain_branch = 0, 0, 0, 0, 0, 0, 0, 0
      Transport_total = 0, 0, 0, 0
      Dispersive_trans = 0, 0, 0, 0
      Convective_trans = 0, 0, 0, 0
    }
    section KOTA32_Dispersion {
      G_disp_factor = 0.0, 0.0
      G_exponent = 0.0, 0.0
      G_min_disp_coef = 0.0, 0.0
      G_max_disp_coef = 100.0, 100.0
    }
  }
)";

// The default text with the value of one keyword of "Global_Variables" replaced.
std::string textWith(const std::string& name, const std::string& value) {
    std::string text = defaultText;
    const std::size_t start = text.find("\n    " + name + " = ");
    const std::size_t end = text.find('\n', start + 1);
    return text.replace(start, end - start, "\n    " + name + " = " + value);
}

TEST(GlobalVariables, StartFromTheirDefaults) {
    const AD_Global_Var vars;

    for (const GlobalInt& row : globalInts)
        EXPECT_EQ(vars.*row.member, row.byDefault) << row.name;
    for (const GlobalInt& row : globalFlags)
        EXPECT_EQ(vars.*row.member, 0) << row.name;
    for (const GlobalDouble& row : globalDoubles)
        EXPECT_EQ(vars.*row.member, row.byDefault) << row.name;
    eachFlagArray(vars, [](const char* name, const auto& flags) { EXPECT_THAT(flags, Each(0)) << name; });
    EXPECT_THAT(vars.K32_disp_factor, ElementsAre(0.0, 0.0));
    EXPECT_THAT(vars.K32_exponent, ElementsAre(0.0, 0.0));
    EXPECT_THAT(vars.K32_min_disp_coef, ElementsAre(0.0, 0.0));
    EXPECT_THAT(vars.K32_max_disp_coef, ElementsAre(100.0, 100.0));
}

TEST(GlobalVariables, SaveTheirKeywordsInFileOrder) {
    AD_Global_Var vars;

    EXPECT_EQ(saved(vars), defaultText);
}

// One keyword at a time, so that no two of them can be mistaken for each other.
TEST(GlobalVariables, SaveAndLoadEachIntUnderItsOwnName) {
    for (const GlobalInt& row : globalInts) {
        const std::string text = textWith(row.name, std::to_string(row.other));
        AD_Global_Var vars;

        load(vars, text);

        EXPECT_EQ(vars.*row.member, row.other) << row.name;
        EXPECT_EQ(saved(vars), text) << row.name;
    }
}

TEST(GlobalVariables, SaveAndLoadEachFlagUnderItsOwnName) {
    for (const GlobalInt& row : globalFlags) {
        const std::string text = textWith(row.name, "true");
        AD_Global_Var vars;

        load(vars, text);

        EXPECT_EQ(vars.*row.member, 1) << row.name;
        EXPECT_EQ(saved(vars), text) << row.name;
    }
}

TEST(GlobalVariables, SaveAndLoadEachDoubleUnderItsOwnName) {
    for (const GlobalDouble& row : globalDoubles) {
        const std::string text = textWith(row.name, std::to_string(static_cast<int>(row.other)) + ".5");
        AD_Global_Var vars;

        load(vars, text);

        EXPECT_EQ(vars.*row.member, row.other) << row.name;
        EXPECT_EQ(saved(vars), text) << row.name;
    }
}

TEST(GlobalVariables, SaveAnyValueButZeroOfAFlagAsTrue) {
    for (const GlobalInt& row : globalFlags) {
        AD_Global_Var vars;
        vars.*row.member = -3;

        EXPECT_EQ(saved(vars), textWith(row.name, "true"));
    }
}

TEST(GlobalVariables, SaveTheTwoLayerValuesByTheirPlace) {
    AD_Global_Var vars;
    int next = 0;
    eachFlagArray(vars, [&](const char*, auto& flags) {
        std::iota(std::begin(flags), std::end(flags), next);
        next += 10;
    });
    double nextPair = 0.5;
    eachLayerPair(vars, [&](const char*, double(&pair)[2]) {
        pair[0] = nextPair;
        pair[1] = nextPair + 10.0;
        nextPair += 1.0;
    });

    const std::string text = saved(vars);

    EXPECT_EQ(text.substr(text.find("    section KOTA32_Additional")),
              R"(    section KOTA32_Additional {
      Mass = 40, 41, 42, 43, 44, 45, 46, 47
      Mass_balance = 50, 51, 52, 53, 54, 55, 56, 57
      Mass_branch = 60, 61, 62, 63
      Decay_branch = 10, 11, 12, 13, 14, 15, 16, 17
      Entrain_branch = 30, 31, 32, 33, 34, 35, 36, 37
      Transport_total = 70, 71, 72, 73
      Dispersive_trans = 20, 21, 22, 23
      Convective_trans = 0, 1, 2, 3
    }
    section KOTA32_Dispersion {
      G_disp_factor = 0.5, 10.5
      G_exponent = 1.5, 11.5
      G_min_disp_coef = 2.5, 12.5
      G_max_disp_coef = 3.5, 13.5
    }
  }
)");

    AD_Global_Var loaded;
    load(loaded, text);
    EXPECT_THAT(loaded.Mass, ElementsAre(40, 41, 42, 43, 44, 45, 46, 47));
    EXPECT_THAT(loaded.Convective_trans, ElementsAre(0, 1, 2, 3));
    EXPECT_THAT(loaded.K32_min_disp_coef, ElementsAre(2.5, 12.5));
    EXPECT_EQ(saved(loaded), text);
}

TEST(GlobalVariables, KeepASingleLayerValueApartFromThePairOfTheSameName) {
    AD_Global_Var vars;
    vars.G_max_disp_coef = 7.5;

    EXPECT_EQ(saved(vars), textWith("G_max_disp_coef", "7.5"));
    AD_Global_Var loaded;
    load(loaded, textWith("G_max_disp_coef", "7.5"));
    EXPECT_EQ(loaded.G_max_disp_coef, 7.5);
    EXPECT_THAT(loaded.K32_max_disp_coef, ElementsAre(100.0, 100.0));
}

TEST(GlobalVariables, ReadASelectionOfSevenAsZero) {
    AD_Global_Var vars;

    load(vars, textWith("LastSelected", "7"));

    EXPECT_EQ(vars.LastSelected, 0);
    EXPECT_EQ(saved(vars), defaultText);
}

TEST(GlobalVariables, KeepAnyOtherSelection) {
    for (const int selection : {3, 6, 8, 77, -7}) {
        AD_Global_Var vars;

        load(vars, textWith("LastSelected", std::to_string(selection)));

        EXPECT_EQ(vars.LastSelected, selection);
        EXPECT_EQ(saved(vars), textWith("LastSelected", std::to_string(selection)));
    }
}

TEST(GlobalVariables, SaveASelectionOfSevenThatStandsInMemory) {
    AD_Global_Var vars;
    vars.LastSelected = 7;

    EXPECT_EQ(saved(vars), textWith("LastSelected", "7"));
}

TEST(GlobalVariables, KeepWhatTheyHoldWhereTheirSectionIsMissing) {
    AD_Global_Var vars;
    vars.LastSelected = 5;
    vars.G_thetac = 0.5;

    load(vars, "section Other {\n}");
    vars.Load(nullptr);

    EXPECT_EQ(vars.LastSelected, 5);
    EXPECT_EQ(vars.G_thetac, 0.5);
}

} // namespace
