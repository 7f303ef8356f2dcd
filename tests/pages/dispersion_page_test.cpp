#include "tests/pages/tabs.h"

namespace {

using kota::test::ColumnLook;
using kota::test::looksOf;
using kota::test::recordOf;
using testing::ElementsAre;
using testing::IsEmpty;
using testing::SizeIs;

const ColumnLook riverColumn{"River Name", 63, 4788, alignLeft, ""};

class TheDispersionPage : public kota::test::OnATab {
protected:
    explicit TheDispersionPage(std::vector<std::string> rivers = {})
        : OnATab("Dispersion", std::move(rivers)) {}

    AD_Global_Var& globals() { return document().globalVar; }
    void setGlobals(double factor, double exponent, double least, double most) {
        globals().G_disp_factor = factor;
        globals().G_exponent = exponent;
        globals().G_min_disp_coef = least;
        globals().G_max_disp_coef = most;
    }
    // Shows one line of which every value differs from the global one.
    void showLine() {
        document().dispersList.DeleteAll();
        AD_Dispersion& record = kota::test::addLocal(document().dispersList, 0, "NILE", 1250.0);
        record.dispFactor = 11.0;
        record.exponent = 12.0;
        record.minCoef = 13.0;
        record.maxCoef = 14.0;
        fill();
    }
    std::vector<double> valuesOf(std::size_t n) {
        const AD_Dispersion& record = recordOf(document().dispersList, n);
        return {record.dispFactor, record.exponent, record.minCoef, record.maxCoef};
    }
};

TEST_F(TheDispersionPage, HasSixColumns) {
    EXPECT_THAT(looksOf(grid()),
                ElementsAre(riverColumn, ColumnLook{"Chainage", 58, 4791, alignRight, "Unit: m"},
                            ColumnLook{"Dispersion factor", 70, 4789, alignRight, ""},
                            ColumnLook{"Exponent", 60, 4789, alignRight, ""},
                            ColumnLook{"Minimum coef.", 62, 4789, alignRight, "Unit: m^2/s"},
                            ColumnLook{"Maximum coef.", 62, 4789, alignRight, "Unit: m^2/s"}));
    EXPECT_EQ(grid().GetColWidth(0), 30);
    EXPECT_EQ(grid().GetRowHeight(0), 2 * grid().GetRowHeight(1));
    EXPECT_TRUE(grid().HasGridToolTips());
    EXPECT_EQ(&user->grid(1080), &grid());
}

TEST_F(TheDispersionPage, ShowsAnEmptyListAsOneLineWithTheGlobalValues) {
    ASSERT_EQ(grid().GetRowCount(), 1U);
    EXPECT_THAT(line(1), ElementsAre("", "", "0.000000", "0.000000", "0.000000", "100.000000"));
    EXPECT_EQ(user->shown(1, 6), "100.000");
    for (ROWCOL col = 1; col <= 6; ++col)
        EXPECT_FALSE(user->isReadOnly(1, col));
    ASSERT_EQ(document().dispersList.GetCount(), 1) << "it is stored as soon as it is shown";
    EXPECT_EQ(recordOf(document().dispersList).chainage, 1e10);
    EXPECT_THAT(valuesOf(1), ElementsAre(0.0, 0.0, 0.0, 100.0));
}

TEST_F(TheDispersionPage, ShowsARecordForALine) {
    showLine();
    EXPECT_THAT(line(1),
                ElementsAre("NILE", "1250.000000", "11.000000", "12.000000", "13.000000", "14.000000"));
    EXPECT_EQ(user->shown(1, 2), "1250");
    EXPECT_EQ(user->shown(1, 3), "11.000");
}

TEST_F(TheDispersionPage, GivesABlankCellTheGlobalValueOfItsColumnWhenItIsLeft) {
    setGlobals(0.125, 1.5, 2.0, 300.0);
    showLine();
    for (ROWCOL col = 3; col <= 6; ++col)
        put(1, col, "");
    leaveTab();
    EXPECT_THAT(valuesOf(1), ElementsAre(0.125, 1.5, 2.0, 300.0));
    EXPECT_EQ(recordOf(document().dispersList).riverName, "NILE");
}

TEST_F(TheDispersionPage, LeavesABlankCellBlankUntilItIsLeft) {
    setGlobals(0.125, 1.5, 2.0, 300.0);
    showLine();
    put(1, 3, "");
    EXPECT_EQ(user->held(1, 3), "");
    EXPECT_EQ(recordOf(document().dispersList).dispFactor, 0.0);
}

TEST_F(TheDispersionPage, LetsALineHaveItsMinimumAboveItsMaximum) {
    showLine();
    put(1, 5, "15");
    leaveTab();
    EXPECT_THAT(valuesOf(1), ElementsAre(11.0, 12.0, 15.0, 14.0));
    EXPECT_THAT(boxes(), IsEmpty());
}

TEST_F(TheDispersionPage, GivesNewLinesTheGlobalValuesOfTheirTimeAndLeavesTheOthersAlone) {
    ASSERT_TRUE(user->enterInto(1008, "7.5"));
    EXPECT_EQ(user->held(1, 3), "0.000000");
    ASSERT_TRUE(user->putCursor(1, 1));
    ASSERT_TRUE(user->key(VK_INSERT));
    EXPECT_THAT(line(2), ElementsAre("", "", "7.5", "0", "0", "100"));
    leaveTab();
    EXPECT_THAT(valuesOf(1), ElementsAre(0.0, 0.0, 0.0, 100.0));
    EXPECT_THAT(valuesOf(2), ElementsAre(7.5, 0.0, 0.0, 100.0));
}

TEST_F(TheDispersionPage, AddsALineAtThePlaceThatTheShellOffersWithTheGlobalValues) {
    setGlobals(0.125, 1.5, 2.0, 300.0);
    showLine();
    shell().project().offers.push_back({.riverName = "RHINE", .chainage2 = 12.5});
    ASSERT_TRUE(user->key(VK_INSERT));
    EXPECT_THAT(line(2), ElementsAre("RHINE", "12.500000.3", "0.125", "1.5", "2", "300"));
    EXPECT_EQ(user->cursor(), std::make_pair(0U, 0U)) << "no cell is current";
    EXPECT_EQ(recordOf(document().dispersList, 2).chainage, 12.5);
    EXPECT_THAT(valuesOf(2), ElementsAre(0.125, 1.5, 2.0, 300.0));
}

TEST_F(TheDispersionPage, ShowsAChainageThatIsNotGivenBlankAndStoresItSoAgain) {
    document().dispersList.DeleteAll();
    kota::test::addLocal(document().dispersList, 0, "NILE", 1e10);
    fill();
    EXPECT_EQ(user->held(1, 2), "");
    EXPECT_EQ(user->shown(1, 2), "");
    leaveTab();
    EXPECT_EQ(recordOf(document().dispersList).chainage, 1e10);
}

TEST_F(TheDispersionPage, LeavesALineWithTheGlobalValuesWhenTheOnlyOneIsDeleted) {
    setGlobals(0.125, 1.5, 2.0, 300.0);
    showLine();
    ASSERT_TRUE(user->selectLines(1, 1));
    ASSERT_TRUE(user->key(VK_DELETE));
    ASSERT_EQ(grid().GetRowCount(), 1U);
    EXPECT_THAT(line(1), ElementsAre("", "", "0.125", "1.5", "2", "300"));
    ASSERT_EQ(document().dispersList.GetCount(), 1);
    EXPECT_THAT(valuesOf(1), ElementsAre(0.125, 1.5, 2.0, 300.0));
}

TEST_F(TheDispersionPage, StoresARiverNameInUpperCase) {
    showLine();
    put(1, 1, "gudenå");
    EXPECT_EQ(recordOf(document().dispersList).riverName, "GUDENÅ");
}

class TheDispersionPageInAProject : public TheDispersionPage {
protected:
    TheDispersionPageInAProject() : TheDispersionPage({"NILE", "RHINE"}) {}

