#include "platform/framework/command.h"
#include "platform/framework/input.h"
#include "tests/platform/grid/test_grid.h"

namespace {

using testing::Contains;
using testing::ElementsAre;
namespace user = kota::grid;

class Undo : public testing::Test {
protected:
    Undo() {
        for (ROWCOL row = 1; row <= grid.GetRowCount(); ++row)
            grid.write(row, 1, ("line " + std::to_string(row)).c_str());
        grid.GetParam()->EnableUndo(FALSE);
        grid.write(4, 5, "the last"); // which makes the grid forget what was done so far
        grid.GetParam()->EnableUndo(TRUE);
        grid.goTo(1, 1);
    }

    void type(ROWCOL row, const char* text) {
        ASSERT_TRUE(user::clickCell(grid, row, 1));
        ASSERT_TRUE(user::typeText(grid, text));
        ASSERT_TRUE(user::commit(grid));
    }
    // A gesture of the user.
    template <class Action>
    void gesture(Action action) {
        const kota::Turn turn;
        action();
    }
    std::vector<std::string> firstColumn() {
        std::vector<std::string> texts;
        for (ROWCOL row = 1; row <= grid.GetRowCount(); ++row)
            texts.push_back(grid.text(row, 1));
        return texts;
    }
    bool undo() {
        const kota::Turn turn;
        return grid.Undo() != 0;
    }
    bool redo() {
        const kota::Turn turn;
        return grid.Redo() != 0;
    }

