#include "editing/base/gen_grid.h"
#include "editing/base/gen_property_page.h"
#include "editing/base/grid_owner.h"
#include "platform/framework/input.h"
#include "platform/grid/user.h"

#include <gmock/gmock.h>

namespace {

using testing::ElementsAre;
using testing::IsEmpty;

// A window around a grid that writes down what the grid tells it.
class NotingOwner : public CWnd, public GridOwner {
public:
    void GetRiverChoiceList(CString& out) override { out = rivers.c_str(); }
    void OnGridRowChanged(ROWCOL row) override { calls.push_back("row " + std::to_string(row)); }
    void OnGridCellEdited(ROWCOL column) override { calls.push_back("edited " + std::to_string(column)); }
    void OnGridInsertLine() override {
        calls.emplace_back("insert");
        if (grid)
            grid->InsertLine();
    }
    void OnGridDeleteLine() override { calls.emplace_back("delete"); }
    void OnGridSearch() override { calls.emplace_back("search"); }
    void OnGridFindNext() override { calls.emplace_back("find next"); }

    std::string rivers;
    std::vector<std::string> calls;
    CGenGrid* grid = nullptr; // what a line is inserted into
};

// A grid of four lines, numbered in column 1, and of three columns.
class AGenGrid : public testing::Test {
protected:
    explicit AGenGrid(ROWCOL riverColumn = 0) {
        owner.Create();
        grid.Create({.parent = owner.GetSafeHwnd(), .kind = kota::WindowKind::Grid});
        grid.Initialize();
        grid.SetOwnerPage(&page);
        grid.SetRowCount(4);
        grid.SetColCount(3);
        grid.SetRiverColumn(riverColumn);
        grid.SetupGrid();
        for (ROWCOL row = 1; row <= 4; ++row)
            grid.SetValueRange(CGXRange(row, 1), static_cast<int>(row));
    }

    std::string lines() {
        std::string all;
        for (ROWCOL row = 1; row <= grid.GetRowCount(); ++row)
            all += grid.CellText(row, 1).empty() ? "-" : std::string(grid.CellText(row, 1));
        return all;
    }
    std::pair<ROWCOL, ROWCOL> cursor() {
        ROWCOL row = 0;
        ROWCOL col = 0;
        grid.GetCurrentCell(&row, &col);
        return {row, col};
    }
    void select(ROWCOL first, ROWCOL last) {
        EXPECT_TRUE(kota::grid::clickLineHeader(grid, first));
        EXPECT_TRUE(kota::grid::clickLineHeader(grid, last, kota::grid::Selecting::Extend));
    }

