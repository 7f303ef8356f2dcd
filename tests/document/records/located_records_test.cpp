#include "document/records/boundary.h"
#include "document/records/decay.h"
#include "document/records/dispersion.h"
#include "document/records/ice_data.h"
#include "document/records/init_cond.h"
#include "tests/support/kvs_text.h"
#include "tests/support/owned.h"

#include <gtest/gtest.h>

using namespace kota::test;

namespace {

TEST(ComponentRecord, SavesAndLoadsItsParametersByTheirPlace) {
    const std::string text = R"(
  section CompList {
    DATA = 3, "SAND", 5, 2
  }
)";
    Owned<CCompList> list;

    loadText(list, text);

    const AD_Component& record = recordOf(list);
    EXPECT_EQ(record.number, 3);
    EXPECT_EQ(record.name, "SAND");
    EXPECT_EQ(record.units, 5);
    EXPECT_EQ(record.kind, 2);
    EXPECT_EQ(savedText(list), text);
}

TEST(DecayRecord, SavesAndLoadsItsParametersByTheirPlace) {
    const std::string text = R"(
  section DecayList {
    DATA = 2, 0.5, false, "MISSOURI", 1200.5
  }
)";
    Owned<CDecayList> list;

    loadText(list, text);

    const AD_Decay& record = recordOf(list);
    EXPECT_EQ(record.componentNum, 2);
    EXPECT_EQ(record.decayConst, 0.5);
    EXPECT_EQ(record.isGlobal, 0);
    EXPECT_EQ(record.riverName, "MISSOURI");
    EXPECT_EQ(record.chainage, 1200.5);
    EXPECT_EQ(savedText(list), text);
}

TEST(InitRecord, SavesAndLoadsItsParametersByTheirPlace) {
    const std::string text = R"(
  section InitList {
    DATA = 2, 0.25, false, "MISSOURI", 1200.5
  }
)";
    Owned<CInitList> list;

    loadText(list, text);

    const AD_Init_cond& record = recordOf(list);
    EXPECT_EQ(record.componentNum, 2);
    EXPECT_EQ(record.concentration, 0.25);
    EXPECT_EQ(record.isGlobal, 0);
    EXPECT_EQ(record.riverName, "MISSOURI");
    EXPECT_EQ(record.chainage, 1200.5);
    EXPECT_EQ(savedText(list), text);
}

TEST(StratifiedInitRecord, SavesAndLoadsItsParametersByTheirPlace) {
    const std::string text = R"(
  section InitStratified {
    DATA = 7, 1.5, 2.5, 3.5, 4.5, 5.5, 6.5, false, "MISSOURI", 1200.5
  }
)";
    Owned<CInitStraList> list;

    loadText(list, text);

    const AD_Init_cond_stra& record = recordOf(list);
    EXPECT_EQ(record.componentNum, 7);
    EXPECT_EQ(record.concS, 1.5);
    EXPECT_EQ(record.conc2, 2.5);
    EXPECT_EQ(record.conc3, 3.5);
    EXPECT_EQ(record.concB, 4.5);
    EXPECT_EQ(record.k2, 5.5);
    EXPECT_EQ(record.k3, 6.5);
    EXPECT_EQ(record.isGlobal, 0);
    EXPECT_EQ(record.riverName, "MISSOURI");
    EXPECT_EQ(record.chainage, 1200.5);
    EXPECT_EQ(savedText(list), text);
}

TEST(DispersionRecord, SavesAndLoadsItsParametersByTheirPlace) {
    const std::string text = R"(
  section DispersList {
    DATA = "MISSOURI", 1200.5, 1.5, 2.5, 3.5, 4.5
  }
)";
    Owned<CDispersList> list;

    loadText(list, text);

    const AD_Dispersion& record = recordOf(list);
    EXPECT_EQ(record.riverName, "MISSOURI");
    EXPECT_EQ(record.chainage, 1200.5);
    EXPECT_EQ(record.dispFactor, 1.5);
    EXPECT_EQ(record.exponent, 2.5);
    EXPECT_EQ(record.minCoef, 3.5);
    EXPECT_EQ(record.maxCoef, 4.5);
    EXPECT_EQ(record.isGlobal, 0);
    EXPECT_EQ(savedText(list), text);
}