    TestGrid grid;
};

TEST_F(Undo, HasNothingToDoAtFirst) {
    EXPECT_FALSE(grid.CanUndo());
    EXPECT_FALSE(undo());
    EXPECT_FALSE(grid.CanRedo());
    EXPECT_FALSE(redo());
}

TEST_F(Undo, TakesBackEditsOneByOne) {
    type(1, "first");
    type(2, "second");

    EXPECT_TRUE(undo());
    EXPECT_THAT(firstColumn(), ElementsAre("first", "line 2", "line 3", "line 4"));
    EXPECT_TRUE(undo());
    EXPECT_THAT(firstColumn(), ElementsAre("line 1", "line 2", "line 3", "line 4"));
    EXPECT_FALSE(undo());
}

TEST_F(Undo, IsRedone) {
    type(1, "first");
    type(2, "second");
    undo();
    undo();

    EXPECT_TRUE(redo());
    EXPECT_THAT(firstColumn(), ElementsAre("first", "line 2", "line 3", "line 4"));
    EXPECT_TRUE(redo());
    EXPECT_THAT(firstColumn(), ElementsAre("first", "second", "line 3", "line 4"));
    EXPECT_FALSE(redo());
    EXPECT_TRUE(undo());
    EXPECT_THAT(firstColumn(), ElementsAre("first", "line 2", "line 3", "line 4"));
}

TEST_F(Undo, CannotBeRedoneAfterAnotherEdit) {
    type(1, "first");
    undo();
    type(2, "second");

    EXPECT_FALSE(grid.CanRedo());
    EXPECT_FALSE(redo());
}

TEST_F(Undo, TakesAnEditBackWithWhatWasWrittenAlongWithItsKeys) {
    grid.onModify = [this](ROWCOL row, ROWCOL) { grid.write(row, 5, "modified"); };
    ASSERT_TRUE(user::typeText(grid, "o"));
    ASSERT_TRUE(user::typeText(grid, "ot"));
    grid.onModify = nullptr;
    ASSERT_TRUE(user::commit(grid));
    ASSERT_EQ(grid.text(1, 5), "modified");

    EXPECT_TRUE(undo());

    EXPECT_EQ(grid.text(1, 1), "line 1");
    EXPECT_EQ(grid.text(1, 5), "");
    EXPECT_FALSE(grid.CanUndo());
}

TEST_F(Undo, OfAnEditTakesBackTheLineThatItsLastKeyAdded) {
    ASSERT_TRUE(user::clickCell(grid, 4, 1));
    ASSERT_TRUE(user::typeText(grid, "typed"));
    gesture([this] {
        user::commit(grid);
        grid.InsertRows(5, 1);
        grid.write(5, 1, "new");
    });
    ASSERT_EQ(grid.GetRowCount(), 5U);

    EXPECT_TRUE(undo());
    EXPECT_THAT(firstColumn(), ElementsAre("line 1", "line 2", "line 3", "line 4"));
    EXPECT_FALSE(grid.CanUndo());
    EXPECT_TRUE(redo());
    EXPECT_THAT(firstColumn(), ElementsAre("line 1", "line 2", "line 3", "typed", "new"));
}

TEST_F(Undo, BringsLinesBackWithAllThatTheyHeld) {
    grid.SetStyleRange(CGXRange(2, 2), CGXStyle().SetReadOnly(TRUE));
    grid.SetStyleRange(CGXRange().SetRows(3), CGXStyle().SetInterior(0x00FF00));
    grid.SetRowHeight(3, 3, 44);
    gesture([this] { grid.RemoveRows(2, 3); });
    ASSERT_THAT(firstColumn(), ElementsAre("line 1", "line 4"));

    EXPECT_TRUE(undo());

    EXPECT_THAT(firstColumn(), ElementsAre("line 1", "line 2", "line 3", "line 4"));
    CGXStyle style;
    grid.ComposeStyleRowCol(2, 2, &style);
    EXPECT_TRUE(style.GetReadOnly());
    grid.ComposeStyleRowCol(3, 2, &style);
    EXPECT_EQ(style.GetInterior(), COLORREF{0x00FF00});
    EXPECT_EQ(grid.GetRowHeight(3), 44);
    EXPECT_EQ(grid.GetRowHeight(4), grid.GetRowHeight(1));
    EXPECT_TRUE(redo());
    EXPECT_THAT(firstColumn(), ElementsAre("line 1", "line 4"));
}

TEST_F(Undo, TellsABlankFromACellThatWasNeverWritten) {
    grid.SetStyleRange(CGXRange().SetCols(5), CGXStyle().SetValue("by its column"));
    gesture([this] { grid.write(1, 5, ""); });
    ASSERT_EQ(grid.text(1, 5), "");

    undo();

    EXPECT_EQ(grid.text(1, 5), "by its column");
}

TEST_F(Undo, TakesBackTheStyleOfCellsAndLines) {
    gesture([this] {
        grid.SetStyleRange(CGXRange(1, 2), CGXStyle().SetReadOnly(TRUE));
        grid.SetStyleRange(CGXRange().SetRows(1), CGXStyle().SetInterior(0x0000FF));
    });

    undo();

    CGXStyle style;
    grid.ComposeStyleRowCol(1, 2, &style);
    EXPECT_FALSE(style.GetReadOnly());
    EXPECT_FALSE(style.HasInterior());
    EXPECT_FALSE(grid.CanUndo());
}

TEST_F(Undo, OpensAReadOnlyCellInSpiteOfTheLock) {
    gesture([this] {
        grid.write(1, 1, "");
        grid.SetStyleRange(CGXRange(1, 1), CGXStyle().SetReadOnly(TRUE));
    });

    undo();

    EXPECT_EQ(grid.text(1, 1), "line 1");
    EXPECT_TRUE(user::clickCell(grid, 1, 1));
    EXPECT_TRUE(user::typeText(grid, "open"));
}

TEST_F(Undo, OfATextBeingTypedTakesBackThatTextAlone) {
    type(2, "second");
    ASSERT_TRUE(user::clickCell(grid, 1, 1));
    ASSERT_TRUE(user::typeText(grid, "typed"));

    EXPECT_TRUE(grid.CanUndo());
    EXPECT_TRUE(undo());

    EXPECT_FALSE(grid.IsEditing());
    EXPECT_THAT(firstColumn(), ElementsAre("line 1", "second", "line 3", "line 4"));
}

TEST_F(Undo, EndsAsAnEditDoesWhereTheGestureBegan) {
    type(2, "second");
    ASSERT_TRUE(user::clickCell(grid, 4, 3));
    undo(); // of the check box
    grid.calls.clear();

    undo();

    EXPECT_THAT(grid.calls, Contains("OnModifyCell 2 1"));
    EXPECT_EQ(grid.calls.back(), "SetCurrentCell 2 1 10");
    EXPECT_EQ(grid.current(), "2,1");
}

TEST_F(Undo, OfRemovedLinesEndsAsAnEditDoesToo) {
    gesture([this] { grid.RemoveRows(3, 4); });
    grid.calls.clear();

    undo();

    EXPECT_THAT(grid.calls, ElementsAre("OnModifyCell 3 1", "SetCurrentCell 3 1 10"));
}

TEST_F(Undo, OfAddedLinesLeavesTheCurrentCellInTheGrid) {
    gesture([this] {
        grid.InsertRows(5, 2);
        grid.SetCurrentCell(6, 2);
    });

    undo();

    EXPECT_EQ(grid.GetRowCount(), 4U);
    EXPECT_EQ(grid.current(), "4,1");
}

TEST_F(Undo, TakesBackACheckBox) {
    ASSERT_TRUE(user::clickCell(grid, 1, 3));
    ASSERT_EQ(grid.text(1, 3), "1");

    undo();

    EXPECT_EQ(grid.text(1, 3), "");
}

TEST_F(Undo, IsForgottenWhenTheProgramWritesWithoutIt) {
    type(1, "first");
    grid.GetParam()->EnableUndo(FALSE);
    EXPECT_FALSE(grid.CanUndo());
    grid.write(3, 1, "line 3");
    grid.GetParam()->EnableUndo(TRUE);

    EXPECT_FALSE(grid.CanUndo());
}

TEST_F(Undo, OutlivesASpellInWhichNothingWasWritten) {
    type(1, "first");
    grid.GetParam()->EnableUndo(FALSE);
    grid.GetParam()->EnableUndo(TRUE);

    EXPECT_TRUE(grid.CanUndo());
}

TEST_F(Undo, NotesNoWriteThatChangesNothing) {
    gesture([this] { grid.write(1, 1, "line 1"); });

    EXPECT_FALSE(grid.CanUndo());
}

TEST_F(Undo, IsRedoneWithWhatWasWrittenWhenItWasTold) {
    type(1, "first");
    grid.onModify = [this](ROWCOL row, ROWCOL) { grid.write(row, 5, "told"); };
    undo();
    grid.onModify = nullptr;

    redo();

    EXPECT_EQ(grid.text(1, 1), "first");
    EXPECT_EQ(grid.text(1, 5), "");
}

TEST_F(Undo, GoesBackTwoHundredGestures) {
    for (int i = 0; i < 250; ++i)
        gesture([&] { grid.write(1, 1, std::to_string(i).c_str()); });

    int undone = 0;
    while (undo())
        ++undone;

    EXPECT_EQ(undone, 200);
    EXPECT_EQ(grid.text(1, 1), "49");
}

TEST_F(Undo, ClearsTheSelection) {
    type(1, "first");
    user::clickLineHeader(grid, 2);

    undo();

    EXPECT_EQ(grid.selected(), "");
}

TEST_F(Undo, IsACommandAndRedoIsAKey) {
    type(1, "first");
    EXPECT_TRUE(grid.OnCmdMsg(ID_EDIT_UNDO, CN_UPDATE_COMMAND_UI));
    EXPECT_EQ(grid.text(1, 1), "first");
    EXPECT_TRUE(grid.OnCmdMsg(ID_EDIT_UNDO, 0));
    EXPECT_EQ(grid.text(1, 1), "line 1");
    EXPECT_FALSE(grid.OnCmdMsg(ID_EDIT_UNDO, CN_UPDATE_COMMAND_UI));

    grid.SetFocus();
    EXPECT_TRUE(kota::input::key('Y', {.control = true}));
    EXPECT_EQ(grid.text(1, 1), "first");
    undo();
    EXPECT_TRUE(kota::input::key('Z', {.shift = true, .control = true}));
    EXPECT_EQ(grid.text(1, 1), "first");
}

TEST_F(Undo, OfAThousandLinesIsOneGesture) {
    gesture([this] {
        grid.InsertRows(1, 1000);
        for (ROWCOL row = 1; row <= 1000; ++row)
            grid.write(row, 1, "pasted");
    });

    undo();

    EXPECT_THAT(firstColumn(), ElementsAre("line 1", "line 2", "line 3", "line 4"));
    redo();
    EXPECT_EQ(grid.GetRowCount(), 1004U);
    EXPECT_EQ(grid.text(1000, 1), "pasted");
}

} // namespace
