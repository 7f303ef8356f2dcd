#include "platform/framework/command.h"
#include "platform/framework/input.h"
#include "tests/platform/grid/test_grid.h"

namespace {

using testing::ElementsAre;
using testing::HasSubstr;
using testing::IsEmpty;
namespace user = kota::grid;

class CommaScreen : public NotingScreen {
public:
    bool usesDecimalComma() const override { return comma; }
    bool comma = false;
};

// Numbers with a decimal point alone, in the first column of the test grid.
class NumberEdit : public CGXEditControl {
public:
    explicit NumberEdit(CGXGridCore* grid) : CGXEditControl(grid, 7) {}

    BOOL OnValidate() override {
        if (GetCurrentText().View().find_first_not_of("0123456789.") == std::string_view::npos)
            return TRUE;
        Grid()->SetWarningText("A number, please");
        return FALSE;
    }
};

// Column 1 takes numbers, 2 and 4 are choices, 3 is a check box, 5 free text.
class Clipboard : public testing::Test {
protected:
    Clipboard() {
        grid.RegisterControl(TestGrid::checkedEdit, std::make_unique<NumberEdit>(&grid));
        grid.SetFocus();
        grid.GetParam()->EnableUndo(FALSE);
        for (ROWCOL row = 1; row <= grid.GetRowCount(); ++row) {
            grid.write(row, 1, std::to_string(row).c_str());
            grid.write(row, 2, "0");
            grid.write(row, 3, "0");
            grid.write(row, 4, "1");
            grid.write(row, 5, "MISSOURI");
        }
        grid.GetParam()->EnableUndo(TRUE);
        grid.goTo(1, 1);
    }

    bool run(UINT command) {
        const kota::Turn turn;
        return grid.OnCmdMsg(command, 0) != 0;
    }
    bool paste(const char* text) {
        screen.setClipboardText(text);
        return run(ID_EDIT_PASTE);
    }
    std::string clipboard() { return std::string(screen.clipboardText().View()); }
    std::vector<std::string> line(ROWCOL row) {
        std::vector<std::string> texts;
        for (ROWCOL col = 1; col <= grid.GetColCount(); ++col)
            texts.push_back(grid.text(row, col));
        return texts;
    }

