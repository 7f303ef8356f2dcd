#include "document/records/cohesive.h"
#include "document/records/layer.h"
#include "document/records/non_cohesive.h"
#include "document/records/width_height.h"
#include "tests/support/kvs_text.h"
#include "tests/support/owned.h"

#include <gtest/gtest.h>

using namespace kota::test;

namespace {

const std::string fullCohesive = R"(
  section Cohesive_ST {
    section Cohesive_ST_Record {
      PRIVATE = 2
      SETTING = 1.5, 2.5, 3.5, 4.5, 5.5
      DEPOSITION = 6.5, 7.5, 1
      EROSION = false, 11.5, 12.5, 13.5, 21.5, 22.5, 23.5, 31.5, 32.5, 33.5, 1
      CONSOLIDATION = 41.5, 42.5, 43.5
      LOCATION = false, "MISSOURI", 1200.5
    }
  }
)";

void expectFullCohesive(const AD_Global_Const& record) {
    EXPECT_EQ(record.componentNum, 2);
    EXPECT_EQ(record.cOffset, 1.5);
    EXPECT_EQ(record.g, 2.5);
    EXPECT_EQ(record.m, 3.5);
    EXPECT_EQ(record.w0, 4.5);
    EXPECT_EQ(record.swi, 5.5);
    EXPECT_EQ(record.timeCentering, 6.5);
    EXPECT_EQ(record.critShearDep, 7.5);
    EXPECT_EQ(record.depShearMode, 1);
    EXPECT_EQ(record.instantErosion, 0);
    EXPECT_EQ(record.critShearEro1, 11.5);
    EXPECT_EQ(record.critShearEro2, 12.5);
    EXPECT_EQ(record.critShearEro3, 13.5);
    EXPECT_EQ(record.eroCoef1, 21.5);
    EXPECT_EQ(record.eroCoef2, 22.5);
    EXPECT_EQ(record.eroCoef3, 23.5);
    EXPECT_EQ(record.eroExp1, 31.5);
    EXPECT_EQ(record.eroExp2, 32.5);
    EXPECT_EQ(record.eroExp3, 33.5);
    EXPECT_EQ(record.eroShearMode, 1);
    EXPECT_EQ(record.tran12, 41.5);
    EXPECT_EQ(record.tran23, 42.5);
    EXPECT_EQ(record.slidFrCoef, 43.5);
    EXPECT_EQ(record.isGlobal, 0);
    EXPECT_EQ(record.riverName, "MISSOURI");
    EXPECT_EQ(record.chainage, 1200.5);
}

TEST(CohesiveRecord, SavesAndLoadsSixKeywordsWithTheErosionOrderedByQuantity) {
    Owned<CGlobalList> list;

    loadText(list, fullCohesive);

    expectFullCohesive(recordOf(list));
    EXPECT_EQ(savedText(list), fullCohesive);
}

TEST(CohesiveRecord, FindsItsKeywordsInAnyOrder) {
    Owned<CGlobalList> list;

    loadText(list, R"(
section Cohesive_ST {
  section Cohesive_ST_Record {
    LOCATION = false, "MISSOURI", 1200.5
    CONSOLIDATION = 41.5, 42.5, 43.5
    EROSION = false, 11.5, 12.5, 13.5, 21.5, 22.5, 23.5, 31.5, 32.5, 33.5, 1
    SETTING = 1.5, 2.5, 3.5, 4.5, 5.5
    PRIVATE = 2
    DEPOSITION = 6.5, 7.5, 1
  }
})");

    expectFullCohesive(recordOf(list));
}

TEST(CohesiveRecord, SavesItsDefaults) {
    Owned<CGlobalList> list;
    addTo(list).componentNum = 1;

    EXPECT_EQ(savedText(list), R"(
  section Cohesive_ST {
    section Cohesive_ST_Record {
      PRIVATE = 1
      SETTING = 10.0, 4.5, 0.0, 0.005, 0.000392
      DEPOSITION = 0.8, 0.05, 0
      EROSION = true, 0.07, 0.3, 0.3, 0.2, 0.2, 0.2, 3.0, 3.0, 3.0, 0
      CONSOLIDATION = 2.85, 0.15, 5.0
      LOCATION = true, "", 0.0
    }
  }
)");
}

