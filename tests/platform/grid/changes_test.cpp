#include "tests/platform/grid/test_grid.h"

#include "platform/framework/turn.h"

namespace {

using testing::ElementsAre;
using testing::IsEmpty;
namespace user = kota::grid;

class Changes : public testing::Test {
protected:
    Changes() {
        grid.goTo(1, 1);
        grid.TakeChanges();
    }
    kota::GridChanges after(const std::function<void()>& action) {
        action();
        return grid.TakeChanges();
    }

    NotingScreen screen;
    TestGrid grid{9};
};

TEST_F(Changes, AreNoneOnceTheyAreTaken) {
    grid.write(1, 1, "x");
    grid.TakeChanges();

    const kota::GridChanges changes = grid.TakeChanges();

    EXPECT_FALSE(changes.layout || changes.current || changes.scroll || changes.selection ||
                 changes.editing || changes.warned);
    EXPECT_EQ(changes.cells.kind, CGXRange::Kind::None);
}

TEST_F(Changes, OfCellsAreTheSmallestRectangleAroundThem) {
    const kota::GridChanges changes = after([this] {
        grid.write(5, 2, "x");
        grid.write(3, 4, "x");
    });

    EXPECT_EQ(changes.cells, CGXRange(3, 2, 5, 4));
    EXPECT_FALSE(changes.layout);
}

TEST_F(Changes, OfARedrawAreItsCells) {
    EXPECT_EQ(after([this] { grid.RedrawRowCol(CGXRange().SetRows(3)); }).cells, CGXRange(3, 0, 3, 5));
}

TEST_F(Changes, OfLinesColumnsSizesAndColumnStylesAreTheLayout) {
    EXPECT_TRUE(after([this] { grid.InsertRows(1, 1); }).layout);
    EXPECT_TRUE(after([this] { grid.RemoveRows(1, 1); }).layout);
    EXPECT_TRUE(after([this] { grid.SetColCount(6); }).layout);
    EXPECT_TRUE(after([this] { grid.SetRowHeight(1, 1, 40); }).layout);
    EXPECT_TRUE(after([this] { grid.SetColWidth(1, 1, 40); }).layout);
    EXPECT_TRUE(after([this] { grid.SetFrozenRows(1, 1); }).layout);
    EXPECT_TRUE(after([this] { grid.SetCoveredCellsRowCol(1, 1, 1, 2); }).layout);
    EXPECT_TRUE(
        after([this] { grid.SetStyleRange(CGXRange().SetCols(1), CGXStyle().SetInterior(1)); }).layout);
    EXPECT_TRUE(after([this] { grid.Redraw(2, 1); }).layout);
    EXPECT_TRUE(after([this] { grid.Invalidate(); }).layout);
    EXPECT_FALSE(after([this] { grid.SetRowCount(9); }).layout);
}

TEST_F(Changes, OfTheCurrentCellAreBothPlaces) {
    const kota::GridChanges changes = after([this] { grid.SetCurrentCell(3, 2, GX_KEEPFOCUS); });

    EXPECT_TRUE(changes.current);
    EXPECT_FALSE(changes.scroll);
    EXPECT_EQ(changes.cells, CGXRange(1, 1, 3, 2));
}

TEST_F(Changes, BringTheCurrentCellIntoViewWhenItIsAskedFor) {
    EXPECT_TRUE(after([this] { grid.SetCurrentCell(3, 2, GX_SCROLLINVIEW); }).scroll);
    EXPECT_TRUE(after([this] { grid.SetCurrentCell(3, 2, GX_DISPLAYEDITWND | GX_KEEPFOCUS); }).scroll);
}

TEST_F(Changes, OfAnEditAreItsBeginEachTextAndItsEnd) {
    EXPECT_TRUE(after([this] { user::typeText(grid, "1"); }).editing);
    EXPECT_EQ(after([this] { user::typeText(grid, "12"); }).cells, CGXRange(1, 1));
    EXPECT_TRUE(after([this] { grid.RedrawRowCol(CGXRange(1, 1)); }).editing);
    EXPECT_TRUE(after([this] { user::commit(grid); }).editing);
}

TEST_F(Changes, OfTheSelectionAreToldOnlyWhenItChanges) {
    EXPECT_TRUE(after([this] { user::clickLineHeader(grid, 3); }).selection);
    EXPECT_FALSE(after([this] { user::clickLineHeader(grid, 3); }).selection);
    EXPECT_FALSE(after([this] { grid.RemoveRows(9, 9); }).selection);
    EXPECT_TRUE(after([this] { grid.RemoveRows(1, 1); }).selection);
}

TEST_F(Changes, AreToldToTheScreenOnceUntilItTakesThem) {
    screen.contents.clear();
    {
        const kota::Turn turn;
        grid.write(1, 1, "x");
        grid.write(2, 1, "x");
        EXPECT_THAT(screen.contents, IsEmpty());
    }
    EXPECT_THAT(screen.contents, ElementsAre(grid.GetSafeHwnd()));
    {
        const kota::Turn turn;
        grid.write(3, 1, "x");
    }
    EXPECT_EQ(screen.contents.size(), 1U);

    grid.TakeChanges();
    const kota::Turn turn;
    grid.write(3, 1, "x");
    kota::tellScreen();

    EXPECT_EQ(screen.contents.size(), 2U);
}

TEST_F(Changes, OfAGridWithoutAWindowAreToldByTheFirstThatHasOne) {
    grid.DestroyWindow();
    grid.write(1, 1, "x");
    { const kota::Turn turn; }
    screen.contents.clear();
    const kota::Turn turn;
    grid.Create({.kind = kota::WindowKind::Grid});

    grid.write(1, 1, "y");
    kota::tellScreen();

    EXPECT_THAT(screen.contents, ElementsAre(grid.GetSafeHwnd()));
}

} // namespace
