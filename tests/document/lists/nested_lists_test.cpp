#include "tests/support/kvs_text.h"
#include "tests/support/owned.h"

#include <gmock/gmock.h>

using namespace kota::test;
using testing::ElementsAre;

namespace {

AD_Cohesiv_ST_Init_Cond& addLayer(CLayerList& list, int component, double width) {
    AD_Cohesiv_ST_Init_Cond& record = addGlobal(list, component);
    AD_ST_Init_Cond_data& line = addTo(record.adderList);
    line.width = width;
    line.layerHeight = 0.5;
    return record;
}

std::vector<int> tableSizes(const CLayerList& list) {
    std::vector<int> sizes;
    for (const AD_Cohesiv_ST_Init_Cond* record : recordsOf(list))
        sizes.push_back(record->adderList.GetCount());
    return sizes;
}

TEST(LayerList, SavesEachRecordWithItsTableBehindIt) {
    Owned<CLayerList> list;
    addLayer(list, 1, 10.5);
    addGlobal(list, 2);

    EXPECT_EQ(savedText(list), R"(
  section LayerList {
    DATA = 1, 0.0, 1029.56, 0.0, false, 0, true, "", 0.0
    section AdderList {
      DATA = 10.5, 0.5
    }
    DATA = 2, 0.0, 1029.56, 0.0, false, 0, true, "", 0.0
    section AdderList {
    }
  }
)");
}

TEST(LayerList, LeavesARecordOfComponentMinusOneOutWithItsTable) {
    Owned<CLayerList> list;
    addLayer(list, 1, 10.5);
    addLayer(list, -1, 20.5);
    addLayer(list, 3, 30.5);

    const std::string text = savedText(list);

    EXPECT_EQ(text, R"(
  section LayerList {
    DATA = 1, 0.0, 1029.56, 0.0, false, 0, true, "", 0.0
    section AdderList {
      DATA = 10.5, 0.5
    }
    DATA = 3, 0.0, 1029.56, 0.0, false, 0, true, "", 0.0
    section AdderList {
      DATA = 30.5, 0.5
    }
  }
)");
    EXPECT_EQ(list.GetCount(), 3);
    Owned<CLayerList> loaded;
    loadText(loaded, text);
    EXPECT_EQ(loaded.GetCount(), 2);
    EXPECT_EQ(recordOf(recordOf(loaded, 2).adderList).width, 30.5);
}

TEST(LayerList, LoadsAnEmptyTableForARecordWhoseSectionIsMissing) {
    Owned<CLayerList> list;

    loadText(list, R"(
section LayerList {
  DATA = 1, 0.5, 1000.0, 0.1, false, 1, true, "", 0.0
  section AdderList {
    DATA = 10.0, 0.5
  }
  DATA = 2, 0.5, 1000.0, 0.1, false, 1, true, "", 0.0
  section AdderList {
    DATA = 20.0, 0.5
    DATA = 21.0, 0.5
  }
  DATA = 3, 0.5, 1000.0, 0.1, false, 1, true, "", 0.0
})");

    EXPECT_THAT(tableSizes(list), ElementsAre(1, 2, 0));
    EXPECT_EQ(recordOf(list, 3).componentNum, 3);
}

TEST(LayerList, PairsRecordsAndTablesByTheirNumberAlone) {
    Owned<CLayerList> list;

    loadText(list, R"(
section LayerList {
  section AdderList {
    DATA = 10.0, 0.5
  }
  DATA = 1, 0.5, 1000.0, 0.1, false, 1, true, "", 0.0
  DATA = 2, 0.5, 1000.0, 0.1, false, 1, true, "", 0.0
  section AdderList {
  }
  section AdderList {
    DATA = 30.0, 0.5
  }
})");

    EXPECT_THAT(tableSizes(list), ElementsAre(1, 0));
    EXPECT_EQ(recordOf(recordOf(list, 1).adderList).width, 10.0);
}

TEST(LayerList, PairsRecordsAndTablesAnewInASecondLoad) {
    const std::string text = R"(
section LayerList {
  DATA = 1, 0.5, 1000.0, 0.1, false, 1, true, "", 0.0
  section AdderList {
    DATA = 10.0, 0.5
  }
})";
    Owned<CLayerList> list;

    loadText(list, text);
    loadText(list, text);

    EXPECT_THAT(tableSizes(list), ElementsAre(1, 1));
}

TEST(LayerList, LoadsATableLineWhoseValuesAreNotGiven) {
    Owned<CLayerList> list;

    loadText(list, R"(
section LayerList {
  DATA = 1, 0.5, 1000.0, 0.1, false, 1, true, "", 0.0
  section AdderList {
    DATA = 10000000000.0, 1e10
  }
})");

    EXPECT_EQ(recordOf(recordOf(list).adderList).width, 1e10);
    EXPECT_EQ(recordOf(recordOf(list).adderList).layerHeight, 1e10);
}

TEST(CohesiveList, LeavesAnEmptySectionForARecordOfComponentMinusOne) {
    Owned<CGlobalList> list;
    addGlobal(list, -1);
    addGlobal(list, 2);
    addGlobal(list, -1);

    EXPECT_EQ(savedText(list), R"(
  section Cohesive_ST {
    section Cohesive_ST_Record {
    }
    section Cohesive_ST_Record {
      PRIVATE = 2
      SETTING = 10.0, 4.5, 0.0, 0.005, 0.000392
      DEPOSITION = 0.8, 0.05, 0
      EROSION = true, 0.07, 0.3, 0.3, 0.2, 0.2, 0.2, 3.0, 3.0, 3.0, 0
      CONSOLIDATION = 2.85, 0.15, 5.0
      LOCATION = true, "", 0.0
    }
    section Cohesive_ST_Record {
    }
  }
)");
    EXPECT_EQ(list.GetCount(), 3);
}

TEST(CohesiveList, LoadsARecordOfZerosFromAnEmptySection) {
    Owned<CGlobalList> list;

    loadText(list, R"(
section Cohesive_ST {
  section Cohesive_ST_Record {
  }
  section Other {
  }
  section Cohesive_ST_Record {
    PRIVATE = 2
  }
})");

    ASSERT_EQ(list.GetCount(), 2);
    EXPECT_EQ(recordOf(list, 1).componentNum, 0);
    EXPECT_EQ(recordOf(list, 1).cOffset, 0.0);
    EXPECT_EQ(recordOf(list, 1).isGlobal, 0);
    EXPECT_EQ(recordOf(list, 2).componentNum, 2);
}

TEST(CohesiveList, LooksForItsRecordsInItsOwnSectionOnly) {
    Owned<CGlobalList> list;

    loadText(list, "section Cohesive_ST_Record {\n PRIVATE = 2\n}");

    EXPECT_TRUE(list.IsEmpty());
}

} // namespace
