#include "document/records/cohesive.h"
#include "document/records/decay.h"
#include "document/records/layer.h"
#include "tests/support/kvs_text.h"
#include "tests/support/owned.h"

#include <gtest/gtest.h>

using namespace kota::test;

namespace {

std::string savedLocation(AD_Comp_RiverPos& record) {
    return savedTextOf([&](void* file) {
        kvsAddSection(file, "S");
        kvsAddKeyword(file, "K");
        record.SaveLocation(file);
        kvsEndSection(file);
    });
}

TEST(RecordLocation, IsReadAndSetByItsOperations) {
    AD_Comp_RiverPos record;
    record.componentNum = 4;

    record.SetRiverName("PLATTE");
    record.SetChainage(12.5);

    EXPECT_EQ(record.GetComponentNum(), 4);
    EXPECT_EQ(record.GetRiverName(), "PLATTE");
    EXPECT_EQ(record.riverName, "PLATTE");
    EXPECT_EQ(record.GetChainage(), 12.5);
    EXPECT_EQ(record.chainage, 12.5);
}

TEST(RecordLocation, OfALocalRecordSavesItsPlace) {
    AD_Comp_RiverPos record;
    record.isGlobal = 0;
    record.riverName = "PLATTE";
    record.chainage = -12.5;

    EXPECT_EQ(savedLocation(record), R"(
  section S {
    K = false, "PLATTE", -12.5
  }
)");
}

TEST(RecordLocation, OfAGlobalRecordSavesNoPlace) {
    AD_Comp_RiverPos record;
    record.isGlobal = 1;
    record.riverName = "PLATTE";
    record.chainage = 1e10;

    EXPECT_EQ(savedLocation(record), R"(
  section S {
    K = true, "", 0.0
  }
)");
}

TEST(RecordLocation, CountsAsGlobalForAnyValueButZero) {
    AD_Comp_RiverPos record;
    record.isGlobal = -2;
    record.riverName = "PLATTE";
    record.chainage = 3.0;

    EXPECT_EQ(savedLocation(record), R"(
  section S {
    K = true, "", 0.0
  }
)");
}

TEST(RecordLocation, OfTheBaseClassIsAllThatItSavesOrLoads) {
    AD_Comp_RiverPos record;
    record.componentNum = 4;
    record.riverName = "PLATTE";
    const ParsedTarget target("section S {\n K = 1, true, \"X\", 2.0\n}");

    record.Load(kvsKeywordByNameNum(target.section("S"), "K", 1));
    const std::string saved = savedTextOf([&](void* file) {
        kvsAddSection(file, "S");
        record.Save(file);
        kvsEndSection(file);
    });

    EXPECT_EQ(record.componentNum, 4);
    EXPECT_EQ(record.riverName, "PLATTE");
    EXPECT_EQ(saved, "\n  section S {\n  }\n");
}

TEST(DecayRecord, AGlobalLineSavesNoRiverName) {
    Owned<CDecayList> list;
    AD_Decay& record = addGlobal(list, 1);
    record.riverName = "MISSOURI";
    record.chainage = 1200.0;

    EXPECT_EQ(savedText(list), R"(
  section DecayList {
    DATA = 1, 0.0, true, "", 0.0
  }
)");
}

TEST(DecayRecord, AGlobalLineForgetsThePlaceThatTheFileHolds) {
    Owned<CDecayList> list;

    loadText(list, R"(
section DecayList {
  DATA = 1, 0.5, true, "MISSOURI", 1200.0
})");

    const AD_Decay& record = recordOf(list);
    EXPECT_EQ(record.isGlobal, 1);
    EXPECT_TRUE(record.riverName.IsEmpty());
    EXPECT_EQ(record.chainage, 0.0);
    EXPECT_EQ(record.decayConst, 0.5);
}

TEST(DecayRecord, AGlobalLineForgetsThePlaceThatItHadInMemory) {
    AD_Decay record;
    record.riverName = "PLATTE";
    record.chainage = 7.0;
    const ParsedTarget target("section S {\n DATA = 1, 0.5, true, \"\", 9.0\n}");

    record.Load(kvsKeywordByNameNum(target.section("S"), "DATA", 1));

    EXPECT_TRUE(record.riverName.IsEmpty());
    EXPECT_EQ(record.chainage, 0.0);
}

TEST(CohesiveRecord, AGlobalOneForgetsThePlaceThatTheFileHolds) {
    Owned<CGlobalList> list;

    loadText(list, R"(
section Cohesive_ST {
  section Cohesive_ST_Record {
    PRIVATE = 1
    LOCATION = true, "MISSOURI", 1200.0
  }
})");

    const AD_Global_Const& record = recordOf(list);
    EXPECT_EQ(record.isGlobal, 1);
    EXPECT_TRUE(record.riverName.IsEmpty());
    EXPECT_EQ(record.chainage, 0.0);
}

TEST(LayerRecord, AGlobalOneForgetsThePlaceThatTheFileHolds) {
    Owned<CLayerList> list;

    loadText(list, R"(
section LayerList {
  DATA = 1, 0.5, 1000.0, 0.1, false, 1, true, "MISSOURI", 1200.0
})");

    const AD_Cohesiv_ST_Init_Cond& record = recordOf(list);
    EXPECT_EQ(record.isGlobal, 1);
    EXPECT_TRUE(record.riverName.IsEmpty());
    EXPECT_EQ(record.chainage, 0.0);
}

} // namespace
