#include "pages/decay_grid.h"
#include "tests/pages/on_a_page.h"

namespace {

// The record of a line, which goes by itself.
class ARecordOfALine : public kota::test::OnAPage {
protected:
    using OnAPage::OnAPage;

    std::unique_ptr<AD_Comp_RiverPos> record(ROWCOL row) {
        return std::unique_ptr<AD_Comp_RiverPos>(page().RecordFromRow(row));
    }
};

class ARecordOfDispersion : public ARecordOfALine {
protected:
    ARecordOfDispersion() : ARecordOfALine("Dispersion") {
        document().dispersList.DeleteAll();
        kota::test::addLocal(document().dispersList, 0, "NILE", 12.5);
        kota::test::addLocal(document().dispersList, 0, "", notGiven);
        fill();
    }
};

TEST_F(ARecordOfDispersion, HoldsThePlace) {
    ASSERT_TRUE(record(1));
    EXPECT_NE(dynamic_cast<AD_Dispersion*>(record(1).get()), nullptr);
    EXPECT_EQ(record(1)->riverName, "NILE");
    EXPECT_EQ(record(1)->chainage, 12.5);
}

TEST_F(ARecordOfDispersion, HasZeroForABlankChainage) {
    ASSERT_TRUE(record(2));
    EXPECT_EQ(record(2)->chainage, 0.0);
}

TEST_F(ARecordOfDispersion, IsMissingInAGridWithoutLines) {
    user->grid().SetRowCount(0);
    EXPECT_FALSE(record(1));
}

class ARecordOfDecay : public ARecordOfALine {
protected:
    ARecordOfDecay() : ARecordOfALine("Decay") {
        document().decayList.DeleteAll();
        kota::test::addLocal(document().decayList, 1, "NILE", 12.5);
        kota::test::addGlobal(document().decayList, 1);
        fill();
    }
};

TEST_F(ARecordOfDecay, IsThatOfAGlobalLineAlone) {
    EXPECT_FALSE(record(1));
    ASSERT_TRUE(record(2));
    EXPECT_NE(dynamic_cast<AD_Decay*>(record(2).get()), nullptr);
    EXPECT_EQ(record(2)->riverName, "");
    EXPECT_EQ(record(2)->chainage, 0.0);
}

TEST_F(ARecordOfDecay, IsMissingInAGridWithoutLines) {
    user->grid().SetRowCount(0);
    EXPECT_FALSE(record(1));
}

class ARecordOfAComponent : public ARecordOfALine {
protected:
    ARecordOfAComponent() : ARecordOfALine("Components") {}
};

TEST_F(ARecordOfAComponent, IsMissing) {
    EXPECT_FALSE(record(1));
}

// A page that counts how often a box of its grid decided on a line.
class CountingPage : public CGenPropertyPage {
public:
    void OnRowColumnChanged(ROWCOL row, ROWCOL col) override { changed.emplace_back(row, col); }

    std::vector<std::pair<ROWCOL, ROWCOL>> changed;
};

// A decay grid of which columns 2 and 3 are boxes.
class ADecayGrid : public testing::Test {
protected:
    ADecayGrid() {
        grid.Create({.kind = kota::WindowKind::Grid});
        grid.Initialize();
        grid.SetOwnerPage(&page);
        grid.SetColCount(5);
        grid.SetRowCount(2);
        grid.SetStyleRange(CGXRange().SetCols(2, 3), CGXStyle().SetControl(GX_IDS_CTRL_CHECKBOX));
    }

    CountingPage page;
    CDecayGrid grid;
};

TEST_F(ADecayGrid, TellsItsPageOfItsGlobalBoxAlone) {
    EXPECT_EQ(grid.GetGlobalColumn(), 3U);
    EXPECT_TRUE(kota::grid::clickCell(grid, 1, 2));
    EXPECT_TRUE(page.changed.empty());
    EXPECT_TRUE(kota::grid::clickCell(grid, 2, 3));
    EXPECT_EQ(page.changed, (std::vector{std::make_pair(2U, 3U)}));
    grid.SetGlobalColumn(2);
    EXPECT_TRUE(kota::grid::clickCell(grid, 1, 2));
    EXPECT_EQ(page.changed.back(), std::make_pair(1U, 2U));
}

TEST_F(ADecayGrid, IsTheActiveOneOfItsPageOnceABoxWasClicked) {
    CGenGrid other;
    page.SetActiveGrid(&other);
    grid.OnClickedButtonRowCol(1, 2);
    EXPECT_EQ(page.GetActiveGrid(), &grid);
}

TEST_F(ADecayGrid, SearchesThePlaceBehindItsGlobalColumn) {
    grid.SetGlobalColumn(2);
    grid.SetValueRange(CGXRange(2, 1), 1);
    grid.SetValueRange(CGXRange(2, 3), "NILE");
    grid.SetValueRange(CGXRange(2, 4), "12");
    ROWCOL line = 0;
    grid.SearchNext(0, line, 1, "NILE", 12.0, 1, 1);
    EXPECT_EQ(line, 3U);
}

} // namespace
