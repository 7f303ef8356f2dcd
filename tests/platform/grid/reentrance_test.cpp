#include "tests/platform/grid/test_grid.h"

#include "platform/framework/exception.h"
#include "platform/framework/input.h"

namespace {

using testing::ElementsAre;
namespace user = kota::grid;

// What happens in the grid while it calls out.
class Reentrance : public testing::Test {
protected:
    Reentrance() {
        grid.write(1, 1, "stored");
        grid.goTo(1, 1);
    }

    TestGrid grid;
};

TEST_F(Reentrance, OfOnModifyCellMayRemoveTheLine) {
    grid.onModify = [&](ROWCOL row, ROWCOL) { grid.RemoveRows(row, row); };

    EXPECT_TRUE(user::typeText(grid, "typed"));

    EXPECT_FALSE(grid.IsEditing());
    EXPECT_EQ(grid.GetRowCount(), 3U);
    EXPECT_EQ(grid.text(1, 1), "");
}

TEST_F(Reentrance, OfOnModifyCellMayCommit) {
    grid.onModify = [&](ROWCOL row, ROWCOL col) { grid.SetCurrentCell(row + 1, col); };

    EXPECT_TRUE(user::typeText(grid, "typed"));

    EXPECT_EQ(grid.text(1, 1), "typed");
    EXPECT_EQ(grid.current(), "2,1");
}

TEST_F(Reentrance, OfOnModifyCellMayDestroyTheWindow) {
    grid.onModify = [&](ROWCOL, ROWCOL) { grid.DestroyWindow(); };

    EXPECT_TRUE(user::typeText(grid, "typed"));

    EXPECT_FALSE(user::typeText(grid, "more"));
    EXPECT_FALSE(user::clickCell(grid, 2, 1));
}

TEST_F(Reentrance, OfOnModifyCellMayReloadTheEdit) {
    grid.onModify = [&](ROWCOL row, ROWCOL col) { grid.RedrawRowCol(CGXRange(row, col)); };

    user::typeText(grid, "typed");

    EXPECT_EQ(grid.shown(1, 1), "stored");
    EXPECT_FALSE(grid.IsEditPending());
}

TEST_F(Reentrance, OfACheckBoxMayRemoveItsLine) {
    grid.onModify = [&](ROWCOL, ROWCOL) { grid.SetRowCount(0); };

    EXPECT_TRUE(user::clickCell(grid, 2, 3));

    EXPECT_THAT(grid.calls, ElementsAre("SetCurrentCell 2 3 10", "OnModifyCell 2 3"));
}

TEST_F(Reentrance, OfACheckBoxMayDestroyTheWindow) {
    grid.onModify = [&](ROWCOL, ROWCOL) { grid.DestroyWindow(); };

    EXPECT_TRUE(user::clickCell(grid, 2, 3));

    EXPECT_THAT(grid.calls, ElementsAre("SetCurrentCell 2 3 10", "OnModifyCell 2 3"));
}

TEST_F(Reentrance, OfOnStartEditingMayRemoveTheLine) {
    grid.onStart = [&](ROWCOL, ROWCOL) { return grid.SetRowCount(0); };

    EXPECT_FALSE(user::typeText(grid, "typed"));

    EXPECT_FALSE(grid.IsEditing());
}

TEST_F(Reentrance, OfOnStartEditingMayMoveOn) {
    grid.onStart = [&](ROWCOL, ROWCOL) { return grid.SetCurrentCell(2, 1); };

    EXPECT_FALSE(user::typeText(grid, "typed"));

    EXPECT_FALSE(grid.IsEditing());
    EXPECT_EQ(grid.current(), "2,1");
}

TEST_F(Reentrance, OfOnStartEditingMayMakeTheCellReadOnly) {
    grid.onStart = [&](ROWCOL row, ROWCOL col) {
        return grid.SetStyleRange(CGXRange(row, col), CGXStyle().SetReadOnly(TRUE));
    };

    EXPECT_FALSE(user::typeText(grid, "typed"));

    EXPECT_FALSE(grid.IsEditing());
}

TEST_F(Reentrance, OfOnStartEditingMayDestroyTheWindow) {
    grid.onStart = [&](ROWCOL, ROWCOL) { return grid.DestroyWindow(); };

    EXPECT_FALSE(user::typeText(grid, "typed"));

    EXPECT_FALSE(grid.IsEditing());
}

TEST_F(Reentrance, OfSetCurrentCellCommitsOnce) {
    user::typeText(grid, "typed");
    int depth = 0;
    grid.afterSetCurrent = [&] {
        if (++depth == 1)
            grid.SetCurrentCell(3, 1);
    };

    EXPECT_TRUE(grid.SetCurrentCell(2, 1));

    EXPECT_EQ(grid.edit->validations, 1);
    EXPECT_EQ(grid.text(1, 1), "typed");
    EXPECT_EQ(grid.current(), "3,1");
}

TEST_F(Reentrance, OfSetCurrentCellThatMovesOnElsewhereLeavesTheCheckBox) {
    int depth = 0;
    grid.afterSetCurrent = [&] {
        if (++depth == 1)
            grid.SetCurrentCell(4, 1);
    };

    EXPECT_FALSE(user::clickCell(grid, 2, 3));

    EXPECT_EQ(grid.text(2, 3), "");
    EXPECT_EQ(grid.text(4, 1), "");
}

TEST_F(Reentrance, OfSetCurrentCellMayRemoveTheLines) {
    grid.afterSetCurrent = [&] { grid.SetRowCount(1); };

    EXPECT_FALSE(user::clickCell(grid, 2, 3));

    EXPECT_THAT(grid.calls, ElementsAre("SetCurrentCell 2 3 10"));
    EXPECT_EQ(grid.current(), "2,3");
}

TEST_F(Reentrance, OfSetCurrentCellThatRemovesTheClickedLineSelectsNothing) {
    grid.afterSetCurrent = [&] { grid.SetRowCount(1); };

    EXPECT_FALSE(user::clickLineHeader(grid, 4));

    EXPECT_EQ(grid.selected(), "");
}

TEST_F(Reentrance, OfSetCurrentCellMayDestroyTheWindow) {
    grid.afterSetCurrent = [&] { grid.DestroyWindow(); };

    EXPECT_FALSE(user::clickCell(grid, 2, 3));

    EXPECT_EQ(grid.text(2, 3), "");
}

TEST_F(Reentrance, OfALossOfFocusMayDestroyTheWindow) {
    CWnd other;
    other.Create();
    grid.SetFocus();
    user::typeText(grid, "typed");
    grid.afterSetCurrent = [&] { grid.DestroyWindow(); };

    other.SetFocus();

    EXPECT_EQ(CWnd::GetFocus(), &other);
    EXPECT_EQ(grid.text(1, 1), "typed");
}

TEST_F(Reentrance, OfALossOfFocusMayRefillTheGrid) {
    CWnd other;
    other.Create();
    grid.SetFocus();
    user::typeText(grid, "typed");
    std::string stored;
    grid.afterSetCurrent = [&] {
        stored = grid.text(1, 1);
        grid.SetRowCount(0);
        grid.SetRowCount(2);
        grid.write(1, 1, "filled");
    };

    other.SetFocus();

    EXPECT_EQ(stored, "typed");
    EXPECT_EQ(grid.text(1, 1), "filled");
    EXPECT_EQ(CWnd::GetFocus(), &other);
}

TEST_F(Reentrance, OfTheValidationCannotCommitTwice) {
    user::typeText(grid, "typed");
    BOOL within = TRUE;
    grid.edit->onValidate = [&] { within = grid.SetCurrentCell(3, 1); };

    EXPECT_TRUE(grid.SetCurrentCell(2, 1));

    EXPECT_FALSE(within);
    EXPECT_EQ(grid.edit->validations, 1);
    EXPECT_EQ(grid.current(), "2,1");
    EXPECT_EQ(grid.text(1, 1), "typed");
}

TEST_F(Reentrance, OfTheValidationMayRemoveTheLine) {
    grid.write(2, 1, "second");
    user::typeText(grid, "bad");
    grid.edit->onValidate = [&] { grid.RemoveRows(1, 1); };

    EXPECT_TRUE(grid.SetCurrentCell(2, 1));

    EXPECT_EQ(grid.text(1, 1), "second");
    EXPECT_TRUE(grid.Warning().text.IsEmpty());
}

TEST_F(Reentrance, OfTheValidationMayReloadTheEdit) {
    grid.edit->tail = "!";
    grid.edit->onValidate = [&] { grid.RedrawRowCol(CGXRange(1, 1)); };
    for (const char* text : {"bad", "good"}) {
        grid.SetCurrentCell(1, 1);
        user::typeText(grid, text);

        EXPECT_TRUE(grid.SetCurrentCell(2, 1));

        EXPECT_EQ(grid.text(1, 1), "stored");
        EXPECT_FALSE(grid.IsEditing());
    }
}

TEST_F(Reentrance, OfTheValidationMayReplaceItsControl) {
    user::typeText(grid, "bad");
    grid.edit->onValidate = [&] {
        grid.RegisterControl(TestGrid::checkedEdit, std::make_unique<CheckedEdit>(&grid));
    };

    EXPECT_TRUE(grid.SetCurrentCell(2, 1));

    EXPECT_EQ(grid.text(1, 1), "stored");
}

TEST_F(Reentrance, OfAControlMayRemoveTheLine) {
    grid.edit->onTake = [&] { grid.RemoveRows(1, 1); };

    EXPECT_TRUE(user::typeText(grid, "typed"));

    EXPECT_THAT(grid.calls, ElementsAre("OnStartEditing 1 1"));
    EXPECT_FALSE(grid.IsEditing());
}

TEST_F(Reentrance, OfTheSelectionMayMoveOnFromACheckBox) {
    user::clickLineHeader(grid, 1);
    grid.onSelection = [&] { grid.SetCurrentCell(4, 3); };

    EXPECT_TRUE(user::clickCell(grid, 2, 3));

    EXPECT_EQ(grid.text(2, 3), "");
    EXPECT_EQ(grid.text(4, 3), "");
}

TEST_F(Reentrance, OfTheFocusMayDisableTheGrid) {
    grid.onActivate = [&](bool) { grid.EnableWindow(FALSE); };

    EXPECT_FALSE(user::clickCell(grid, 2, 3));

    EXPECT_EQ(grid.text(2, 3), "");
    EXPECT_EQ(grid.current(), "1,1");
}

TEST_F(Reentrance, OfAFailedValidationLeavesTheEditAsItWas) {
    user::typeText(grid, "typed");
    grid.edit->onValidate = [] { AfxThrowInvalidArgException("validation"); };
    EXPECT_THROW(grid.SetCurrentCell(2, 1), CInvalidArgException);
    EXPECT_TRUE(grid.IsEditPending());

    grid.edit->onValidate = nullptr;

    EXPECT_TRUE(grid.SetCurrentCell(2, 1));
    EXPECT_EQ(grid.text(1, 1), "typed");
}

class UserInput : public Reentrance {
protected:
    NotingScreen screen;
};

TEST_F(UserInput, IsNotTakenWhileTheGridOrAWindowAroundItIsDisabledOrHidden) {
    CWnd around;
    around.Create();
    TestGrid inner;
    inner.DestroyWindow();
    inner.Create({.parent = around.GetSafeHwnd(), .kind = kota::WindowKind::Grid});
    inner.goTo(1, 1);
    const auto takesAny = [&inner] {
        return user::clickCell(inner, 1, 3) || user::clickLineHeader(inner, 1) ||
               user::selectCells(inner, CGXRange(1, 1)) || user::typeText(inner, "x") ||
               user::chooseEntry(inner, 0) || user::toggle(inner) || user::commit(inner);
    };

    inner.EnableWindow(FALSE);
    EXPECT_FALSE(takesAny());
    inner.EnableWindow(TRUE);
    around.EnableWindow(FALSE);
    EXPECT_FALSE(takesAny());
    user::dropDown(inner, true);
    EXPECT_FALSE(inner.IsEditing());
    around.EnableWindow(TRUE);
    around.ShowWindow(FALSE);
    EXPECT_FALSE(takesAny());
    around.ShowWindow(TRUE);

    EXPECT_EQ(inner.text(1, 3), "");
    EXPECT_EQ(inner.selected(), "");
    EXPECT_TRUE(user::clickCell(inner, 1, 3));
}

TEST_F(UserInput, ThatFailsIsToldAndGivesFalse) {
    grid.onModify = [](ROWCOL, ROWCOL) { AfxThrowInvalidArgException("GetNext"); };

    EXPECT_FALSE(user::typeText(grid, "typed"));

    EXPECT_THAT(screen.boxes, ElementsAre(testing::HasSubstr("GetNext")));
    grid.onModify = nullptr;
    EXPECT_TRUE(user::typeText(grid, "typed on"));
}

TEST_F(UserInput, OfNoTextIsAnEmptyOne) {
    EXPECT_TRUE(user::typeText(grid, nullptr));
    EXPECT_TRUE(user::commit(grid));

    EXPECT_EQ(grid.text(1, 1), "");
}

TEST_F(UserInput, IsOneTurn) {
    screen.contents.clear();
    grid.TakeChanges();

    user::clickCell(grid, 2, 3);

    EXPECT_THAT(screen.contents, ElementsAre(grid.GetSafeHwnd()));
}

} // namespace