TEST(CohesiveRecord, ReadsZerosForTheKeywordsThatItsSectionLacks) {
    Owned<CGlobalList> list;

    loadText(list, R"(
section Cohesive_ST {
  section Cohesive_ST_Record {
    DEPOSITION = 6.5, 7.5, 1
  }
})");

    const AD_Global_Const& record = recordOf(list);
    EXPECT_EQ(record.timeCentering, 6.5);
    EXPECT_EQ(record.critShearDep, 7.5);
    EXPECT_EQ(record.depShearMode, 1);
    EXPECT_EQ(savedText(list), R"(
  section Cohesive_ST {
    section Cohesive_ST_Record {
      PRIVATE = 0
      SETTING = 0.0, 0.0, 0.0, 0.0, 0.0
      DEPOSITION = 6.5, 7.5, 1
      EROSION = false, 0.0, 0.0, 0.0, 0.0, 0.0, 0.0, 0.0, 0.0, 0.0, 0
      CONSOLIDATION = 0.0, 0.0, 0.0
      LOCATION = false, "", 0.0
    }
  }
)");
}

TEST(CohesiveRecord, SavesAnyValueButZeroOfInstantErosionAsTrue) {
    Owned<CGlobalList> list;
    addGlobal(list, 1).instantErosion = 5;

    EXPECT_NE(savedText(list).find("EROSION = true, "), std::string::npos);
}

TEST(LayerRecord, SavesAndLoadsItsParametersByTheirPlace) {
    const std::string text = R"(
  section LayerList {
    DATA = 2, 0.75, 1100.5, 0.5, true, 3, false, "MISSOURI", 1200.5
    section AdderList {
    }
  }
)";
    Owned<CLayerList> list;

    loadText(list, text);

    const AD_Cohesiv_ST_Init_Cond& record = recordOf(list);
    EXPECT_EQ(record.componentNum, 2);
    EXPECT_EQ(record.height, 0.75);
    EXPECT_EQ(record.density, 1100.5);
    EXPECT_EQ(record.potFac, 0.5);
    EXPECT_EQ(record.useTable, 1);
    EXPECT_EQ(record.layer, 3);
    EXPECT_EQ(record.isGlobal, 0);
    EXPECT_EQ(record.riverName, "MISSOURI");
    EXPECT_EQ(record.chainage, 1200.5);
    EXPECT_EQ(savedText(list), text);
}

TEST(LayerRecord, AloneSavesNoTable) {
    AD_Cohesiv_ST_Init_Cond record;
    record.componentNum = 1;
    addTo(record.adderList).width = 5.0;

    const std::string saved = savedTextOf([&](void* file) {
        kvsAddSection(file, "S");
        record.Save(file);
    });

    EXPECT_EQ(saved, R"(
  section S {
    DATA = 1, 0.0, 1029.56, 0.0, false, 0, true, "", 0.0
  }
)");
}

// A line counts how many of its kind have gone.
class CountedLine : public AD_ST_Init_Cond_data {
public:
    explicit CountedLine(int& gone) : gone_(gone) {}
    ~CountedLine() override { ++gone_; }

private:
    int& gone_;
};

TEST(LayerRecord, DeletesItsTableWhenItGoes) {
    int gone = 0;
    {
        AD_Cohesiv_ST_Init_Cond record;
        record.adderList.AddTail(new CountedLine(gone));
        record.adderList.AddTail(new CountedLine(gone));
    }

    EXPECT_EQ(gone, 2);
}

TEST(TableLine, SavesAndLoadsItsParametersByTheirPlace) {
    const std::string text = R"(
  section AdderList {
    DATA = 10.5, 0.25
  }
)";
    Owned<CAdderList> list;
    const ParsedTarget target(text);

    list.Load(target.section("AdderList"));

    EXPECT_EQ(recordOf(list).width, 10.5);
    EXPECT_EQ(recordOf(list).layerHeight, 0.25);
    EXPECT_EQ(savedText(list), text);
}

TEST(NonCohesiveRecord, SavesAndLoadsItsParametersByTheirPlace) {
    const std::string text = R"(
  section NonCohesList {
    DATA = 3, 0.25, 1.6, false, "MISSOURI", 1200.5
  }
)";
    Owned<CNonCohesList> list;

    loadText(list, text);

    const AD_NonCohesiv_ST_Data& record = recordOf(list);
    EXPECT_EQ(record.componentNum, 3);
    EXPECT_EQ(record.grainSize, 0.25);
    EXPECT_EQ(record.stdDev, 1.6);
    EXPECT_EQ(record.isGlobal, 0);
    EXPECT_EQ(record.riverName, "MISSOURI");
    EXPECT_EQ(record.chainage, 1200.5);
    EXPECT_EQ(savedText(list), text);
}

} // namespace
