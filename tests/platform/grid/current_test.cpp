#include "tests/platform/grid/test_grid.h"

#include "platform/framework/input.h"

namespace {

using testing::ElementsAre;
using testing::IsEmpty;
namespace user = kota::grid;

class Current : public testing::Test {
protected:
    Current() { other.Create(); }

    TestGrid grid{30};
    CWnd other;
};

TEST_F(Current, IsNoneAtFirst) {
    EXPECT_EQ(grid.current(), "none");
    EXPECT_FALSE(grid.GetCurrentCell(nullptr, nullptr));
}

TEST_F(Current, StandsWhereTheProgramPutsIt) {
    EXPECT_TRUE(grid.SetCurrentCell(2, 1));
    EXPECT_EQ(grid.current(), "2,1");

    EXPECT_TRUE(grid.SetCurrentCell(3, 0, 2));
    EXPECT_EQ(grid.current(), "3,0");
    EXPECT_TRUE(grid.SetCurrentCell(31, 1, 10));
    EXPECT_EQ(grid.current(), "31,1");
    EXPECT_TRUE(grid.SetCurrentCell(0, 0, 10));
    EXPECT_EQ(grid.current(), "none");
}

TEST_F(Current, TakesTheFocusUnlessToldNotTo) {
    for (const UINT flags : {32U, 42U}) {
        other.SetFocus();
        grid.SetCurrentCell(1, 1, flags);
        EXPECT_EQ(CWnd::GetFocus(), &other) << flags;
    }
    for (const UINT flags : {0U, 2U, 8U, 10U, 11U, 24U, 26U}) {
        other.SetFocus();
        grid.SetCurrentCell(1, 1, flags);
        EXPECT_EQ(CWnd::GetFocus(), &grid) << flags;
    }
}

TEST_F(Current, OfNoneLeavesTheFocus) {
    other.SetFocus();

    grid.SetCurrentCell(0, 0, 10);

    EXPECT_EQ(CWnd::GetFocus(), &other);
}

TEST_F(Current, NeedsNoWindow) {
    grid.DestroyWindow();
    other.SetFocus();

    EXPECT_TRUE(grid.SetCurrentCell(1, 1));

    EXPECT_EQ(grid.current(), "1,1");
    EXPECT_EQ(CWnd::GetFocus(), &other);
}

TEST_F(Current, MayBeACellThatIsNotEnabledByTheProgramAlone) {
    grid.SetStyleRange(CGXRange(2, 1), CGXStyle().SetEnabled(FALSE));

    EXPECT_FALSE(user::clickCell(grid, 2, 1));
    EXPECT_EQ(grid.current(), "none");
    EXPECT_TRUE(grid.SetCurrentCell(2, 1));

    EXPECT_EQ(grid.current(), "2,1");
}

TEST_F(Current, MovesByAClick) {
    EXPECT_TRUE(user::clickCell(grid, 2, 1));

    EXPECT_THAT(grid.calls, ElementsAre("SetCurrentCell 2 1 10"));
    EXPECT_EQ(CWnd::GetFocus(), &grid);
}

TEST_F(Current, DoesNotMoveByAClickOnAHeaderOrBeyondTheCounts) {
    grid.SetFrozenRows(1, 1);

    EXPECT_FALSE(user::clickCell(grid, 0, 1));
    EXPECT_FALSE(user::clickCell(grid, 2, 0));
    EXPECT_FALSE(user::clickCell(grid, 1, 1));
    EXPECT_FALSE(user::clickCell(grid, 31, 1));
    EXPECT_FALSE(user::clickCell(grid, 2, 6));

    EXPECT_THAT(grid.calls, IsEmpty());
}

TEST_F(Current, IsTheFirstOfCoveredCells) {
    grid.SetCoveredCellsRowCol(2, 1, 3, 2);

    EXPECT_TRUE(user::clickCell(grid, 3, 2));

    EXPECT_EQ(grid.current(), "2,1");
}

struct Move {
    const char* name;
    std::pair<ROWCOL, ROWCOL> from;
    int direction;
    int count;
    const char* to; // "" when nothing moves
};

class Moving : public testing::TestWithParam<Move> {};

TEST_P(Moving, GoesThere) {
    TestGrid grid(30);
    grid.SetFrozenRows(1, 1);
    grid.goTo(GetParam().from.first, GetParam().from.second);
    const std::string before = grid.current();

    const BOOL moved = grid.MoveCurrentCell(GetParam().direction, GetParam().count);

    const std::string expected = GetParam().to;
    EXPECT_EQ(moved != 0, !expected.empty());
    EXPECT_EQ(grid.current(), expected.empty() ? before : expected);
    EXPECT_EQ(grid.calls.size(), expected.empty() ? 0U : 1U);
}

INSTANTIATE_TEST_SUITE_P(
    All, Moving,
    testing::Values(
        Move{"Up", {5, 3}, GX_UP, 1, "4,3"}, //
        Move{"UpByTwo", {5, 3}, GX_UP, 2, "3,3"}, Move{"UpFromTheTop", {2, 3}, GX_UP, 1, ""},
        Move{"UpNearTheTop", {3, 3}, GX_UP, 9, "2,3"}, Move{"Left", {5, 3}, GX_LEFT, 1, "5,2"},
        Move{"LeftFromTheFirst", {5, 1}, GX_LEFT, 1, ""}, Move{"Down", {5, 3}, GX_DOWN, 1, "6,3"},
        Move{"DownFromTheLast", {30, 3}, GX_DOWN, 1, ""}, Move{"Right", {5, 3}, GX_RIGHT, 1, "5,4"},
        Move{"RightFromTheLast", {5, 5}, GX_RIGHT, 1, ""}, Move{"PageUp", {15, 3}, GX_PAGEUP, 1, "5,3"},
        Move{"PageUpNearTheTop", {5, 3}, GX_PAGEUP, 1, "2,3"},
        Move{"PageDown", {15, 3}, GX_PAGEDOWN, 1, "25,3"},
        Move{"PageDownNearTheEnd", {25, 3}, GX_PAGEDOWN, 1, "30,3"}, Move{"Top", {15, 3}, GX_TOP, 1, "2,3"},
        Move{"Bottom", {15, 3}, GX_BOTTOM, 1, "30,3"}, Move{"MostLeft", {15, 3}, GX_MOSTLEFT, 1, "15,1"},
        Move{"MostRight", {15, 3}, GX_MOSTRIGHT, 1, "15,5"},
        Move{"BottomRight", {15, 3}, GX_BOTTOMRIGHT, 1, "30,5"},
        Move{"TopLeft", {15, 3}, GX_TOPLEFT, 1, "2,1"}, Move{"FromNone", {0, 0}, GX_RIGHT, 1, "2,2"},
        Move{"FromNoneToTheFirst", {0, 0}, GX_TOPLEFT, 1, "2,1"},
        Move{"FromALineHeader", {15, 0}, GX_RIGHT, 1, "15,1"},
        Move{"FromBeyondTheCount", {35, 3}, GX_UP, 1, "30,3"}, Move{"FromTheHeader", {1, 3}, GX_UP, 1, "2,3"},
        Move{"NoSteps", {5, 3}, GX_UP, 0, ""}, Move{"NoDirection", {5, 3}, 0, 1, ""},
        Move{"NoSuchDirection", {5, 3}, 13, 1, ""}),
    [](const auto& test) { return test.param.name; });

TEST_F(Current, MovesThroughSetCurrentCell) {
    grid.goTo(1, 1);

    grid.MoveCurrentCell(GX_DOWN);

    EXPECT_THAT(grid.calls, ElementsAre("SetCurrentCell 2 1 10"));
}

TEST_F(Current, DoesNotMoveInAnEmptyGrid) {
    grid.SetRowCount(0);

    for (int direction = GX_UP; direction <= GX_TOPLEFT; ++direction)
        EXPECT_FALSE(grid.MoveCurrentCell(direction));

    EXPECT_EQ(grid.current(), "none");
}

TEST_F(Current, MovesPastCellsThatAreNotEnabled) {
    grid.SetStyleRange(CGXRange(2, 1, 3, 1), CGXStyle().SetEnabled(FALSE));
    grid.SetStyleRange(CGXRange(30, 1), CGXStyle().SetEnabled(FALSE));
    grid.goTo(1, 1);

    EXPECT_TRUE(grid.MoveCurrentCell(GX_DOWN));
    EXPECT_EQ(grid.current(), "4,1");
    EXPECT_TRUE(grid.MoveCurrentCell(GX_BOTTOM));
    EXPECT_EQ(grid.current(), "29,1");
    EXPECT_FALSE(grid.MoveCurrentCell(GX_DOWN));
    EXPECT_EQ(grid.current(), "29,1");
}

TEST_F(Current, MovesOverCoveredCellsAsOverOne) {
    grid.SetCoveredCellsRowCol(2, 2, 4, 3);
    grid.goTo(3, 1);

    grid.MoveCurrentCell(GX_RIGHT);
    EXPECT_EQ(grid.current(), "2,2");
    grid.MoveCurrentCell(GX_RIGHT);
    EXPECT_EQ(grid.current(), "2,4");
    grid.goTo(2, 2);
    grid.MoveCurrentCell(GX_DOWN);
    EXPECT_EQ(grid.current(), "5,2");
}

TEST_F(Current, MovesByAsManyLinesAsAPageHolds) {
    grid.SetPageRows(4);
    grid.goTo(1, 1);

    grid.MoveCurrentCell(GX_PAGEDOWN, 2);

    EXPECT_EQ(grid.current(), "9,1");
}

TEST_F(Current, DoesNotMoveWhenTheTextIsRefused) {
    grid.goTo(1, 1);
    user::typeText(grid, "bad");

    EXPECT_FALSE(grid.MoveCurrentCell(GX_DOWN));

    EXPECT_EQ(grid.current(), "1,1");
}

class Keys : public Current {
protected:
    Keys() {
        grid.goTo(15, 3);
        grid.SetFocus();
        grid.calls.clear();
    }
};

TEST_F(Keys, MoveTheCurrentCell) {
    const auto press = [this](WPARAM key, bool control = false) {
        EXPECT_TRUE(kota::input::key(key, {.control = control})) << key;
        return grid.current();
    };

    EXPECT_EQ(press(VK_UP), "14,3");
    EXPECT_EQ(press(VK_LEFT), "14,2");
    EXPECT_EQ(press(VK_DOWN), "15,2");
    EXPECT_EQ(press(VK_RIGHT), "15,3");
    EXPECT_EQ(press(VK_PRIOR), "5,3");
    EXPECT_EQ(press(VK_NEXT), "15,3");
    EXPECT_EQ(press(VK_HOME), "15,1");
    EXPECT_EQ(press(VK_END), "15,5");
    EXPECT_EQ(press(VK_HOME, true), "1,1");
    EXPECT_EQ(press(VK_END, true), "30,5");
    EXPECT_EQ(press(VK_UP, true), "1,5");
    EXPECT_EQ(press(VK_UP), "1,5");
}

TEST_F(Keys, ThatTheGridDoesNotKnowAreNotTaken) {
    EXPECT_FALSE(kota::input::key(VK_TAB));
    EXPECT_FALSE(kota::input::key(VK_RETURN));
    EXPECT_FALSE(kota::input::key(VK_ESCAPE));
    EXPECT_FALSE(grid.ProcessKeys(&grid, WM_SETFOCUS, VK_UP, 1, 0));

    EXPECT_THAT(grid.calls, IsEmpty());
}

TEST_F(Keys, EndTheEditByEscape) {
    grid.goTo(1, 1);
    user::typeText(grid, "typed");

    EXPECT_TRUE(kota::input::key(VK_ESCAPE));

    EXPECT_FALSE(grid.IsEditing());
    EXPECT_FALSE(kota::input::key(VK_ESCAPE));
}

TEST_F(Keys, DoNothingWhileTheGridIsDisabled) {
    grid.EnableWindow(FALSE);

    EXPECT_EQ(grid.SendMessage(WM_KEYDOWN, VK_UP), 0);

    EXPECT_EQ(grid.current(), "15,3");
}

class AskedGrid : public TestGrid {
public:
    using TestGrid::TestGrid;
    BOOL ProcessKeys(CWnd* window, UINT message, UINT key, UINT repeat, UINT flags) override {
        asked.push_back({window, message, key, repeat, flags});
        return taken;
    }

    struct Asked {
        CWnd* window;
        UINT message;
        UINT key;
        UINT repeat;
        UINT flags;
        friend bool operator==(const Asked&, const Asked&) = default;
    };
    std::vector<Asked> asked;
    BOOL taken = TRUE;
};

TEST(KeysOfADerivedGrid, GoToItsProcessKeys) {
    AskedGrid grid(4);

    EXPECT_EQ(grid.SendMessage(WM_KEYDOWN, VK_F7), 1);
    grid.taken = FALSE;
    EXPECT_EQ(grid.SendMessage(WM_KEYDOWN, VK_DELETE), 0);

    EXPECT_THAT(grid.asked, ElementsAre(AskedGrid::Asked{&grid, WM_KEYDOWN, VK_F7, 1, 0},
                                        AskedGrid::Asked{&grid, WM_KEYDOWN, VK_DELETE, 1, 0}));
}

TEST(TheFocus, IsToldToTheGrid) {
    TestGrid grid;
    CWnd other;
    other.Create();
    std::vector<bool> told;
    grid.onActivate = [&told](bool active) { told.push_back(active); };

    grid.SetFocus();
    other.SetFocus();

    EXPECT_THAT(told, ElementsAre(true, false));
}

} // namespace