    CommaScreen screen;
    TestGrid grid;
};

TEST_F(Clipboard, TakesTheCurrentCellWithoutALineEnd) {
    EXPECT_TRUE(run(ID_EDIT_COPY));
    EXPECT_EQ(clipboard(), "1");
}

TEST_F(Clipboard, TakesARangeAsATable) {
    user::selectCells(grid, CGXRange(2, 1, 3, 2));
    EXPECT_TRUE(run(ID_EDIT_COPY));
    EXPECT_EQ(clipboard(), "2\tClosed\n3\tClosed\n");
}

TEST_F(Clipboard, TakesWholeLinesWithEntriesOfChoicesAndNumbersOfBoxes) {
    user::clickLineHeader(grid, 2);
    EXPECT_TRUE(run(ID_EDIT_COPY));
    EXPECT_EQ(clipboard(), "2\tClosed\t0\tmg\tMISSOURI\n");
}

TEST_F(Clipboard, TakesSeveralSelectionsInTheOrderOfTheLines) {
    user::clickLineHeader(grid, 3);
    user::clickLineHeader(grid, 1, user::Selecting::Add);
    EXPECT_TRUE(run(ID_EDIT_COPY));
    EXPECT_EQ(clipboard(), "1\tClosed\t0\tmg\tMISSOURI\n3\tClosed\t0\tmg\tMISSOURI\n");
}

TEST_F(Clipboard, GivesATableFromTheCurrentCellOn) {
    grid.goTo(2, 1);
    EXPECT_TRUE(paste("10\tOpen\t1\tkg\tOHIO\r\n20\tOpen, twice\t0\tmg\t\"A\tB\"\r\n"));
    EXPECT_THAT(line(2), ElementsAre("10", "1", "1", "2", "OHIO"));
    EXPECT_THAT(line(3), ElementsAre("20", "2", "0", "1", "A\tB"));
    EXPECT_THAT(line(1), ElementsAre("1", "0", "0", "1", "MISSOURI"));
    EXPECT_THAT(screen.boxes, IsEmpty());
    EXPECT_EQ(grid.current(), "2,1");
}

TEST_F(Clipboard, GivesAChoiceByItsNumberToo) {
    grid.goTo(1, 2);
    EXPECT_TRUE(paste("2\t1\t2"));
    EXPECT_THAT(line(1), ElementsAre("1", "2", "1", "2", "MISSOURI"));
}

TEST_F(Clipboard, GivesASingleValueToAllThatIsSelected) {
    user::selectCells(grid, CGXRange(2, 1, 4, 1));
    EXPECT_TRUE(paste("7"));
    for (const ROWCOL row : {2U, 3U, 4U})
        EXPECT_EQ(grid.text(row, 1), "7");
    EXPECT_EQ(grid.text(1, 1), "1");
}

TEST_F(Clipboard, GivesATableFromTheFirstSelectedCellOn) {
    grid.goTo(4, 5);
    user::selectCells(grid, CGXRange(2, 1, 3, 2));
    EXPECT_TRUE(paste("8\n9\n"));
    EXPECT_EQ(grid.text(2, 1), "8");
    EXPECT_EQ(grid.text(3, 1), "9");
}

TEST_F(Clipboard, AddsTheLinesThatATableNeeds) {
    grid.goTo(4, 1);
    EXPECT_TRUE(paste("40\n50\n60\n"));
    ASSERT_EQ(grid.GetRowCount(), 6U);
    EXPECT_EQ(grid.text(4, 1), "40");
    EXPECT_EQ(grid.text(6, 1), "60");
}

TEST_F(Clipboard, TellsInOneBoxWhatItCouldNotGive) {
    grid.goTo(3, 1);
    EXPECT_TRUE(paste("12\tAjar\t5\nx1\tOpen\t1\n"));
    EXPECT_THAT(line(3), ElementsAre("12", "0", "0", "1", "MISSOURI"));
    EXPECT_THAT(line(4), ElementsAre("4", "1", "1", "1", "MISSOURI"));
    EXPECT_THAT(screen.boxes, ElementsAre("3 values could not be pasted:\n"
                                          "\nLine 3, column 2: \"Ajar\" - not one of the choices"
                                          "\nLine 3, column 3: \"5\" - 0 or 1 required"
                                          "\nLine 4, column 1: \"x1\" - A number, please"));
    EXPECT_FALSE(grid.IsEditing());
}

TEST_F(Clipboard, TellsTheFirstTenAndCountsTheOthers) {
    std::string text;
    for (int i = 0; i < 13; ++i)
        text += "x\n";
    paste(text.c_str());
    ASSERT_EQ(screen.boxes.size(), 1U);
    EXPECT_THAT(screen.boxes.front(), HasSubstr("13 values could not be pasted"));
    EXPECT_THAT(screen.boxes.front(), HasSubstr("\nLine 10, column 1: \"x\" - A number, please\nand 3 more"));
}

TEST_F(Clipboard, TellsOfColumnsThatThereAreNot) {
    grid.goTo(1, 5);
    paste("OHIO\tmore");
    EXPECT_EQ(grid.text(1, 5), "OHIO");
    EXPECT_THAT(screen.boxes, ElementsAre("1 value could not be pasted:\n"
                                          "\nLine 1, column 6: \"more\" - there is no such column"));
}

TEST_F(Clipboard, SkipsReadOnlyCellsAndTellsOfAnotherValueForThem) {
    grid.SetStyleRange(CGXRange(1, 5, 3, 5), CGXStyle().SetReadOnly(TRUE));
    grid.goTo(1, 5);
    paste("MISSOURI\n\nOHIO\n");
    for (const ROWCOL row : {1U, 2U, 3U})
        EXPECT_EQ(grid.text(row, 5), "MISSOURI");
    EXPECT_THAT(screen.boxes, ElementsAre("1 value could not be pasted:\n"
                                          "\nLine 3, column 5: \"OHIO\" - the cell cannot be changed"));
}

TEST_F(Clipboard, OpensCellsForTheValuesBehindABox) {
    grid.SetStyleRange(CGXRange(1, 5), CGXStyle().SetReadOnly(TRUE));
    grid.onModify = [this](ROWCOL row, ROWCOL col) {
        if (col != 3)
            return;
        grid.GetParam()->SetLockReadOnly(FALSE);
        grid.SetStyleRange(CGXRange(row, 5), CGXStyle().SetReadOnly(FALSE));
        grid.GetParam()->SetLockReadOnly(TRUE);
    };
    grid.goTo(1, 3);
    paste("1\tkg\tOHIO");
    EXPECT_THAT(line(1), ElementsAre("1", "0", "1", "2", "OHIO"));
    EXPECT_THAT(screen.boxes, IsEmpty());
}

TEST_F(Clipboard, TellsTheGridOfEachCellAndEndsAsAnEditDoes) {
    grid.goTo(2, 1);
    paste("10\tOpen\t1");
    EXPECT_THAT(grid.calls, testing::IsSupersetOf({"OnStartEditing 2 1", "OnModifyCell 2 1",
                                                   "OnModifyCell 2 2", "OnClickedButtonRowCol 2 3 1"}));
    EXPECT_EQ(grid.calls.back(), "SetCurrentCell 2 1 10");
}

TEST_F(Clipboard, GivesNothingToACellThatRefusesToBeEdited) {
    grid.onStart = [](ROWCOL, ROWCOL) { return FALSE; };
    paste("10");
    EXPECT_EQ(grid.text(1, 1), "1");
    EXPECT_EQ(screen.boxes.size(), 1U);
}

TEST_F(Clipboard, IsPastedInOneStep) {
    grid.goTo(4, 1);
    paste("10\tOpen\n20\tOpen\n");
    const kota::Turn turn;
    EXPECT_TRUE(grid.Undo());
    EXPECT_EQ(grid.GetRowCount(), 4U);
    EXPECT_THAT(line(4), ElementsAre("4", "0", "0", "1", "MISSOURI"));
    EXPECT_FALSE(grid.CanUndo());
}

TEST_F(Clipboard, IsPastedInOneStepWithTheEditThatItEnds) {
    grid.goTo(4, 1);
    user::typeText(grid, "12");

    paste("7\n8\n");

    ASSERT_EQ(grid.GetRowCount(), 5U);
    const kota::Turn turn;
    EXPECT_TRUE(grid.Undo());
    EXPECT_EQ(grid.GetRowCount(), 4U);
    EXPECT_EQ(grid.text(4, 1), "4");
    EXPECT_FALSE(grid.CanUndo());
}

TEST_F(Clipboard, TakesAChoiceByItsNumberWhereAnotherEntryReadsTheSame) {
    grid.SetStyleRange(CGXRange().SetCols(2), CGXStyle().SetChoiceList("A\nB\nA\n"));
    grid.write(1, 2, "2");
    grid.write(2, 2, "1");
    user::selectCells(grid, CGXRange(1, 2, 2, 2));
    ASSERT_TRUE(run(ID_EDIT_COPY));
    EXPECT_EQ(clipboard(), "2\nB\n");

    user::selectCells(grid, CGXRange(3, 2, 4, 2));
    EXPECT_TRUE(run(ID_EDIT_PASTE));

    EXPECT_EQ(grid.text(3, 2), "2");
    EXPECT_EQ(grid.text(4, 2), "1");
}

TEST_F(Clipboard, GivesASingleValueBackAsItWas) {
    for (const char* const value : {"\"A\"", "5\" pipe", "A\tB", ""}) {
        grid.write(1, 5, value);
        grid.goTo(1, 5);
        ASSERT_TRUE(run(ID_EDIT_COPY));
        grid.goTo(2, 5);
        EXPECT_TRUE(run(ID_EDIT_PASTE)) << value;
        EXPECT_EQ(grid.text(2, 5), value);
    }
}

TEST_F(Clipboard, UnderstandsADecimalCommaWhereTheUserWritesOne) {
    paste("1,5");
    EXPECT_EQ(grid.text(1, 1), "1");
    screen.comma = true;
    paste("1,5");
    EXPECT_EQ(grid.text(1, 1), "1.5");
    paste("1,500,000");
    paste("1.5,2");
    EXPECT_EQ(grid.text(1, 1), "1.5");
    grid.goTo(1, 5);
    paste("A,B");
    EXPECT_EQ(grid.text(1, 5), "A,B") << "a text keeps its comma";
    EXPECT_EQ(screen.boxes.size(), 3U);
}

TEST_F(Clipboard, BlanksWhatIsCut) {
    user::selectCells(grid, CGXRange(1, 1, 2, 5));
    EXPECT_TRUE(run(ID_EDIT_CUT));
    EXPECT_EQ(clipboard(), "1\tClosed\t0\tmg\tMISSOURI\n2\tClosed\t0\tmg\tMISSOURI\n");
    EXPECT_THAT(line(1), ElementsAre("", "0", "0", "1", "")) << "a choice and a box cannot be blank";
    EXPECT_THAT(screen.boxes, IsEmpty());
}

TEST_F(Clipboard, TakesCutLinesAway) {
    user::clickLineHeader(grid, 2);
    user::clickLineHeader(grid, 3, user::Selecting::Extend);
    EXPECT_TRUE(run(ID_EDIT_CUT));
    EXPECT_EQ(grid.GetRowCount(), 2U);
    EXPECT_EQ(grid.text(2, 1), "4");
}

TEST_F(Clipboard, BlanksAllRangesThatAreCut) {
    user::selectCells(grid, CGXRange(1, 1, 1, 1));
    user::clickLineHeader(grid, 3, user::Selecting::Add);

    EXPECT_TRUE(run(ID_EDIT_CUT));

    EXPECT_EQ(grid.text(1, 1), "");
    EXPECT_EQ(grid.text(2, 1), "2");
    EXPECT_EQ(grid.text(3, 1), "");
    EXPECT_EQ(grid.GetRowCount(), 4U);
}

TEST_F(Clipboard, CutsNoLinesInSeveralPieces) {
    screen.setClipboardText("before");
    user::clickLineHeader(grid, 3);
    user::clickLineHeader(grid, 1, user::Selecting::Add);

    run(ID_EDIT_CUT);

    EXPECT_EQ(clipboard(), "before");
    EXPECT_EQ(grid.GetRowCount(), 4U);
    EXPECT_EQ(grid.text(1, 1), "1");
}

TEST_F(Clipboard, TakesATextThatIsBeingTypedIntoTheCellFirst) {
    user::typeText(grid, "12");
    grid.SetCurrentCell(2, 1);
    user::selectCells(grid, CGXRange(1, 1, 2, 1));
    run(ID_EDIT_COPY);
    EXPECT_EQ(clipboard(), "12\n2\n");
}

TEST_F(Clipboard, LeavesALineOfTextToTheScreenWhileItIsTyped) {
    user::typeText(grid, "12");
    EXPECT_FALSE(grid.OnCmdMsg(ID_EDIT_COPY, CN_UPDATE_COMMAND_UI));
    EXPECT_FALSE(paste("7"));
    EXPECT_EQ(grid.shown(1, 1), "12");
}

TEST_F(Clipboard, GivesATableBehindATextThatIsBeingTyped) {
    user::typeText(grid, "12");
    EXPECT_TRUE(paste("7\n8\n"));
    EXPECT_EQ(grid.text(1, 1), "7");
    EXPECT_EQ(grid.text(2, 1), "8");
}

TEST_F(Clipboard, GivesNoTableOverATextThatIsRefused) {
    user::typeText(grid, "x");
    EXPECT_FALSE(paste("7\n8\n"));
    EXPECT_TRUE(grid.IsEditPending());
    EXPECT_EQ(grid.text(2, 1), "2");
}

TEST_F(Clipboard, HasNowhereToGoWithoutACurrentCell) {
    grid.goTo(0, 0);
    EXPECT_FALSE(grid.OnCmdMsg(ID_EDIT_PASTE, CN_UPDATE_COMMAND_UI));
    EXPECT_FALSE(paste("7"));
    EXPECT_FALSE(run(ID_EDIT_COPY));
}

TEST_F(Clipboard, GivesNothingWhenItIsEmpty) {
    EXPECT_FALSE(paste(""));
    EXPECT_EQ(grid.text(1, 1), "1");
    EXPECT_FALSE(grid.CanUndo()) << "nothing was changed";
}

} // namespace
