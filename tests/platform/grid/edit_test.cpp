#include "tests/platform/grid/test_grid.h"

namespace {

using testing::ElementsAre;
using testing::IsEmpty;
namespace user = kota::grid;

class Edit : public testing::Test {
protected:
    Edit() {
        grid.write(1, 1, "stored");
        grid.goTo(1, 1);
    }

    TestGrid grid;
};

TEST_F(Edit, KeepsTheTypedTextApartFromTheStoredValue) {
    EXPECT_TRUE(user::typeText(grid, "typed"));

    EXPECT_EQ(grid.text(1, 1), "stored");
    EXPECT_EQ(grid.shown(1, 1), "typed");
    EXPECT_EQ(grid.GetControl(1, 1)->GetCurrentText(), "typed");
    EXPECT_TRUE(grid.IsEditing());
    EXPECT_TRUE(grid.IsEditPending());
}

TEST_F(Edit, TellsEachChangeOfTheText) {
    user::typeText(grid, "1");
    user::typeText(grid, "12");
    user::typeText(grid, "12");

    EXPECT_THAT(grid.calls, ElementsAre("OnStartEditing 1 1", "OnModifyCell 1 1", "OnModifyCell 1 1",
                                        "OnModifyCell 1 1"));
}

TEST_F(Edit, LeavesTheTypedTextAloneWhenTheProgramWrites) {
    user::typeText(grid, "typed");

    grid.write(1, 1, "program");

    EXPECT_EQ(grid.text(1, 1), "program");
    EXPECT_EQ(grid.shown(1, 1), "typed");
    EXPECT_TRUE(grid.IsEditPending());
}

TEST_F(Edit, IsLoadedAnewFromTheStoredValueByARedraw) {
    user::typeText(grid, "typed");
    grid.write(1, 1, "program");

    grid.RedrawRowCol(CGXRange(1, 1));

    EXPECT_EQ(grid.shown(1, 1), "program");
    EXPECT_FALSE(grid.IsEditPending());
    EXPECT_TRUE(grid.IsEditing());
    grid.SetCurrentCell(2, 1);
    EXPECT_EQ(grid.text(1, 1), "program");
    EXPECT_EQ(grid.edit->validations, 0);
}

TEST_F(Edit, IsLeftAloneByARedrawOfOtherCells) {
    user::typeText(grid, "typed");

    grid.RedrawRowCol(CGXRange(1, 2));
    grid.RedrawRowCol(CGXRange().SetRows(2));
    grid.RedrawRowCol(CGXRange().SetCols(2));

    EXPECT_EQ(grid.shown(1, 1), "typed");
    grid.RedrawRowCol(CGXRange().SetRows(1));
    EXPECT_EQ(grid.shown(1, 1), "stored");
}

TEST_F(Edit, IsTakenBack) {
    user::typeText(grid, "typed");
    user::typeText(grid, "typed on");

    grid.CancelEdit();

    EXPECT_FALSE(grid.IsEditing());
    EXPECT_EQ(grid.shown(1, 1), "stored");
    EXPECT_EQ(grid.text(1, 1), "stored");
}

TEST_F(Edit, TellsTheTextFromBeforeWhenItIsTakenBack) {
    // Writes what is typed into the cell at once, as a form beside the grid does.
    grid.onModify = [&](ROWCOL row, ROWCOL col) {
        grid.SetValueRange(CGXRange(row, col), grid.GetControl(row, col)->GetCurrentText());
    };
    user::typeText(grid, "typed");
    EXPECT_EQ(grid.text(1, 1), "typed");

    grid.CancelEdit();

    EXPECT_EQ(grid.text(1, 1), "stored");
    EXPECT_EQ(grid.edit->validations, 0);
}

TEST_F(Edit, IsTakenBackToTheTextThatARedrawLoaded) {
    user::typeText(grid, "typed");
    grid.write(1, 1, "program");
    grid.RedrawRowCol(CGXRange(1, 1));
    user::typeText(grid, "typed again");
    std::string told;
    grid.onModify = [&](ROWCOL row, ROWCOL col) {
        told = grid.GetControl(row, col)->GetCurrentText().View();
    };

    grid.CancelEdit();

    EXPECT_EQ(told, "program");
}

TEST_F(Edit, ThatDidNotChangeTheTextTellsNothingWhenItIsTakenBack) {
    grid.ProcessKeys(&grid, WM_KEYDOWN, VK_F2, 1, 0);
    grid.calls.clear();

    grid.CancelEdit();
    grid.CancelEdit();

    EXPECT_FALSE(grid.IsEditing());
    EXPECT_THAT(grid.calls, IsEmpty());
}

TEST_F(Edit, DoesNotBeginInAReadOnlyCell) {
    grid.SetStyleRange(CGXRange(1, 1), CGXStyle().SetReadOnly(TRUE));

    EXPECT_FALSE(user::typeText(grid, "typed"));

    EXPECT_THAT(grid.calls, IsEmpty());
    EXPECT_EQ(grid.shown(1, 1), "stored");
}

TEST_F(Edit, BeginsInAReadOnlyCellWhileTheLockIsOff) {
    grid.SetStyleRange(CGXRange(1, 1), CGXStyle().SetReadOnly(TRUE));

    grid.GetParam()->SetLockReadOnly(FALSE);

    EXPECT_TRUE(user::typeText(grid, "typed"));
}

TEST_F(Edit, GoesNoFurtherOnceTheCellIsReadOnly) {
    user::typeText(grid, "typed");
    grid.SetStyleRange(CGXRange(1, 1), CGXStyle().SetReadOnly(TRUE));

    EXPECT_FALSE(user::typeText(grid, "typed on"));

    EXPECT_EQ(grid.shown(1, 1), "typed");
}

TEST_F(Edit, DoesNotBeginInACellThatIsNotEnabled) {
    grid.SetStyleRange(CGXRange(1, 1), CGXStyle().SetEnabled(FALSE));

    EXPECT_FALSE(user::typeText(grid, "typed"));

    EXPECT_THAT(grid.calls, IsEmpty());
}

TEST_F(Edit, BeginsInNoHeaderAndNowhereBeyondTheCounts) {
    grid.SetFrozenRows(1, 1);
    EXPECT_FALSE(user::typeText(grid, "in the header line of the data"));
    for (const auto& [row, col] : {std::pair(0U, 0U), {2U, 0U}, {0U, 1U}, {5U, 1U}, {2U, 6U}}) {
        grid.goTo(row, col);
        EXPECT_FALSE(user::typeText(grid, "typed")) << row << "," << col;
    }

    EXPECT_THAT(grid.calls, testing::Not(testing::Contains(testing::StartsWith("OnStartEditing"))));
    grid.goTo(2, 1);
    EXPECT_TRUE(user::typeText(grid, "typed"));
}

TEST_F(Edit, DoesNotBeginWhenThatIsRefused) {
    grid.onStart = [](ROWCOL, ROWCOL) { return FALSE; };

    EXPECT_FALSE(user::typeText(grid, "typed"));

    EXPECT_FALSE(grid.IsEditing());
    EXPECT_THAT(grid.calls, ElementsAre("OnStartEditing 1 1"));
}

TEST_F(Edit, HasTheChoicesThatAreSetWhenItBegins) {
    grid.goTo(1, 5);
    grid.onStart = [&](ROWCOL, ROWCOL col) {
        return grid.SetStyleRange(CGXRange().SetCols(col), CGXStyle().SetChoiceList("RHINE\nDANUBE\n"));
    };

    EXPECT_TRUE(user::chooseEntry(grid, 1));

    EXPECT_EQ(grid.shown(1, 5), "DANUBE");
}

TEST_F(Edit, BeginsWithF2) {
    EXPECT_TRUE(grid.ProcessKeys(&grid, WM_KEYDOWN, VK_F2, 1, 0));

    EXPECT_TRUE(grid.IsEditing());
    EXPECT_FALSE(grid.IsEditPending());
    EXPECT_EQ(grid.GetControl(1, 1)->GetCurrentText(), "stored");
}

TEST_F(Edit, DoesNotBeginWithF2WhereNoTextCanBe) {
    grid.goTo(1, 3);
    EXPECT_FALSE(grid.ProcessKeys(&grid, WM_KEYDOWN, VK_F2, 1, 0));

    grid.SetStyleRange(CGXRange(1, 1), CGXStyle().SetReadOnly(TRUE));
    grid.goTo(1, 1);
    EXPECT_FALSE(grid.ProcessKeys(&grid, WM_KEYDOWN, VK_F2, 1, 0));

    EXPECT_FALSE(grid.IsEditing());
}

TEST_F(Edit, StaysWithItsLineWhenLinesComeAndGo) {
    grid.goTo(3, 1);
    user::typeText(grid, "typed");

    grid.RemoveRows(1, 1);
    EXPECT_EQ(grid.shown(2, 1), "typed");
    EXPECT_EQ(grid.shown(3, 1), "");
    grid.InsertRows(1, 3);

    EXPECT_EQ(grid.current(), "3,1");
    EXPECT_TRUE(grid.SetCurrentCell(0, 0));
    EXPECT_EQ(grid.text(5, 1), "typed");
    EXPECT_EQ(grid.text(3, 1), "");
    EXPECT_EQ(grid.edit->validated, std::pair(5U, 1U));
}

TEST_F(Edit, StaysWhenColumnsBehindItComeAndGo) {
    grid.goTo(1, 5);
    user::typeText(grid, "typed");

    grid.SetColCount(6);
    grid.SetColCount(5);

    EXPECT_EQ(grid.shown(1, 5), "typed");
}

TEST_F(Edit, OfAnotherLineIsCommittedBeforeTheCurrentCellIsTypedIn) {
    grid.goTo(2, 1);
    user::typeText(grid, "two");
    grid.InsertRows(1, 1);

    EXPECT_TRUE(user::typeText(grid, "new"));

    EXPECT_EQ(grid.text(3, 1), "two");
    EXPECT_EQ(grid.shown(2, 1), "new");
}

TEST_F(Edit, GoesWithItsLine) {
    grid.write(2, 1, "second");
    user::typeText(grid, "typed");

    grid.RemoveRows(1, 1);

    EXPECT_FALSE(grid.IsEditing());
    EXPECT_FALSE(grid.IsEditPending());
    EXPECT_TRUE(grid.SetCurrentCell(1, 1));
    EXPECT_EQ(grid.text(1, 1), "second");
    EXPECT_EQ(grid.edit->validations, 0);
}

TEST_F(Edit, IsDroppedWhenTheCountFallsBelowItsLine) {
    grid.goTo(4, 1);
    user::typeText(grid, "bad");

    grid.SetRowCount(0);
    grid.SetRowCount(4);

    EXPECT_TRUE(grid.SetCurrentCell(4, 1));
    EXPECT_EQ(grid.text(4, 1), "");
    EXPECT_EQ(grid.edit->validations, 0);
}

TEST_F(Edit, IsDroppedWithItsColumn) {
    grid.goTo(1, 5);
    user::typeText(grid, "typed");

    grid.SetColCount(4);

    EXPECT_FALSE(grid.IsEditing());
    grid.SetColCount(5);
    EXPECT_EQ(grid.text(1, 5), "");
}

class Committing : public Edit {};

TEST_F(Committing, StoresTheTextWhenTheCellIsLeft) {
    user::typeText(grid, "typed");

    EXPECT_TRUE(grid.SetCurrentCell(2, 1));

    EXPECT_EQ(grid.text(1, 1), "typed");
    EXPECT_EQ(grid.current(), "2,1");
    EXPECT_FALSE(grid.IsEditing());
    EXPECT_EQ(grid.edit->validations, 1);
}

TEST_F(Committing, StoresTheTextWhenTheSameCellIsMadeCurrent) {
    user::typeText(grid, "typed");

    EXPECT_TRUE(grid.SetCurrentCell(1, 1));
    EXPECT_TRUE(grid.SetCurrentCell(1, 1));

    EXPECT_EQ(grid.text(1, 1), "typed");
    EXPECT_EQ(grid.edit->validations, 1);
}

TEST_F(Committing, StoresTheTextWhenNoCellIsMadeCurrent) {
    user::typeText(grid, "typed");

    EXPECT_TRUE(grid.SetCurrentCell(0, 0, GX_KEEPFOCUS));

    EXPECT_EQ(grid.text(1, 1), "typed");
    EXPECT_EQ(grid.current(), "none");
}

TEST_F(Committing, KeepsEverythingWhenTheTextIsRefused) {
    user::typeText(grid, "bad");

    EXPECT_FALSE(grid.SetCurrentCell(2, 1));

    EXPECT_EQ(grid.text(1, 1), "stored");
    EXPECT_EQ(grid.shown(1, 1), "bad");
    EXPECT_EQ(grid.current(), "1,1");
    EXPECT_TRUE(grid.IsEditPending());
    EXPECT_EQ(grid.Warning().text, "No bad text");
    EXPECT_EQ(grid.Warning().row, 1U);
    EXPECT_EQ(grid.Warning().col, 1U);
    EXPECT_TRUE(grid.TakeChanges().warned);
}

TEST_F(Committing, TakesTheWarningBackWhenTheEditGoesOn) {
    user::typeText(grid, "bad");
    grid.SetCurrentCell(2, 1);

    user::typeText(grid, "ba");
    EXPECT_TRUE(grid.Warning().text.IsEmpty());
    EXPECT_TRUE(grid.SetCurrentCell(2, 1));

    EXPECT_EQ(grid.text(1, 1), "ba");
    EXPECT_TRUE(grid.Warning().text.IsEmpty());
}

TEST_F(Committing, TakesTheWarningBackWithTheText) {
    user::typeText(grid, "bad");
    grid.SetCurrentCell(2, 1);

    grid.CancelEdit();

    EXPECT_TRUE(grid.Warning().text.IsEmpty());
    EXPECT_TRUE(grid.SetCurrentCell(2, 1));
    EXPECT_EQ(grid.text(1, 1), "stored");
}

TEST_F(Committing, DoesNotValidateATextThatTheUserDidNotTouch) {
    grid.write(1, 1, "bad");
    grid.ProcessKeys(&grid, WM_KEYDOWN, VK_F2, 1, 0);

    EXPECT_TRUE(grid.SetCurrentCell(2, 1));

    EXPECT_EQ(grid.edit->validations, 0);
    EXPECT_EQ(grid.text(1, 1), "bad");
    EXPECT_FALSE(grid.IsEditing());
}

TEST_F(Committing, StoresIntoACellThatBecameReadOnly) {
    user::typeText(grid, "typed");
    grid.SetStyleRange(CGXRange(1, 1), CGXStyle().SetReadOnly(TRUE));

    grid.SetCurrentCell(2, 1);

    EXPECT_EQ(grid.text(1, 1), "typed");
}

TEST_F(Committing, OverwritesWhatTheProgramWroteMeanwhile) {
    user::typeText(grid, "typed");
    grid.write(1, 1, "program");

    grid.SetCurrentCell(2, 1);

    EXPECT_EQ(grid.text(1, 1), "typed");
}

TEST_F(Committing, ByTheUserKeepsTheCellCurrent) {
    user::typeText(grid, "typed");
    grid.calls.clear();

    EXPECT_TRUE(user::commit(grid));

    EXPECT_THAT(grid.calls, ElementsAre("SetCurrentCell 1 1 32"));
    EXPECT_EQ(grid.text(1, 1), "typed");
    EXPECT_EQ(grid.current(), "1,1");
    user::typeText(grid, "bad");
    EXPECT_FALSE(user::commit(grid));
}

TEST_F(Committing, OfNothingIsDoneAtOnce) {
    EXPECT_TRUE(user::commit(grid));

    EXPECT_THAT(grid.calls, IsEmpty());
}

class Leaving : public Edit {
protected:
    Leaving() {
        other.Create();
        grid.SetFocus();
        grid.calls.clear();
    }

