#include "tests/support/kvs_text.h"
#include "tests/support/owned.h"

#include <gtest/gtest.h>

#include <memory>

using namespace kota::test;

namespace {

template <class List>
std::unique_ptr<CGenList> make() {
    return std::make_unique<Owned<List>>();
}

// A list class, its section, and two entries in the form in which it saves them.
struct Row {
    const char* name;
    std::unique_ptr<CGenList> (*list)();
    const char* section;
    const char* first;
    const char* second;
};

void PrintTo(const Row& row, std::ostream* stream) {
    *stream << row.name;
}

// clang-format off

constexpr const char* cohesive1 = R"(    section Cohesive_ST_Record {
      PRIVATE = 1
      SETTING = 1.0, 2.0, 3.0, 4.0, 5.0
      DEPOSITION = 6.0, 7.0, 0
      EROSION = true, 1.0, 2.0, 3.0, 4.0, 5.0, 6.0, 7.0, 8.0, 9.0, 1
      CONSOLIDATION = 1.0, 2.0, 3.0
      LOCATION = true, "", 0.0
    }
)";
constexpr const char* cohesive2 = R"(    section Cohesive_ST_Record {
      PRIVATE = 2
      SETTING = 1.0, 2.0, 3.0, 4.0, 5.0
      DEPOSITION = 6.0, 7.0, 1
      EROSION = false, 1.0, 2.0, 3.0, 4.0, 5.0, 6.0, 7.0, 8.0, 9.0, 0
      CONSOLIDATION = 1.0, 2.0, 3.0
      LOCATION = false, "R", 8.5
    }
)";
constexpr const char* layer1 = R"(    DATA = 1, 1.0, 2.0, 3.0, false, 0, true, "", 0.0
    section AdderList {
      DATA = 4.0, 5.0
      DATA = 6.0, 7.0
    }
)";
constexpr const char* layer2 = R"(    DATA = 2, 1.0, 2.0, 3.0, true, 1, false, "R", 8.5
    section AdderList {
    }
)";

const Row rows[] = {
    {"CInitList",       make<CInitList>,       "InitList",       "    DATA = 1, 2.0, true, \"\", 0.0\n",
                                                                 "    DATA = 2, 3.0, false, \"R\", 8.5\n"},
    {"CInitStraList",   make<CInitStraList>,   "InitStratified", "    DATA = 1, 1.0, 2.0, 3.0, 4.0, 5.0, 6.0, true, \"\", 0.0\n",
                                                                 "    DATA = 2, 1.0, 2.0, 3.0, 4.0, 5.0, 6.0, false, \"R\", 8.5\n"},
    {"CNonCohesList",   make<CNonCohesList>,   "NonCohesList",   "    DATA = 1, 2.0, 3.0, true, \"\", 0.0\n",
                                                                 "    DATA = 2, 2.0, 3.0, false, \"R\", 8.5\n"},
    {"CDecayList",      make<CDecayList>,      "DecayList",      "    DATA = 1, 2.0, true, \"\", 0.0\n",
                                                                 "    DATA = 2, 3.0, false, \"R\", 8.5\n"},
    {"CDispersList",    make<CDispersList>,    "DispersList",    "    DATA = \"R\", 8.5, 1.0, 2.0, 3.0, 4.0\n",
                                                                 "    DATA = \"Q\", 9.5, 5.0, 6.0, 7.0, 8.0\n"},
    {"CK32DispersList", make<CK32DispersList>, "K32DispersList", "    DATA = \"R\", 8.5, 1.0, 2.0, 3.0, 4.0, 5.0, 6.0, 7.0, 8.0\n",
                                                                 "    DATA = \"Q\", 9.5, 8.0, 7.0, 6.0, 5.0, 4.0, 3.0, 2.0, 1.0\n"},
    {"CIceDataList",    make<CIceDataList>,    "IceDataList",    "    DATA = \"R\", 8.5, 1.0, 2.0, 3\n",
                                                                 "    DATA = \"Q\", 9.5, 3.0, 4.0, 5\n"},
    {"CGlobalList",     make<CGlobalList>,     "Cohesive_ST",    cohesive1, cohesive2},
    {"CCompList",       make<CCompList>,       "CompList",       "    DATA = 1, \"SILT\", 6, 1\n",
                                                                 "    DATA = 2, \"SAND\", 5, 3\n"},
    {"CBoundList",      make<CBoundList>,      "BoundList",      "    DATA = \"R\", 8.5, 1, 2.0\n",
                                                                 "    DATA = \"Q\", 9.5, 2, 3.0\n"},
    {"CK32BoundList",   make<CK32BoundList>,   "K32BoundList",   "    DATA = \"R\", 8.5, 1, 2.0, 2, 3.0\n",
                                                                 "    DATA = \"Q\", 9.5, 0, 4.0, 1, 5.0\n"},
    {"CLayerList",      make<CLayerList>,      "LayerList",      layer1, layer2},
};

