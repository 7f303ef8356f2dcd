#include "tests/support/kvs_text.h"
#include "tests/support/owned.h"

#include <gmock/gmock.h>

using namespace kota::test;
using testing::HasSubstr;
using testing::Not;

namespace {

std::string globalVariables(AD_Global_Var& vars) {
    return savedTextOf([&](void* file) { vars.Save(file); });
}

std::string written(CKota0_adDoc& document) {
    const TempFolder folder;
    document.WriteData(folder.file("written").c_str());
    return folder.read("written");
}

void read(CKota0_adDoc& document, const std::string& text) {
    const TempFolder folder;
    document.ReadData(folder.write("text.ad31", text).c_str());
}

// All sections behind the global variables, empty.
const std::string emptyLists = R"(  section InitList {
  }
  section InitStratified {
  }
  section NonCohesList {
  }
  section DecayList {
  }
  section DispersList {
  }
  section IceDataList {
  }
  section Cohesive_ST {
  }
  section CompList {
  }
  section LayerList {
  }
  section K32DispersList {
  }
}
)";

// One entry or two in each section.
const std::string filledLists = R"(  section InitList {
    DATA = 1, 2.5, true, "", 0.0
    DATA = 2, 0.125, false, "MISSOURI", 187328.0
  }
  section InitStratified {
    DATA = 1, 1.5, 2.5, 3.5, 4.5, 0.1, 0.2, true, "", 0.0
  }
  section NonCohesList {
    DATA = 1, 0.25, 1.4, true, "", 0.0
  }
  section DecayList {
    DATA = 1, 0.5, true, "", 0.0
  }
  section DispersList {
    DATA = "MISSOURI", 0.0, 1486.44864, 0.1, 0.2, 2000.0
  }
  section IceDataList {
    DATA = "MISSOURI", 1000.0, 0.35, 40.0, 2
  }
  section Cohesive_ST {
    section Cohesive_ST_Record {
      PRIVATE = 1
      SETTING = 11.0, 4.6, 0.1, 0.006, 0.25
      DEPOSITION = 0.9, 0.06, 1
      EROSION = true, 0.08, 0.31, 0.32, 0.21, 0.22, 0.23, 3.1, 3.2, 3.3, 1
      CONSOLIDATION = 2.9, 0.16, 5.5
      LOCATION = true, "", 0.0
    }
  }
  section CompList {
    DATA = 1, "SILT", 6, 1
    DATA = 2, "CLAY", 5, 2
  }
  section LayerList {
    DATA = 1, 0.5, 1029.56, 0.25, false, 1, true, "", 0.0
    section AdderList {
      DATA = 10.0, 0.1
    }
    DATA = 2, 0.75, 1100.0, 0.5, true, 2, false, "MISSOURI", 187328.0
    section AdderList {
    }
  }
  section K32DispersList {
    DATA = "MISSOURI", 5000.0, 1.5, 2.5, 3.5, 4.5, 5.5, 6.5, 7.5, 8.5
  }
}
)";

std::string fileOf(AD_Global_Var& vars, const std::string& lists) {
    return "target KOTA0_AD {" + globalVariables(vars) + lists;
}

void expectAllListsEmpty(const CKota0_adDoc& document) {
    for (const CObList* list : allLists(document))
        EXPECT_TRUE(list->IsEmpty());
}

TEST(ParameterFile, OfANewDocumentHoldsTheDefaultsAndEveryListsEmptySection) {
    AD_Global_Var defaults;
    OwnedDocument document;

    EXPECT_EQ(written(document), fileOf(defaults, emptyLists));
}

TEST(ParameterFile, OfANewDocumentReadsAsANewDocument) {
    OwnedDocument first;
    OwnedDocument second;
    second.globalVar.G_thetac = 9.0;

    read(second, written(first));

    expectAllListsEmpty(second);
    EXPECT_EQ(written(second), written(first));
}

TEST(ParameterFile, IsReadIntoEveryListAndWrittenBackInTheSameOrder) {
    AD_Global_Var vars;
    vars.LastSelected = 3;
    vars.G_Ice_quality = 4;
    vars.Mass[7] = 1;
    const std::string text = fileOf(vars, filledLists);
    OwnedDocument document;

    read(document, text);

    EXPECT_EQ(document.globalVar.LastSelected, 3);
    EXPECT_EQ(document.initList.GetCount(), 2);
    EXPECT_EQ(document.initStraList.GetCount(), 1);
    EXPECT_EQ(document.nonCohesList.GetCount(), 1);
    EXPECT_EQ(document.decayList.GetCount(), 1);
    EXPECT_EQ(document.dispersList.GetCount(), 1);
    EXPECT_EQ(document.iceDataList.GetCount(), 1);
    EXPECT_EQ(document.globalList.GetCount(), 1);
    EXPECT_EQ(document.compList.GetCount(), 2);
    EXPECT_EQ(document.layerList.GetCount(), 2);
    EXPECT_EQ(document.k32DispersList.GetCount(), 1);
    EXPECT_EQ(written(document), text);
}