    CWnd other;
};

TEST_F(Leaving, CommitsWhatIsPending) {
    user::typeText(grid, "typed");
    grid.calls.clear();

    other.SetFocus();

    EXPECT_THAT(grid.calls, ElementsAre("SetCurrentCell 1 1 32"));
    EXPECT_EQ(grid.text(1, 1), "typed");
    EXPECT_EQ(CWnd::GetFocus(), &other);
}

TEST_F(Leaving, DoesNothingWhenNothingIsPending) {
    grid.ProcessKeys(&grid, WM_KEYDOWN, VK_F2, 1, 0);
    grid.calls.clear();

    other.SetFocus();

    EXPECT_THAT(grid.calls, IsEmpty());
    EXPECT_EQ(CWnd::GetFocus(), &other);
}

TEST_F(Leaving, IsRefusedWithTheText) {
    user::typeText(grid, "bad");

    other.SetFocus();

    EXPECT_EQ(CWnd::GetFocus(), &grid);
    EXPECT_TRUE(grid.IsEditPending());
    EXPECT_EQ(grid.current(), "1,1");
}

TEST_F(Leaving, CommitsTheEditOfALineThatMoved) {
    user::typeText(grid, "typed");
    grid.InsertRows(1, 1);

    other.SetFocus();

    EXPECT_EQ(grid.text(2, 1), "typed");
    EXPECT_EQ(CWnd::GetFocus(), &other);
}

TEST_F(Leaving, GoesToAnotherGridOnceTheTextIsGood) {
    TestGrid second;
    user::typeText(grid, "bad");
    EXPECT_FALSE(user::clickCell(second, 1, 1));
    EXPECT_EQ(second.current(), "none");
    EXPECT_FALSE(user::typeText(second, "x"));

    user::typeText(grid, "good");

    EXPECT_TRUE(user::clickCell(second, 1, 1));
    EXPECT_EQ(grid.text(1, 1), "good");
    EXPECT_EQ(CWnd::GetFocus(), &second);
}

} // namespace