// clang-format on

std::string sectionText(const Row& row, const std::string& content) {
    return "\n  section " + std::string(row.section) + " {\n" + content + "  }\n";
}

class ListOnFile : public testing::TestWithParam<Row> {
protected:
    const Row& row = GetParam();
    std::unique_ptr<CGenList> list = row.list();
};

TEST_P(ListOnFile, SavesAnEmptySectionWhenItIsEmpty) {
    EXPECT_EQ(savedText(*list), sectionText(row, ""));
}

TEST_P(ListOnFile, LoadsAndSavesItsRecordsInTheirOrder) {
    const std::string inOrder = std::string(row.first) + row.second;
    const std::string turned = std::string(row.second) + row.first;

    loadText(*list, sectionText(row, inOrder));
    const auto other = row.list();
    loadText(*other, sectionText(row, turned));

    EXPECT_EQ(list->GetCount(), 2);
    EXPECT_EQ(savedText(*list), sectionText(row, inOrder));
    EXPECT_EQ(savedText(*other), sectionText(row, turned));
}

TEST_P(ListOnFile, StaysAsItIsWhereItsSectionIsMissing) {
    loadText(*list, sectionText(row, row.first));

    loadText(*list, "section Other {\n DATA = 1, 2.0\n}");
    list->Load(nullptr);

    EXPECT_EQ(savedText(*list), sectionText(row, row.first));
}

TEST_P(ListOnFile, StaysEmptyWhereItsSectionHoldsNoEntry) {
    loadText(*list, sectionText(row, "    OTHER = 1, 2.0\n"));

    EXPECT_TRUE(list->IsEmpty());
}

TEST_P(ListOnFile, IsNotEmptiedByALoad) {
    loadText(*list, sectionText(row, row.first));

    loadText(*list, sectionText(row, row.second));

    EXPECT_EQ(savedText(*list), sectionText(row, std::string(row.first) + row.second));
}

TEST_P(ListOnFile, ReadsTheFirstSectionOfItsName) {
    loadText(*list, sectionText(row, row.first) + sectionText(row, row.second));

    EXPECT_EQ(savedText(*list), sectionText(row, row.first));
}

TEST_P(ListOnFile, IsEmptyAfterDeleteAll) {
    loadText(*list, sectionText(row, std::string(row.first) + row.second));

    list->DeleteAll();

    EXPECT_TRUE(list->IsEmpty());
    EXPECT_EQ(savedText(*list), sectionText(row, ""));
}

INSTANTIATE_TEST_SUITE_P(EachOfTheDocument, ListOnFile, testing::ValuesIn(rows),
                         [](const auto& tested) { return tested.param.name; });

TEST(TableOnFile, IsLoadedFromItsOwnSection) {
    const std::string text = "\n  section AdderList {\n    DATA = 1.0, 2.0\n    DATA = 3.0, 4.0\n  }\n";
    Owned<CAdderList> list;
    const ParsedTarget target(text);

    list.Load(target.section("AdderList"));

    EXPECT_EQ(list.GetCount(), 2);
    EXPECT_EQ(savedText(list), text);
}

TEST(TableOnFile, StaysEmptyForASectionOfItsNameInsideTheOneGiven) {
    Owned<CAdderList> list;
    const ParsedTarget target("section LayerList {\n section AdderList {\n DATA = 1.0, 2.0\n }\n}");

    list.Load(target.section("LayerList"));
    list.Load(nullptr);

    EXPECT_TRUE(list.IsEmpty());
    EXPECT_EQ(savedText(list), "\n  section AdderList {\n  }\n");
}

class CountedDecay : public AD_Decay {
public:
    explicit CountedDecay(int& gone) : gone_(gone) {}
    ~CountedDecay() override { ++gone_; }

private:
    int& gone_;
};

TEST(RecordOwnership, DeleteAllDeletesTheRecords) {
    int gone = 0;
    CDecayList list;
    list.AddTail(new CountedDecay(gone));
    list.AddTail(new CountedDecay(gone));

    list.DeleteAll();

    EXPECT_EQ(gone, 2);
}

TEST(RecordOwnership, RemovingIncompleteLinesDeletesThem) {
    int gone = 0;
    Owned<CDecayList> list;
    auto* incomplete = new CountedDecay(gone);
    incomplete->componentNum = 0;
    list.AddTail(incomplete);
    int changed = 0;

    list.RemoveEmptyLines(&changed);

    EXPECT_EQ(gone, 1);
}

TEST(RecordOwnership, ListsLeaveTheirRecordsAloneWhenTheyGo) {
    int gone = 0;
    CountedDecay record(gone);
    {
        CDecayList list;
        list.AddTail(&record);
    }

    EXPECT_EQ(gone, 0);
}

} // namespace
