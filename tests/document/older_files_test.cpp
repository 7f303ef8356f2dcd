#include "tests/support/kvs_text.h"
#include "tests/support/owned.h"

#include <gmock/gmock.h>

using namespace kota::test;
using testing::Each;
using testing::ElementsAre;
using testing::HasSubstr;

namespace {

// Loads global values from a target that holds the text and gives what a save then writes.
std::string savedAfterLoading(AD_Global_Var& vars, const std::string& text) {
    const ParsedTarget target(text);
    vars.Load(target.handle());
    return savedTextOf([&](void* file) { vars.Save(file); });
}

TEST(OlderFile, WithoutTheTwoLayerFlagLoadsAndIsSavedWithIt) {
    AD_Global_Var vars;

    const std::string saved = savedAfterLoading(vars, R"(
section Global_Variables {
  G_Add_TransGA = true
})");

    EXPECT_EQ(vars.G_Add_TransGA, 1);
    EXPECT_EQ(vars.G_K32Comp, 0);
    EXPECT_THAT(saved, HasSubstr("\n    G_K32Comp = false\n"));
}

TEST(OlderFile, WithoutTheTwoLayerFlagLeavesItAsItWas) {
    AD_Global_Var vars;
    vars.G_K32Comp = 1;

    savedAfterLoading(vars, "section Global_Variables {\n}");

    EXPECT_EQ(vars.G_K32Comp, 1);
}

TEST(OlderFile, WithoutTwoLayerOutputLoadsAndIsSavedWithIt) {
    AD_Global_Var vars;

    const std::string saved = savedAfterLoading(vars, R"(
section Global_Variables {
  section KOTA32_Dispersion {
    G_exponent = 1.5, 2.5
  }
})");

    EXPECT_THAT(vars.Mass, Each(0));
    EXPECT_THAT(vars.K32_exponent, ElementsAre(1.5, 2.5));
    EXPECT_THAT(saved, HasSubstr("section KOTA32_Additional {\n      Mass = 0, 0, 0, 0, 0, 0, 0, 0\n"));
}

TEST(OlderFile, WithoutTwoLayerOutputLeavesTheFlagsAsTheyWere) {
    AD_Global_Var vars;
    vars.Mass_branch[2] = 1;

    savedAfterLoading(vars, "section Global_Variables {\n}");

    EXPECT_THAT(vars.Mass_branch, ElementsAre(0, 0, 1, 0));
}

TEST(OlderFile, WithoutTwoLayerDispersionKeepsItsDefaultAndNotTheSingleLayerValue) {
    AD_Global_Var vars;

    const std::string saved = savedAfterLoading(vars, R"(
section Global_Variables {
  G_max_disp_coef = 2000.0
  section KOTA32_Additional {
    Mass_branch = 1, 0, 0, 1
  }
})");

    EXPECT_EQ(vars.G_max_disp_coef, 2000.0);
    EXPECT_THAT(vars.K32_max_disp_coef, ElementsAre(100.0, 100.0));
    EXPECT_THAT(vars.Mass_branch, ElementsAre(1, 0, 0, 1));
    EXPECT_THAT(saved, HasSubstr("G_max_disp_coef = 2000.0\n"));
    EXPECT_THAT(saved, HasSubstr("G_max_disp_coef = 100.0, 100.0\n"));
}

TEST(OlderFile, WithoutTwoLayerDispersionLeavesThePairsAsTheyWere) {
    AD_Global_Var vars;
    vars.K32_exponent[1] = 0.5;

    savedAfterLoading(vars, "section Global_Variables {\n}");

    EXPECT_THAT(vars.K32_exponent, ElementsAre(0.0, 0.5));
}

TEST(OlderFile, WithoutAnyOtherKeywordReadsZero) {
    AD_Global_Var vars;

    savedAfterLoading(vars, "section Global_Variables {\n  G_beta = 0.5\n}");

    EXPECT_EQ(vars.G_beta, 0.5);
    EXPECT_EQ(vars.G_thetac, 0.0);
    EXPECT_EQ(vars.model_type, 0);
    EXPECT_EQ(vars.LastLevel1, 0);
}

TEST(OlderFile, MayHoldItsKeywordsInAnotherOrder) {
    AD_Global_Var vars;

    savedAfterLoading(vars, R"(
section Global_Variables {
  section KOTA32_Dispersion {
    G_exponent = 1.5, 2.5
    G_disp_factor = 3.5, 4.5
  }
  G_thetac = 0.5
  LastSelected = 3
  G_disp_factor = 6.5
})");

    EXPECT_THAT(vars.K32_disp_factor, ElementsAre(3.5, 4.5));
    EXPECT_THAT(vars.K32_exponent, ElementsAre(1.5, 2.5));
    EXPECT_EQ(vars.G_disp_factor, 6.5);
    EXPECT_EQ(vars.G_thetac, 0.5);
    EXPECT_EQ(vars.LastSelected, 3);
}

TEST(OlderFile, InAllThreeWaysLoadsAndIsSavedWhole) {
    const TempFolder folder;
    OwnedDocument document;
    const std::string older = folder.write("older.ad31", R"(target KOTA0_AD {
  section Global_Variables {
    G_fact1 = 1.5
  }
  section DecayList {
    DATA = 1, 0.5, true, "", 0.0
  }
}
)");

    document.ReadData(older.c_str());
    document.WriteData(folder.file("newer.AD31").c_str());

    EXPECT_EQ(document.globalVar.G_fact1, 1.5);
    EXPECT_EQ(document.decayList.GetCount(), 1);
    const std::string newer = folder.read("newer.AD31");
    EXPECT_THAT(newer, HasSubstr("G_K32Comp = false"));
    EXPECT_THAT(newer, HasSubstr("section KOTA32_Additional {"));
    EXPECT_THAT(newer, HasSubstr("section KOTA32_Dispersion {"));
    EXPECT_THAT(newer, HasSubstr("section K32DispersList {\n  }\n"));
}

} // namespace
