#include "tests/platform/grid/test_grid.h"

#include "platform/framework/input.h"

namespace {

using testing::ElementsAre;
using user = kota::grid::Selecting;
using kota::grid::clickCell;
using kota::grid::clickLineHeader;
using kota::grid::selectCells;
using kota::grid::typeText;

class Selection : public testing::Test {
protected:
    void select(ROWCOL first, ROWCOL last) {
        clickLineHeader(grid, first);
        clickLineHeader(grid, last, user::Extend);
        grid.calls.clear();
    }
    std::vector<ROWCOL> lines() const {
        std::vector<ROWCOL> rows{99};
        grid.GetSelectedRows(rows);
        return rows;
    }

    TestGrid grid{9};
};

TEST_F(Selection, OfALineIsMadeByItsHeader) {
    EXPECT_TRUE(clickLineHeader(grid, 3));

    EXPECT_EQ(grid.selected(), "rows 3-3");
    EXPECT_TRUE(grid.GetParam()->GetRangeList()->IsAnyCellFromCol(0));
    EXPECT_THAT(lines(), ElementsAre(3U));
    EXPECT_THAT(grid.calls, ElementsAre("SetCurrentCell 3 1 2", "OnChangedSelection"));
    EXPECT_EQ(CWnd::GetFocus(), &grid);
}

TEST_F(Selection, KeepsTheCurrentColumn) {
    grid.goTo(1, 4);
    clickLineHeader(grid, 3);
    EXPECT_EQ(grid.current(), "3,4");

    grid.goTo(1, 0);
    clickLineHeader(grid, 5);

    EXPECT_EQ(grid.current(), "5,0");
}

TEST_F(Selection, IsMadeAnewByAnotherHeader) {
    clickLineHeader(grid, 3);

    clickLineHeader(grid, 5);

    EXPECT_EQ(grid.selected(), "rows 5-5");
}

TEST_F(Selection, ExtendsFromTheLineThatWasClicked) {
    clickLineHeader(grid, 4);

    clickLineHeader(grid, 6, user::Extend);
    EXPECT_EQ(grid.selected(), "rows 4-6");
    clickLineHeader(grid, 2, user::Extend);

    EXPECT_EQ(grid.selected(), "rows 2-4");
    EXPECT_THAT(lines(), ElementsAre(2U, 3U, 4U));
}

TEST_F(Selection, ExtendsFromItsOwnLineWhenNoneWasClicked) {
    clickLineHeader(grid, 4, user::Extend);
    EXPECT_EQ(grid.selected(), "rows 4-4");

    clickLineHeader(grid, 5, user::Extend);

    EXPECT_EQ(grid.selected(), "rows 4-5");
}

TEST_F(Selection, GetsALineAddedOnce) {
    clickLineHeader(grid, 4);

    clickLineHeader(grid, 2, user::Add);
    clickLineHeader(grid, 4, user::Add);

    EXPECT_EQ(grid.selected(), "rows 4-4 rows 2-2");
    EXPECT_EQ(grid.GetParam()->GetRangeList()->GetCount(), 2);
    EXPECT_THAT(lines(), ElementsAre(2U, 4U));
}

TEST_F(Selection, IsNotMadeByHeadersThatAreNotThere) {
    grid.SetFrozenRows(1, 1);

    EXPECT_FALSE(clickLineHeader(grid, 0));
    EXPECT_FALSE(clickLineHeader(grid, 1));
    EXPECT_FALSE(clickLineHeader(grid, 10));

    EXPECT_EQ(grid.selected(), "");
    EXPECT_EQ(grid.current(), "none");
}

TEST_F(Selection, CommitsThePendingText) {
    grid.goTo(1, 1);
    typeText(grid, "typed");

    EXPECT_TRUE(clickLineHeader(grid, 3));

    EXPECT_EQ(grid.text(1, 1), "typed");
}

TEST_F(Selection, IsNotMadeWhenTheTextIsRefused) {
    grid.goTo(1, 1);
    typeText(grid, "bad");

    EXPECT_FALSE(clickLineHeader(grid, 3));
    EXPECT_FALSE(selectCells(grid, CGXRange(1, 1, 2, 2)));

    EXPECT_EQ(grid.selected(), "");
    EXPECT_EQ(grid.current(), "1,1");
}

TEST_F(Selection, OfCellsIsMadeByDragging) {
    EXPECT_TRUE(selectCells(grid, CGXRange(4, 3, 2, 1)));

    EXPECT_EQ(grid.selected(), "cells 2,1-4,3");
    EXPECT_THAT(grid.calls, ElementsAre("OnChangedSelection"));
    EXPECT_THAT(lines(), testing::IsEmpty());
}

TEST_F(Selection, OfCellsEndsWithTheGrid) {
    EXPECT_TRUE(selectCells(grid, CGXRange(8, 4, 20, 20)));
    EXPECT_EQ(grid.selected(), "cells 8,4-9,5");

    EXPECT_FALSE(selectCells(grid, CGXRange(10, 1, 12, 1)));
    EXPECT_FALSE(selectCells(grid, CGXRange()));

    EXPECT_EQ(grid.selected(), "cells 8,4-9,5");
}

TEST_F(Selection, GoesWithAClickOnACell) {
    select(2, 3);

    EXPECT_TRUE(clickCell(grid, 2, 1));

    EXPECT_EQ(grid.selected(), "");
    EXPECT_THAT(grid.calls, ElementsAre("SetCurrentCell 2 1 10", "OnChangedSelection"));
}

TEST_F(Selection, StaysWhenAClickIsRefused) {
    select(2, 3);
    typeText(grid, "bad");

    EXPECT_FALSE(clickCell(grid, 5, 1));

    EXPECT_EQ(grid.selected(), "rows 2-3");
}

TEST_F(Selection, GoesWhenAKeyMovesTheCurrentCell) {
    select(2, 3);

    kota::input::key(VK_F2);
    EXPECT_EQ(grid.selected(), "rows 2-3");
    kota::input::key(VK_DOWN);

    EXPECT_EQ(grid.selected(), "");
}

TEST_F(Selection, StaysWhenTheProgramMovesTheCurrentCell) {
    select(2, 3);

    grid.SetCurrentCell(7, 1);
    grid.MoveCurrentCell(GX_DOWN);

    EXPECT_EQ(grid.selected(), "rows 2-3");
}

TEST_F(Selection, GoesWithItsLines) {
    select(2, 3);

    grid.RemoveRows(2, 3);

    EXPECT_EQ(grid.selected(), "");
    EXPECT_THAT(grid.calls, testing::IsEmpty());
}

TEST_F(Selection, FollowsItsLines) {
    select(4, 6);

    grid.RemoveRows(1, 2);
    EXPECT_EQ(grid.selected(), "rows 2-4");
    grid.RemoveRows(4, 9);
    EXPECT_EQ(grid.selected(), "rows 2-3");
    grid.RemoveRows(2, 2);
    EXPECT_EQ(grid.selected(), "rows 2-2");
    grid.InsertRows(1, 3);
    EXPECT_EQ(grid.selected(), "rows 5-5");
    grid.InsertRows(6, 1);

    EXPECT_EQ(grid.selected(), "rows 5-5");
}

TEST_F(Selection, ShrinksByTheLinesInItThatGo) {
    select(3, 7);

    grid.RemoveRows(2, 4);
    EXPECT_EQ(grid.selected(), "rows 2-4");
    grid.RemoveRows(3, 3);

    EXPECT_EQ(grid.selected(), "rows 2-3");
}

TEST_F(Selection, NeverLiesBeyondTheLineCount) {
    select(4, 6);

    grid.SetRowCount(5);
    EXPECT_EQ(grid.selected(), "rows 4-5");
    grid.SetRowCount(2);

    EXPECT_EQ(grid.selected(), "");
}

TEST_F(Selection, OfCellsIsClippedToTheColumns) {
    selectCells(grid, CGXRange(1, 2, 2, 5));

    grid.SetColCount(3);
    EXPECT_EQ(grid.selected(), "cells 1,2-2,3");
    grid.SetColCount(1);

    EXPECT_EQ(grid.selected(), "");
}

TEST_F(Selection, DoesNotExtendFromALineThatIsGone) {
    clickLineHeader(grid, 4);
    grid.RemoveRows(4, 4);

    clickLineHeader(grid, 6, user::Extend);

    EXPECT_EQ(grid.selected(), "rows 6-6");
}

TEST_F(Selection, ExtendsFromALineThatMoved) {
    clickLineHeader(grid, 4);
    grid.InsertRows(1, 1);
    grid.RemoveRows(1, 3);

    clickLineHeader(grid, 3, user::Extend);

    EXPECT_EQ(grid.selected(), "rows 2-3");
}

} // namespace