TEST(TwoLayerDispersionRecord, KeepsItsEightValuesApartThoughTheFileGroupsThemByLayer) {
    const std::string text = R"(
  section K32DispersList {
    DATA = "MISSOURI", 1200.5, 1.5, 2.5, 3.5, 4.5, 5.5, 6.5, 7.5, 8.5
  }
)";
    Owned<CK32DispersList> list;

    loadText(list, text);

    const AD_Dispersion_K32& record = recordOf(list);
    EXPECT_EQ(record.riverName, "MISSOURI");
    EXPECT_EQ(record.chainage, 1200.5);
    EXPECT_EQ(record.dispFactorTop, 1.5);
    EXPECT_EQ(record.exponentTop, 2.5);
    EXPECT_EQ(record.minCoefTop, 3.5);
    EXPECT_EQ(record.maxCoefTop, 4.5);
    EXPECT_EQ(record.dispFactorBottom, 5.5);
    EXPECT_EQ(record.exponentBottom, 6.5);
    EXPECT_EQ(record.minCoefBottom, 7.5);
    EXPECT_EQ(record.maxCoefBottom, 8.5);
    EXPECT_EQ(savedText(list), text);
}

TEST(BoundaryRecord, SavesAndLoadsItsParametersByTheirPlace) {
    const std::string text = R"(
  section BoundList {
    DATA = "MISSOURI", 1200.5, 2, 0.75
  }
)";
    Owned<CBoundList> list;

    loadText(list, text);

    const AD_Bondary& record = recordOf(list);
    EXPECT_EQ(record.riverName, "MISSOURI");
    EXPECT_EQ(record.chainage, 1200.5);
    EXPECT_EQ(record.boundaryType, 2);
    EXPECT_EQ(record.kMix, 0.75);
    EXPECT_EQ(savedText(list), text);
}

TEST(TwoLayerBoundaryRecord, SavesAndLoadsItsParametersByTheirPlace) {
    const std::string text = R"(
  section K32BoundList {
    DATA = "MISSOURI", 1200.5, 1, 0.75, 2, 0.25
  }
)";
    Owned<CK32BoundList> list;

    loadText(list, text);

    const AD_Boundary_K32& record = recordOf(list);
    EXPECT_EQ(record.riverName, "MISSOURI");
    EXPECT_EQ(record.chainage, 1200.5);
    EXPECT_EQ(record.boundaryTypeTop, 1);
    EXPECT_EQ(record.kMixTop, 0.75);
    EXPECT_EQ(record.boundaryTypeBottom, 2);
    EXPECT_EQ(record.kMixBottom, 0.25);
    EXPECT_EQ(savedText(list), text);
}

TEST(IceRecord, SavesAndLoadsItsParametersByTheirPlace) {
    const std::string text = R"(
  section IceDataList {
    DATA = "MISSOURI", 1200.5, 0.35, 40.5, 2
  }
)";
    Owned<CIceDataList> list;

    loadText(list, text);

    const AD_Ice_Data& record = recordOf(list);
    EXPECT_EQ(record.riverName, "MISSOURI");
    EXPECT_EQ(record.chainage, 1200.5);
    EXPECT_EQ(record.iceThickness, 0.35);
    EXPECT_EQ(record.iceWidth, 40.5);
    EXPECT_EQ(record.quality, 2);
    EXPECT_EQ(savedText(list), text);
}

// These have no triple on file, so their flag counts for nothing there.
TEST(IceRecord, SavesItsPlaceThoughItIsGlobalInMemory) {
    Owned<CIceDataList> ice;
    addGlobal(ice, 0).riverName = "MISSOURI";
    Owned<CDispersList> dispersion;
    addGlobal(dispersion, 0).riverName = "PLATTE";

    EXPECT_EQ(savedText(ice), R"(
  section IceDataList {
    DATA = "MISSOURI", 0.0, 0.0, 0.0, 0
  }
)");
    EXPECT_NE(savedText(dispersion).find(R"(DATA = "PLATTE", 0.0, )"), std::string::npos);
}

TEST(InitRecord, ReadsAMissingParameterAsZeroOrEmpty) {
    Owned<CInitList> list;

    loadText(list, "section InitList {\n DATA = 2\n DATA =\n}");

    const AD_Init_cond& record = recordOf(list, 1);
    EXPECT_EQ(record.componentNum, 2);
    EXPECT_EQ(record.concentration, 0.0);
    EXPECT_EQ(record.isGlobal, 0);
    EXPECT_TRUE(record.riverName.IsEmpty());
    EXPECT_EQ(record.chainage, 0.0);
    EXPECT_EQ(recordOf(list, 2).componentNum, 0);
}

} // namespace