    CGenPropertyPage page;
    NotingOwner owner;
    CGenGrid grid;
};

TEST_F(AGenGrid, AddsALineAtTheEndWhateverIsSelectedAndGoesToIt) {
    select(2, 2);
    grid.InsertLine();
    EXPECT_EQ(lines(), "1234-");
    EXPECT_EQ(cursor(), std::make_pair(5U, 1U));
}

TEST_F(AGenGrid, AddsALineAtTheLeftmostColumnInView) {
    grid.SetLeftCol(2);
    grid.InsertLine();
    EXPECT_EQ(cursor(), std::make_pair(5U, 2U));
}

TEST_F(AGenGrid, DeletesOneRangeOfWholeLines) {
    select(2, 3);
    grid.DeleteSelectedLines();
    EXPECT_EQ(lines(), "14");
}

TEST_F(AGenGrid, DeletesAllLinesWhenAllIsSelected) {
    grid.GetParam()->GetRangeList()->Add(CGXRange().SetTable());
    grid.DeleteSelectedLines();
    EXPECT_EQ(grid.GetRowCount(), 0U);
}

TEST_F(AGenGrid, DeletesNothingWithoutAWholeLine) {
    grid.SetCurrentCell(2, 1);
    grid.DeleteSelectedLines();
    EXPECT_TRUE(kota::grid::selectCells(grid, CGXRange(1, 1, 4, 3)));
    grid.DeleteSelectedLines();
    grid.GetParam()->GetRangeList()->Clear();
    grid.GetParam()->GetRangeList()->Add(CGXRange().SetCols(1, 3));
    grid.DeleteSelectedLines();
    EXPECT_EQ(lines(), "1234");
}

TEST_F(AGenGrid, DeletesNothingForTwoSeparateRanges) {
    select(1, 2);
    EXPECT_TRUE(kota::grid::clickLineHeader(grid, 4, kota::grid::Selecting::Add));
    grid.DeleteSelectedLines();
    EXPECT_EQ(lines(), "1234");
}

TEST_F(AGenGrid, GoesToALineOrToTheLastOne) {
    grid.GotoGridLine(3);
    EXPECT_EQ(cursor(), std::make_pair(3U, 1U));
    grid.GotoGridLine(99);
    EXPECT_EQ(cursor(), std::make_pair(4U, 1U));
}

TEST_F(AGenGrid, ReportsALineOnceAndNoneNever) {
    grid.SetCurrentCell(2, 1);
    grid.SetCurrentCell(2, 3);
    grid.SetCurrentCell(0, 0);
    grid.SetCurrentCell(2, 1);
    EXPECT_THAT(owner.calls, ElementsAre("row 2", "row 2"));
}

TEST_F(AGenGrid, ReportsAnEditWhenTheCellIsLeftByTheColumnThatIsEntered) {
    EXPECT_TRUE(kota::grid::clickCell(grid, 1, 1));
    EXPECT_TRUE(kota::grid::typeText(grid, "x"));
    EXPECT_TRUE(kota::grid::typeText(grid, "xy"));
    EXPECT_THAT(owner.calls, ElementsAre("row 1")) << "not at each key";
    owner.calls.clear();
    EXPECT_TRUE(kota::grid::clickCell(grid, 2, 3));
    EXPECT_THAT(owner.calls, ElementsAre("edited 3", "row 2"));
    EXPECT_EQ(lines(), "xy234");
    owner.calls.clear();
    EXPECT_TRUE(kota::grid::clickCell(grid, 2, 1));
    EXPECT_THAT(owner.calls, IsEmpty()) << "an edit is reported once";
}

TEST_F(AGenGrid, IsTheActiveGridOfItsPageOnceItTookTheCurrentCell) {
    EXPECT_EQ(page.GetActiveGrid(), nullptr);
    grid.SetCurrentCell(1, 1);
    EXPECT_EQ(page.GetActiveGrid(), &grid);
}

TEST_F(AGenGrid, NumbersItsLinesBehindTheHeadersItself) {
    grid.SetFrozenRows(1, 1);
    grid.GetParam()->SetNumberedRowHeaders(FALSE);
    EXPECT_EQ(grid.GetValueRowCol(1, 0), "");
    EXPECT_EQ(grid.GetValueRowCol(2, 0), "1");
    EXPECT_EQ(grid.GetValueRowCol(4, 0), "3");
    CGXStyle style;
    grid.ComposeStyleRowCol(3, 0, &style);
    EXPECT_EQ(style.GetValue(), "2");
}

TEST_F(AGenGrid, DoesNotLetColumnsAndLinesBeMoved) {
    EXPECT_FALSE(grid.GetParam()->CanMoveCols());
    EXPECT_FALSE(grid.GetParam()->CanMoveRows());
}

struct Key {
    WPARAM key;
    const char* call;
};

class AKeyOfAGenGrid : public AGenGrid, public testing::WithParamInterface<Key> {};

TEST_P(AKeyOfAGenGrid, IsTheViews) {
    constexpr UINT keyUp = WM_KEYDOWN + 1;
    grid.SetCurrentCell(1, 1);
    owner.calls.clear();
    EXPECT_TRUE(kota::input::key(GetParam().key));
    EXPECT_THAT(owner.calls, ElementsAre(GetParam().call));
    EXPECT_FALSE(grid.ProcessKeys(&grid, keyUp, static_cast<UINT>(GetParam().key), 1, 0))
        << "when it goes down, and not when it comes up";
    EXPECT_THAT(owner.calls, ElementsAre(GetParam().call));
}

INSTANTIATE_TEST_SUITE_P(ByKey, AKeyOfAGenGrid,
                         testing::Values(Key{VK_INSERT, "insert"}, Key{VK_DELETE, "delete"},
                                         Key{VK_F7, "search"}, Key{VK_F3, "find next"}));

TEST_F(AGenGrid, StartsFromTheFirstCellWhenNoneIsCurrent) {
    grid.SetFocus();
    EXPECT_EQ(cursor(), std::make_pair(0U, 0U));
    EXPECT_TRUE(kota::input::key(VK_TAB));
    EXPECT_EQ(cursor(), std::make_pair(1U, 2U));
}

TEST_F(AGenGrid, GoesToItsTopLeftCellByShiftTabWhenNoneIsCurrent) {
    grid.SetFocus();
    EXPECT_TRUE(kota::input::key(VK_TAB, {.shift = true}));
    EXPECT_EQ(cursor(), std::make_pair(1U, 1U));
}

TEST_F(AGenGrid, GoesOnInTheLineThatItsLastCellHadAdded) {
    owner.grid = &grid;
    grid.SetCurrentCell(4, 3);
    EXPECT_TRUE(kota::input::key(VK_RETURN));
    EXPECT_EQ(lines(), "1234-");
    EXPECT_EQ(cursor(), std::make_pair(5U, 1U));
}

class AGenGridOfRivers : public AGenGrid {
protected:
    AGenGridOfRivers() : AGenGrid(2) { owner.rivers = "NILE\nRHINE"; }

    CGXStyle styleOf(ROWCOL row, ROWCOL col) {
        CGXStyle style;
        grid.ComposeStyleRowCol(row, col, &style);
        return style;
    }
};

TEST_F(AGenGridOfRivers, OffersThemInItsRiverColumnAlone) {
    EXPECT_EQ(styleOf(3, 2).GetControl(), 52517U);
    EXPECT_EQ(styleOf(3, 1).GetControl(), GX_IDS_CTRL_EDIT);
    EXPECT_EQ(grid.GetParam()->GetDefaultComboBoxHeight(), 500);
    EXPECT_TRUE(grid.OnStartEditing(1, 1));
    EXPECT_EQ(styleOf(3, 2).GetChoiceList(), "");
    EXPECT_TRUE(grid.OnStartEditing(1, 2));
    EXPECT_EQ(styleOf(3, 2).GetChoiceList(), "NILE\nRHINE");
    EXPECT_EQ(styleOf(3, 1).GetChoiceList(), "");
}

TEST_F(AGenGridOfRivers, KeepsItsChoicesWhenThereAreNone) {
    EXPECT_TRUE(grid.OnStartEditing(1, 2));
    owner.rivers.clear();
    EXPECT_TRUE(grid.OnStartEditing(1, 2));
    EXPECT_EQ(styleOf(3, 2).GetChoiceList(), "NILE\nRHINE");
}

} // namespace