    // Lines at NILE 5, at no river, and at RHINE without a chainage; nothing reported yet.
    void showThreeLines() {
        document().dispersList.DeleteAll();
        kota::test::addLocal(document().dispersList, 0, "NILE", 5.0);
        kota::test::addLocal(document().dispersList, 0, "", 6.0);
        kota::test::addLocal(document().dispersList, 0, "RHINE", notGiven);
        fill();
        ASSERT_TRUE(user->putCursor(2, 1));
        shell().forgetReceived();
    }
};

TEST_F(TheDispersionPageInAProject, OffersTheProjectsRivers) {
    EXPECT_EQ(looksOf(grid())[0].control, GX_IDS_CTRL_TEXTFIT);
    ASSERT_TRUE(user->putCursor(1, 1));
    ASSERT_TRUE(user->type("N"));
    EXPECT_THAT(kota::test::entriesOf(grid(), 1, 1), ElementsAre("NILE", "RHINE"));
}

TEST_F(TheDispersionPageInAProject, ReportsTheLocationOfEachLineThatNamesARiver) {
    showThreeLines();
    ASSERT_TRUE(user->putCursor(1, 1));
    ASSERT_THAT(shell().received(503), SizeIs(1));
    const kota::headless::Location location = shell().received(503).front().location.value();
    EXPECT_EQ(location.riverName, "NILE");
    EXPECT_EQ(location.chainage, 5.0);
    ASSERT_TRUE(user->putCursor(2, 1));
    EXPECT_THAT(shell().received(503), SizeIs(1));
}

TEST_F(TheDispersionPageInAProject, ReportsABlankChainageAsZero) {
    showThreeLines();
    ASSERT_TRUE(user->putCursor(3, 1));
    ASSERT_THAT(shell().received(503), SizeIs(1));
    EXPECT_EQ(shell().received(503).front().location.value().chainage, 0.0);
}

} // namespace