TEST(ParameterFile, ReplacesALongerFile) {
    const TempFolder folder;
    const std::string path = folder.write("file", std::string(100000, 'x'));
    AD_Global_Var defaults;
    OwnedDocument document;

    document.WriteData(path.c_str());

    EXPECT_EQ(folder.read("file"), fileOf(defaults, emptyLists));
}

TEST(ParameterFile, HoldsNoBoundaries) {
    AD_Global_Var defaults;
    OwnedDocument document;
    addLocal(document.boundList, 1, "MISSOURI", 5.0);
    addLocal(document.k32BoundList, 1, "MISSOURI", 5.0);

    EXPECT_EQ(written(document), fileOf(defaults, emptyLists));
}

TEST(ParameterFile, MayHoldBoundariesThatAreNotReadAndAreGoneAfterTheNextSave) {
    OwnedDocument document;

    read(document, R"(target KOTA0_AD {
  section BoundList {
    DATA = "MISSOURI", 5.0, 1, 0.5
  }
  section K32BoundList {
    DATA = "MISSOURI", 5.0, 1, 0.5, 1, 0.5
  }
})");

    AD_Global_Var defaults;
    expectAllListsEmpty(document);
    EXPECT_EQ(written(document), fileOf(defaults, emptyLists));
}

TEST(ParameterFile, MayHoldPartsOfOthersThatAreGoneAfterTheNextSave) {
    OwnedDocument document;

    read(document, R"(target OTHER {
  section InitList {
    DATA = 1, 2.5, true, "", 0.0
  }
}
target KOTA0_AD {
  section Unknown {
    DATA = 1, 2, 3
  }
  section DecayList {
    Unknown = 5
    DATA = 1, 0.5, true, "", 0.0, "more than there should be", 7
    section Deeper {
    }
  }
})");

    EXPECT_TRUE(document.initList.IsEmpty());
    EXPECT_EQ(document.decayList.GetCount(), 1);
    const std::string text = written(document);
    EXPECT_THAT(text, HasSubstr("    DATA = 1, 0.5, true, \"\", 0.0\n"));
    for (const char* gone : {"OTHER", "Unknown", "Deeper", "more than"})
        EXPECT_THAT(text, Not(HasSubstr(gone)));
}

TEST(ParameterFile, MayHoldItsSectionsInAnyOrder) {
    OwnedDocument document;

    read(document, R"(target KOTA0_AD {
  section K32DispersList {
    DATA = "MISSOURI", 5000.0, 1.5, 2.5, 3.5, 4.5, 5.5, 6.5, 7.5, 8.5
  }
  section InitList {
    DATA = 1, 2.5, true, "", 0.0
  }
  section Global_Variables {
    LastSelected = 3
  }
})");

    EXPECT_EQ(document.k32DispersList.GetCount(), 1);
    EXPECT_EQ(document.initList.GetCount(), 1);
    EXPECT_EQ(document.globalVar.LastSelected, 3);
}

TEST(ParameterFile, WithoutTheTargetOrWithNothingInItReadsAsANewDocument) {
    for (const char* text :
         {"", "target KOTA0_AD {\n}\n", "target OTHER {\n  section InitList {\n  }\n}\n"}) {
        OwnedDocument document;

        read(document, text);

        AD_Global_Var defaults;
        EXPECT_EQ(written(document), fileOf(defaults, emptyLists)) << text;
    }
}

TEST(ParameterFile, IsAddedToWhatTheDocumentHolds) {
    OwnedDocument document;
    addGlobal(document.decayList, 9);
    addComponent(document.compList, 9, "OLD", 0);

    read(document, R"(target KOTA0_AD {
  section DecayList {
    DATA = 1, 0.5, true, "", 0.0
  }
})");

    ASSERT_EQ(document.decayList.GetCount(), 2);
    EXPECT_EQ(recordOf(document.decayList, 1).componentNum, 9);
    EXPECT_EQ(recordOf(document.decayList, 2).componentNum, 1);
    EXPECT_EQ(document.compList.GetCount(), 1);
}

} // namespace
