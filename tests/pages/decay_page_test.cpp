#include "tests/pages/tabs.h"

namespace {

using kota::test::addGlobal;
using kota::test::addLocal;
using kota::test::ColumnLook;
using kota::test::entriesOf;
using kota::test::looksOf;
using kota::test::recordOf;
using testing::ElementsAre;
using testing::IsEmpty;

class TheDecayPage : public kota::test::OnATab {
protected:
    explicit TheDecayPage(std::vector<std::string> rivers = {}) : OnATab("Decay", std::move(rivers)) {}

    // Shows one line, at a place.
    void showLocalLine() {
        document().decayList.DeleteAll();
        addLocal(document().decayList, 0, "NILE", 1250.5).decayConst = 0.25;
        fill();
    }
    void expectLocked(ROWCOL row) {
        for (const ROWCOL col : {4U, 5U}) {
            EXPECT_EQ(user->held(row, col), "");
            EXPECT_TRUE(user->isReadOnly(row, col));
        }
    }
    void expectOpen(ROWCOL row) {
        EXPECT_FALSE(user->isReadOnly(row, 4));
        EXPECT_FALSE(user->isReadOnly(row, 5));
    }
};

TEST_F(TheDecayPage, HasFiveColumns) {
    EXPECT_THAT(looksOf(grid()),
                ElementsAre(ColumnLook{"Component", 80, GX_IDS_CTRL_ZEROBASED_EX, alignLeft, ""},
                            ColumnLook{"Decay const t-1", 65, 4789, alignRight, "Unit: 1/h"},
                            ColumnLook{"Global", 62, GX_IDS_CTRL_CHECKBOX, alignLeft, ""},
                            ColumnLook{"River Name", 62, 4788, alignLeft, ""},
                            ColumnLook{"Chainage", 62, 4791, alignRight, "Unit: m"}));
    EXPECT_EQ(kota::test::styleOf(grid(), 1, 3).GetInterior(), COLORREF{0x808080});
    EXPECT_EQ(grid().GetColWidth(0), 30);
    EXPECT_EQ(grid().GetRowHeight(0), 2 * grid().GetRowHeight(1));
    EXPECT_TRUE(grid().HasGridToolTips());
    EXPECT_EQ(&user->grid(1084), &grid());
}

TEST_F(TheDecayPage, ShowsAnEmptyListAsOneGlobalLine) {
    ASSERT_EQ(grid().GetRowCount(), 1U);
    EXPECT_THAT(line(1), ElementsAre("0", "0.000000", "1", "", ""));
    EXPECT_EQ(user->shown(1, 1), "Undefined");
    EXPECT_EQ(user->shown(1, 2), "0.000");
    expectLocked(1);
    ASSERT_EQ(document().decayList.GetCount(), 1) << "it is stored as soon as it is shown";
    EXPECT_EQ(recordOf(document().decayList).isGlobal, 1);
    EXPECT_EQ(recordOf(document().decayList).chainage, notGiven);
}

TEST_F(TheDecayPage, ShowsARecordForALine) {
    document().decayList.DeleteAll();
    addLocal(document().decayList, 2, "NILE", 1250.5).decayConst = 0.0125;
    addGlobal(document().decayList, 1).decayConst = 3.0;
    fill();
    ASSERT_EQ(grid().GetRowCount(), 2U);
    EXPECT_THAT(line(1), ElementsAre("2", "0.012500", "0", "NILE", "1250.500000"));
    EXPECT_THAT(line(2), ElementsAre("1", "3.000000", "1", "", ""));
    EXPECT_EQ(user->shown(1, 2), "0.013");
    EXPECT_EQ(user->shown(1, 5), "1250") << "half to even, as the C library prints";
    expectOpen(1);
    expectLocked(2);
}

TEST_F(TheDecayPage, ErasesThePlaceWhenGlobalIsCheckedAndOpensItWhenCleared) {
    showLocalLine();
    ASSERT_TRUE(user->clickBox(1, 3));
    EXPECT_EQ(user->held(1, 3), "1");
    expectLocked(1);
    ASSERT_TRUE(user->clickBox(1, 3));
    EXPECT_THAT(line(1), ElementsAre("0", "0.250000", "0", "", ""));
    expectOpen(1);
}

TEST_F(TheDecayPage, StoresTheClickOnTheBoxWhenTheCellIsLeft) {
    showLocalLine();
    ASSERT_TRUE(user->clickBox(1, 3));
    ASSERT_TRUE(user->putCursor(1, 2));
    EXPECT_EQ(recordOf(document().decayList).isGlobal, 1);
    EXPECT_TRUE(recordOf(document().decayList).riverName.IsEmpty());
    EXPECT_EQ(recordOf(document().decayList).chainage, notGiven);
    EXPECT_TRUE(document().IsModified());
}

TEST_F(TheDecayPage, TakesNoPlaceForAGlobalLine) {
    ASSERT_TRUE(user->putCursor(1, 4));
    EXPECT_FALSE(user->type("NILE"));
    ASSERT_TRUE(user->putCursor(1, 5));
    EXPECT_FALSE(user->type("12"));
    expectLocked(1);
}

TEST_F(TheDecayPage, LocksALineThatHasBecomeGlobalInTheDocument) {
    showLocalLine();
    recordOf(document().decayList).isGlobal = 1;
    fill();
    expectLocked(1);
    recordOf(document().decayList).isGlobal = 0;
    fill();
    EXPECT_THAT(line(1), ElementsAre("0", "0.250000", "0", "NILE", "1250.500000"));
    expectOpen(1);
}

TEST_F(TheDecayPage, StoresABlankChainageAsNotGivenAndShowsItBlankAgain) {
    showLocalLine();
    put(1, 5, "");
    leaveTab();
    EXPECT_EQ(recordOf(document().decayList).chainage, 1e10);
    ASSERT_TRUE(user->selectTab("Decay"));
    EXPECT_THAT(line(1), ElementsAre("0", "0.250000", "0", "NILE", ""));
    EXPECT_EQ(user->shown(1, 5), "");
}

TEST_F(TheDecayPage, StoresABlankConstantAsZeroWhenItIsLeft) {
    showLocalLine();
    CGXGridCore& left = grid();
    put(1, 2, "");
    EXPECT_EQ(user->held(1, 2), "") << "not before";
    leaveTab();
    EXPECT_EQ(left.GetValueRowCol(1, 2), "0");
    EXPECT_EQ(recordOf(document().decayList).decayConst, 0.0);
    ASSERT_TRUE(user->selectTab("Decay"));
    EXPECT_EQ(user->held(1, 2), "0.000000");
}

TEST_F(TheDecayPage, LeavesAGlobalLineWhenTheOnlyOneIsDeleted) {
    showLocalLine();
    ASSERT_TRUE(user->selectLines(1, 1));
    ASSERT_TRUE(user->key(VK_DELETE));
    ASSERT_EQ(grid().GetRowCount(), 1U);
    EXPECT_THAT(line(1), ElementsAre("0", "0", "1", "", ""));
    expectLocked(1);
    ASSERT_EQ(document().decayList.GetCount(), 1);
    EXPECT_EQ(recordOf(document().decayList).isGlobal, 1);
}

TEST_F(TheDecayPage, LeavesThePlaceOfTheNextLineOpenWhenAGlobalOneIsDeleted) {
    document().decayList.DeleteAll();
    addGlobal(document().decayList, 0);
    addLocal(document().decayList, 0, "NILE", 5.0);
    fill();
    ASSERT_TRUE(user->selectLines(1, 1));
    ASSERT_TRUE(user->key(VK_DELETE));
    EXPECT_THAT(line(1), ElementsAre("0", "0.000000", "0", "NILE", "5.000000"));
    expectOpen(1);
    put(1, 5, "7");
    EXPECT_EQ(recordOf(document().decayList).chainage, 7.0);
}

TEST_F(TheDecayPage, OffersAllComponentsOfTheDocumentBehindUndefined) {
    for (int kind = 0; kind <= 3; ++kind)
        kota::test::addComponent(document().compList, kind + 1, ("C" + std::to_string(kind)).c_str(), kind);
    leaveTab();
    ASSERT_TRUE(user->selectTab("Decay"));
    EXPECT_THAT(entriesOf(grid(), 1, 1), ElementsAre("Undefined", "C0", "C1", "C2", "C3"));
    ASSERT_TRUE(user->putCursor(1, 1));
    ASSERT_TRUE(user->choose("C3"));
    ASSERT_TRUE(user->putCursor(1, 2));
    EXPECT_EQ(recordOf(document().decayList).componentNum, 4);
}

TEST_F(TheDecayPage, OffersUndefinedAloneWithoutComponents) {
    EXPECT_THAT(entriesOf(grid(), 1, 1), ElementsAre("Undefined"));
}

TEST_F(TheDecayPage, AddsAGlobalLineWhenTheShellOffersNoLocation) {
    showLocalLine();
    ASSERT_TRUE(user->key(VK_INSERT));
    ASSERT_EQ(grid().GetRowCount(), 2U);
    EXPECT_THAT(line(2), ElementsAre("0", "0", "1", "", ""));
    expectLocked(2);
    EXPECT_EQ(user->cursor(), std::make_pair(2U, 1U));
    EXPECT_EQ(document().decayList.GetCount(), 1) << "a plain line is stored when a cell or the tab is left";
}

TEST_F(TheDecayPage, AddsALineAtThePlaceThatTheShellOffers) {
    shell().project().offers.push_back({.riverName = "NILE", .chainage = 125.0, .dataType = 4});
    ASSERT_TRUE(user->key(VK_INSERT));
    ASSERT_EQ(grid().GetRowCount(), 2U);
    EXPECT_THAT(line(2), ElementsAre("0", "0", "0", "NILE", "125.000000.3"));
    EXPECT_EQ(user->shown(2, 5), "125");
    expectOpen(2);
    EXPECT_EQ(user->cursor(), std::make_pair(0U, 0U)) << "no cell is current";
    EXPECT_EQ(recordOf(document().decayList, 2).chainage, 125.0);
    EXPECT_EQ(recordOf(document().decayList, 2).riverName, "NILE");
}

TEST_F(TheDecayPage, RefusesANumberThatIsNoneAndKeepsTheTab) {
    showLocalLine();
    ASSERT_TRUE(user->putCursor(1, 2));
    ASSERT_TRUE(user->type("1,5"));
    EXPECT_FALSE(user->selectTab("Components"));
    EXPECT_EQ(user->tab(), "Decay");
    EXPECT_EQ(user->warning(), "Double number required");
    EXPECT_EQ(recordOf(document().decayList).decayConst, 0.25);
}

class TheDecayPageInAProject : public TheDecayPage {
protected:
    TheDecayPageInAProject() : TheDecayPage({"Nile", "Rhine"}) {}
};

TEST_F(TheDecayPageInAProject, OffersTheProjectsRiversWhenANameIsEdited) {
    EXPECT_EQ(looksOf(grid())[3].control, GX_IDS_CTRL_TEXTFIT);
    EXPECT_EQ(grid().GetParam()->GetDefaultComboBoxHeight(), 500);
    EXPECT_THAT(entriesOf(grid(), 1, 4), IsEmpty()) << "not before";
    showLocalLine();
    ASSERT_TRUE(user->putCursor(1, 4));
    ASSERT_TRUE(user->type("Amazon"));
    EXPECT_THAT(entriesOf(grid(), 1, 4), ElementsAre("Nile", "Rhine"));
    ASSERT_TRUE(user->choose("Rhine"));
    ASSERT_TRUE(user->putCursor(1, 5));
    EXPECT_EQ(recordOf(document().decayList).riverName, "Rhine") << "a name of the project stays as it is";
}

TEST_F(TheDecayPageInAProject, ReportsTheLocationOfNoLine) {
    document().decayList.DeleteAll();
    addLocal(document().decayList, 0, "NILE", 5.0);
    addGlobal(document().decayList, 0);
    fill();
    shell().forgetReceived();
    ASSERT_TRUE(user->putCursor(2, 1));
    ASSERT_TRUE(user->putCursor(1, 1));
    EXPECT_THAT(shell().received(503), IsEmpty());
}

} // namespace
