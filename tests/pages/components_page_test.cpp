#include "platform/framework/property_sheet.h"
#include "platform/framework/turn.h"
#include "tests/pages/tabs.h"

namespace {

using kota::test::ColumnLook;
using kota::test::entriesOf;
using kota::test::looksOf;
using kota::test::recordOf;
using testing::ElementsAre;
using testing::IsEmpty;

class TheComponentsPage : public kota::test::OnATab {
protected:
    TheComponentsPage() : OnATab("Components") {}

    void showComponents(const std::vector<std::string>& names) {
        document().compList.DeleteAll();
        for (const std::string& name : names)
            kota::test::addComponent(document().compList, 0, name.c_str(), 0);
        fill();
    }
    std::vector<std::string> names() {
        std::vector<std::string> all;
        for (const AD_Component* component : kota::test::recordsOf(document().compList))
            all.emplace_back(component->name.View());
        return all;
    }
};

TEST_F(TheComponentsPage, HasThreeColumns) {
    EXPECT_THAT(looksOf(grid()),
                ElementsAre(ColumnLook{"Component", 80, 4788, alignLeft, ""},
                            ColumnLook{"Units", 88, GX_IDS_CTRL_ONEBASED_EX, alignLeft, ""},
                            ColumnLook{"Type", 80, GX_IDS_CTRL_ZEROBASED_EX, alignLeft, ""}));
    EXPECT_EQ(grid().GetColWidth(0), 30);
    EXPECT_EQ(grid().GetRowHeight(0), grid().GetRowHeight(1)) << "a head of one line";
    EXPECT_EQ(&user->grid(1064), &grid());
}

TEST_F(TheComponentsPage, OffersUnitsAndTypes) {
    EXPECT_THAT(entriesOf(grid(), 1, 2),
                ElementsAre("my-g/m3", "mg/m3", "g/m3", "kg/m3", "my-g/l", "mg/l", "g/l", "Deg. Cel.",
                            "million/100 ml", "PSU", "per thousand"));
    EXPECT_THAT(entriesOf(grid(), 1, 3),
                ElementsAre("Normal", "Single Layer Cohesive", "Multi Layer Cohesive"));
}

TEST_F(TheComponentsPage, ShowsAnEmptyListAsOneBlankLineAndStoresItAsAnEmptyList) {
    ASSERT_EQ(grid().GetRowCount(), 1U);
    EXPECT_THAT(line(1), ElementsAre("", "1", "0"));
    EXPECT_EQ(user->shown(1, 2), "my-g/m3");
    EXPECT_EQ(user->shown(1, 3), "Normal");
    leaveTab();
    EXPECT_TRUE(document().compList.IsEmpty());
}

TEST_F(TheComponentsPage, TakesALoneLineWithoutANameForNoComponentWhateverItsUnits) {
    ASSERT_TRUE(user->putCursor(1, 2));
    ASSERT_TRUE(user->choose("kg/m3"));
    leaveTab();
    EXPECT_TRUE(document().compList.IsEmpty());
}

TEST_F(TheComponentsPage, StoresTwoBlankLinesAsTwoComponentsWithoutNames) {
    ASSERT_TRUE(user->putCursor(1, 1));
    ASSERT_TRUE(user->key(VK_INSERT));
    ASSERT_EQ(grid().GetRowCount(), 2U);
    leaveTab();
    ASSERT_THAT(names(), ElementsAre("", ""));
    const AD_Component& second = recordOf(document().compList, 2);
    EXPECT_EQ(second.number, 2);
    EXPECT_EQ(second.units, 1);
    EXPECT_EQ(second.kind, 0);
}

TEST_F(TheComponentsPage, StoresNamesInUpperCaseInTheRiversOwnLetters) {
    put(1, 1, "salt å é ж");
    EXPECT_EQ(user->held(1, 1), "SALT Å É Ж");
    EXPECT_THAT(names(), ElementsAre("SALT Å É Ж"));
}

TEST_F(TheComponentsPage, ShowsANameOfAFileInUpperCaseAndLeavesItAlone) {
    showComponents({"salt"});
    EXPECT_EQ(user->shown(1, 1), "SALT");
    leaveTab();
    EXPECT_THAT(names(), ElementsAre("salt"));
}

TEST_F(TheComponentsPage, TakesANameThatIsStillBeingTypedWhenItIsLeft) {
    ASSERT_TRUE(user->putCursor(1, 1));
    ASSERT_TRUE(user->type("oxygen"));
    leaveTab();
    EXPECT_THAT(names(), ElementsAre("OXYGEN"));
}

TEST_F(TheComponentsPage, TakesTheCellAgainAndBringsItIntoViewWhenItIsKilled) {
    ASSERT_TRUE(user->putCursor(1, 1));
    ASSERT_TRUE(user->type("oxygen"));
    const kota::Turn turn;

    EXPECT_TRUE(static_cast<CPropertyPage&>(user->page()).OnKillActive());

    EXPECT_EQ(user->held(1, 1), "OXYGEN");
    EXPECT_EQ(user->cursor(), (std::pair<ROWCOL, ROWCOL>(1, 1)));
}

TEST_F(TheComponentsPage, StoresUnitsFromOneAndTypesFromZero) {
    put(1, 1, "A");
    ASSERT_TRUE(user->putCursor(1, 2));
    ASSERT_TRUE(user->choose("per thousand"));
    ASSERT_TRUE(user->putCursor(1, 3));
    ASSERT_TRUE(user->choose("Multi Layer Cohesive"));
    leaveTab();
    EXPECT_EQ(recordOf(document().compList).units, 11);
    EXPECT_EQ(recordOf(document().compList).kind, 2);
}

TEST_F(TheComponentsPage, KeepsAKindThatOnlyAFileGives) {
    showComponents({"SAND"});
    recordOf(document().compList).kind = 3;
    fill();
    leaveTab();
    EXPECT_EQ(recordOf(document().compList).kind, 3);
}

TEST_F(TheComponentsPage, LeavesABlankLineWhenTheOnlyOneIsDeleted) {
    showComponents({"SALT"});
    ASSERT_TRUE(user->selectLines(1, 1));
    ASSERT_TRUE(user->key(VK_DELETE));
    ASSERT_EQ(grid().GetRowCount(), 1U);
    EXPECT_THAT(line(1), ElementsAre("", "1", "0"));
    EXPECT_TRUE(document().compList.IsEmpty());
}

TEST_F(TheComponentsPage, NumbersTheComponentsByTheirLines) {
    showComponents({"A", "B", "C", "D"});
    ASSERT_TRUE(user->selectLines(2, 3));
    ASSERT_TRUE(user->key(VK_DELETE));
    ASSERT_TRUE(user->key(VK_INSERT));
    put(3, 1, "E");
    ASSERT_THAT(names(), ElementsAre("A", "D", "E"));
    for (ROWCOL row = 1; row <= 3; ++row) {
        EXPECT_EQ(recordOf(document().compList, row).number, static_cast<int>(row));
        EXPECT_EQ(user->held(row, 0), std::to_string(row));
    }
}

TEST_F(TheComponentsPage, AddsALineWithoutAskingForALocation) {
    shell().project().offers.push_back({.riverName = "NILE"});
    ASSERT_TRUE(user->putCursor(1, 1));
    ASSERT_TRUE(user->key(VK_INSERT));
    EXPECT_THAT(line(2), ElementsAre("", "1", "0"));
    EXPECT_THAT(shell().received(200), IsEmpty());
}

TEST_F(TheComponentsPage, RenumbersNoRecordOfAnotherPage) {
    showComponents({"A", "B", "C"});
    kota::test::addLocal(document().decayList, 2, "NILE", 1.0);
    ASSERT_TRUE(user->selectLines(1, 1));
    ASSERT_TRUE(user->key(VK_DELETE));
    ASSERT_TRUE(user->selectTab("Decay"));
    EXPECT_EQ(user->shown(1, 1), "C");
    EXPECT_EQ(recordOf(document().decayList).componentNum, 2);
}

TEST_F(TheComponentsPage, IsNotSearched) {
    ASSERT_TRUE(user->putCursor(1, 1));
    EXPECT_TRUE(user->key(VK_F7));
    EXPECT_EQ(user->cursor(), std::make_pair(1U, 1U));
    EXPECT_THAT(boxes(), IsEmpty());
}

} // namespace
