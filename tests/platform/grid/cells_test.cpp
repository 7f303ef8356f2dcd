#include "tests/platform/grid/test_grid.h"

#include <limits>

namespace {

class Cells : public testing::Test {
protected:
    TestGrid grid{4};
};

TEST_F(Cells, HoldTheTextThatWasWritten) {
    EXPECT_TRUE(grid.SetValueRange(CGXRange(1, 1), "text"));
    EXPECT_TRUE(grid.SetValueRange(CGXRange(2, 1), CString("as object")));
    EXPECT_TRUE(grid.SetValueRange(CGXRange(3, 1), std::string_view("a view of more", 6)));

    EXPECT_EQ(grid.text(1, 1), "text");
    EXPECT_EQ(grid.GetValueRowCol(2, 1), "as object");
    EXPECT_EQ(grid.text(3, 1), "a view");
    EXPECT_EQ(grid.text(4, 1), "");
}

TEST_F(Cells, HoldTextsOfEveryLength) {
    for (std::size_t length = 0; length <= 40; ++length) {
        const std::string text(length, 'x');
        grid.write(1, 1, text.c_str());
        EXPECT_EQ(grid.text(1, 1), text);
    }
}

TEST_F(Cells, HoldALongTextAfterAShortOneAndBack) {
    const std::string longText(1000, 'l');
    grid.write(1, 1, longText.c_str());
    grid.write(1, 1, "short");
    EXPECT_EQ(grid.text(1, 1), "short");

    grid.write(1, 1, longText.c_str());

    EXPECT_EQ(grid.text(1, 1), longText);
}

TEST_F(Cells, TakeTheTextOfAnotherCellAndTheirOwn) {
    grid.write(1, 1, "a text that is longer than a short one");

    grid.SetValueRange(CGXRange(4, 1), grid.CellText(1, 1));
    grid.SetValueRange(CGXRange(1, 1), grid.CellText(1, 1).substr(2));
    EXPECT_EQ(grid.text(4, 1), "a text that is longer than a short one");
    EXPECT_EQ(grid.text(1, 1), "text that is longer than a short one");

    grid.SetValueRange(CGXRange().SetCols(1), grid.CellText(1, 1));

    EXPECT_EQ(grid.text(1, 1), "text that is longer than a short one");
    EXPECT_EQ(grid.text(4, 1), "text that is longer than a short one");
}

TEST_F(Cells, HoldNumbersAsShortAsTheyReadBack) {
    grid.SetValueRange(CGXRange(1, 1), -5);
    grid.SetValueRange(CGXRange(2, 1), 0.001);
    grid.SetValueRange(CGXRange(3, 1), 1.0);
    grid.SetValueRange(CGXRange(4, 1), std::numeric_limits<double>::max());

    EXPECT_EQ(grid.text(1, 1), "-5");
    EXPECT_EQ(grid.text(2, 1), "0.001");
    EXPECT_EQ(grid.text(3, 1), "1");
    EXPECT_EQ(grid.text(4, 1), "1.7976931348623157e+308");
}

TEST_F(Cells, BeyondTheCountsTakeNothing) {
    EXPECT_FALSE(grid.SetValueRange(CGXRange(5, 1), "x"));
    EXPECT_FALSE(grid.SetValueRange(CGXRange(1, 6), "x"));
    EXPECT_FALSE(grid.SetStyleRange(CGXRange(5, 1), CGXStyle().SetValue("x")));
    EXPECT_FALSE(grid.SetStyleRange(CGXRange(1, 6), CGXStyle().SetValue("x")));
    EXPECT_FALSE(grid.SetStyleRange(CGXRange().SetRows(5), CGXStyle().SetValue("x")));
    EXPECT_FALSE(grid.SetStyleRange(CGXRange().SetCols(6), CGXStyle().SetValue("x")));

    grid.SetRowCount(5);
    grid.SetColCount(6);
    EXPECT_EQ(grid.text(5, 1), "");
    EXPECT_EQ(grid.text(1, 6), "");
    EXPECT_EQ(grid.text(900, 1), "");
    EXPECT_EQ(grid.GetValueRowCol(900, 0), "");
}

TEST_F(Cells, AreWrittenAsFarAsARectangleHoldsThem) {
    EXPECT_TRUE(grid.SetValueRange(CGXRange(3, 4, 10, 10), "x"));

    EXPECT_EQ(grid.text(4, 5), "x");
    EXPECT_EQ(grid.text(3, 4), "x");
    EXPECT_EQ(grid.text(2, 4), "");
    EXPECT_EQ(grid.text(3, 3), "");
}

TEST_F(Cells, OfAColumnAreWrittenWithoutItsHeader) {
    grid.write(0, 1, "River");

    grid.SetValueRange(CGXRange().SetCols(1), "x");

    EXPECT_EQ(grid.text(0, 1), "River");
    EXPECT_EQ(grid.text(1, 1), "x");
    EXPECT_EQ(grid.text(4, 1), "x");
    EXPECT_EQ(grid.text(1, 2), "");
    grid.SetRowCount(5);
    EXPECT_EQ(grid.text(5, 1), "");
}

TEST_F(Cells, OfALineAreWrittenWithoutItsHeader) {
    grid.SetValueRange(CGXRange().SetRows(2), "x");

    EXPECT_EQ(grid.GetValueRowCol(2, 0), "2");
    EXPECT_EQ(grid.text(2, 1), "x");
    EXPECT_EQ(grid.text(2, 5), "x");
    EXPECT_EQ(grid.text(1, 1), "");
    EXPECT_FALSE(grid.SetValueRange(CGXRange().SetRows(0), "x"));
}

TEST_F(Cells, AreAllWrittenByTheWholeTable) {
    grid.SetValueRange(CGXRange().SetTable(), "x");

    EXPECT_EQ(grid.text(1, 1), "x");
    EXPECT_EQ(grid.text(4, 5), "x");
    EXPECT_EQ(grid.GetValueRowCol(0, 1), "");
    EXPECT_FALSE(grid.SetValueRange(CGXRange(), "x"));
}

TEST_F(Cells, ThatWereNeverSetShowTheValueOfTheirColumn) {
    grid.write(1, 1, "own");
    grid.write(2, 1, "");

    grid.SetStyleRange(CGXRange().SetCols(1), CGXStyle().SetValue("default"));

    EXPECT_EQ(grid.text(1, 1), "own");
    EXPECT_EQ(grid.text(2, 1), "");
    EXPECT_EQ(grid.text(3, 1), "default");
    EXPECT_EQ(grid.GetValueRowCol(3, 1), "default");
    EXPECT_EQ(grid.GetValueRowCol(0, 1), "");
    grid.SetRowCount(5);
    EXPECT_EQ(grid.text(5, 1), "default");
}

TEST_F(Cells, ThatWereNeverSetShowTheValueOfTheirLineAboveThatOfTheirColumn) {
    grid.ChangeStandardStyle(CGXStyle().SetValue("standard"));
    EXPECT_EQ(grid.text(2, 1), "standard");
    grid.SetStyleRange(CGXRange().SetCols(1), CGXStyle().SetValue("column"));
    EXPECT_EQ(grid.text(2, 1), "column");

    grid.SetStyleRange(CGXRange().SetRows(2), CGXStyle().SetValue("line"));

    EXPECT_EQ(grid.text(2, 1), "line");
    EXPECT_EQ(grid.text(1, 1), "column");
    grid.write(2, 1, "cell");
    EXPECT_EQ(grid.text(2, 1), "cell");
}

class Styles : public Cells {
protected:
    CGXStyle of(ROWCOL row, ROWCOL col) const {
        CGXStyle style;
        grid.ComposeStyleRowCol(row, col, &style);
        return style;
    }
};

TEST_F(Styles, LieOverOneAnotherStandardColumnLineCell) {
    grid.ChangeStandardStyle(CGXStyle().SetInterior(1).SetUserAttribute(1, "standard"));
    grid.SetStyleRange(CGXRange().SetCols(1), CGXStyle().SetInterior(2).SetUserAttribute(2, "column"));
    grid.SetStyleRange(CGXRange().SetRows(2), CGXStyle().SetInterior(3).SetUserAttribute(3, "line"));
    grid.SetStyleRange(CGXRange(2, 1), CGXStyle().SetInterior(4).SetUserAttribute(4, "cell"));

    const CGXStyle all = of(2, 1);

    EXPECT_EQ(all.GetInterior(), 4U);
    EXPECT_EQ(all.GetUserAttribute(1), "standard");
    EXPECT_EQ(all.GetUserAttribute(2), "column");
    EXPECT_EQ(all.GetUserAttribute(3), "line");
    EXPECT_EQ(all.GetUserAttribute(4), "cell");
    EXPECT_EQ(of(2, 2).GetInterior(), 3U);
    EXPECT_EQ(of(1, 1).GetInterior(), 2U);
    EXPECT_EQ(of(1, 2).GetInterior(), 1U);
}

TEST_F(Styles, OfCellsStayOverAColumnStyleThatIsLaidAnew) {
    grid.SetStyleRange(CGXRange(2, 1), CGXStyle().SetInterior(4));

    grid.SetStyleRange(CGXRange().SetCols(1), CGXStyle().SetInterior(2));

    EXPECT_EQ(of(2, 1).GetInterior(), 4U);
    EXPECT_EQ(of(1, 1).GetInterior(), 2U);
}

TEST_F(Styles, OfColumnsHoldForLinesThatComeLater) {
    grid.SetStyleRange(CGXRange().SetCols(1, 2), CGXStyle().SetInterior(2));

    grid.SetRowCount(10);

    EXPECT_EQ(of(10, 1).GetInterior(), 2U);
    EXPECT_EQ(of(10, 2).GetInterior(), 2U);
    EXPECT_EQ(of(10, 3).GetInterior(), 0xFFFFFFU);
}

TEST_F(Styles, OfAllAreThoseOfEachColumn) {
    EXPECT_TRUE(grid.SetStyleRange(CGXRange().SetTable(), CGXStyle().SetInterior(2)));

    EXPECT_EQ(of(1, 1).GetInterior(), 2U);
    EXPECT_EQ(of(4, 5).GetInterior(), 2U);
    EXPECT_EQ(of(0, 1).GetInterior(), 0xFFFFFFU);
    EXPECT_EQ(of(1, 0).GetInterior(), 0xFFFFFFU);
}

TEST_F(Styles, OfARectangleReachEachOfItsCells) {
    grid.SetStyleRange(CGXRange(1, 1, 2, 9), CGXStyle().SetInterior(2).SetValue("v"));

    EXPECT_EQ(of(2, 5).GetInterior(), 2U);
    EXPECT_EQ(of(2, 5).GetValue(), "v");
    EXPECT_EQ(of(3, 5).GetInterior(), 0xFFFFFFU);
    EXPECT_EQ(grid.text(3, 5), "");
}

TEST_F(Styles, LaidOverOneCellTwiceAddUp) {
    grid.SetStyleRange(CGXRange(1, 1), CGXStyle().SetInterior(2));
    grid.SetStyleRange(CGXRange(1, 1), CGXStyle().SetUserAttribute(51022, "tip"));
    grid.SetStyleRange(CGXRange(2, 1), CGXStyle().SetUserAttribute(51022, "other tip"));

    EXPECT_EQ(of(1, 1).GetInterior(), 2U);
    EXPECT_EQ(of(1, 1).GetUserAttribute(51022), "tip");
    EXPECT_EQ(of(2, 1).GetUserAttribute(51022), "other tip");
    EXPECT_FALSE(of(2, 1).HasInterior());
}

TEST_F(Styles, LaidOverCellsOfOtherStylesMakeOthers) {
    const CGXStyle tip = CGXStyle().SetUserAttribute(51022, "tip");
    grid.SetStyleRange(CGXRange(1, 1, 2, 1), CGXStyle().SetInterior(2));

    grid.SetStyleRange(CGXRange(3, 1), tip);
    grid.SetStyleRange(CGXRange(1, 1), tip);
    grid.SetStyleRange(CGXRange(2, 1), CGXStyle().SetHorizontalAlignment(alignRight));

    EXPECT_EQ(of(3, 1).HasInterior(), false);
    EXPECT_EQ(of(1, 1).GetInterior(), 2U);
    EXPECT_EQ(of(1, 1).GetUserAttribute(51022), "tip");
    EXPECT_EQ(of(2, 1).GetInterior(), 2U);
    EXPECT_EQ(of(2, 1).GetHorizontalAlignment(), alignRight);
    EXPECT_EQ(of(2, 1).GetUserAttribute(51022), "");
}

TEST_F(Styles, HoldTheCellsValue) {
    grid.SetStyleRange(CGXRange().SetCols(1), CGXStyle().SetValue("default"));
    grid.write(2, 1, "own");

    EXPECT_EQ(of(1, 1).GetValue(), "default");
    EXPECT_EQ(of(2, 1).GetValue(), "own");
    EXPECT_FALSE(of(1, 2).HasValue());
}

TEST_F(Styles, OfAHeaderAreItsOwnAndNotThoseOfItsColumnOrLine) {
    grid.ChangeStandardStyle(CGXStyle().SetValue("standard").SetFont({.face = "Sans", .points = 9}));
    grid.SetStyleRange(CGXRange().SetCols(1), CGXStyle().SetInterior(2).SetValue("default"));
    grid.SetStyleRange(CGXRange().SetRows(1), CGXStyle().SetInterior(3).SetValue("default"));
    EXPECT_FALSE(of(0, 1).HasInterior());
    EXPECT_FALSE(of(0, 1).HasValue());
    EXPECT_EQ(grid.text(0, 1), "");
    EXPECT_FALSE(of(1, 0).HasInterior());
    EXPECT_EQ(of(1, 0).GetValue(), "1");
    EXPECT_EQ(of(0, 1).GetFont().face, "Sans");

    grid.SetStyleRange(CGXRange(0, 1), CGXStyle().SetValue("River").SetInterior(4));
    grid.SetStyleRange(CGXRange(1, 0), CGXStyle().SetValue("first"));

    EXPECT_EQ(grid.GetValueRowCol(0, 1), "River");
    EXPECT_EQ(of(0, 1).GetInterior(), 4U);
    EXPECT_EQ(grid.GetValueRowCol(1, 0), "first");
    EXPECT_EQ(grid.text(1, 1), "default");
}

TEST_F(Styles, OfTheHeaderLineAndColumnHoldForTheirHeaders) {
    grid.SetStyleRange(CGXRange().SetRows(0), CGXStyle().SetInterior(2));
    grid.SetStyleRange(CGXRange().SetCols(0), CGXStyle().SetInterior(3));

    EXPECT_EQ(of(0, 5).GetInterior(), 2U);
    EXPECT_EQ(of(4, 0).GetInterior(), 3U);
    EXPECT_FALSE(of(4, 5).HasInterior());
}

TEST_F(Styles, NumberTheLinesInTheirHeadersWhileTheGridDoes) {
    EXPECT_EQ(grid.GetValueRowCol(4, 0), "4");
    EXPECT_EQ(grid.shown(4, 0), "4");
    EXPECT_EQ(grid.GetValueRowCol(0, 2), "");
    EXPECT_EQ(grid.GetValueRowCol(5, 0), "");

    grid.GetParam()->SetNumberedRowHeaders(FALSE);

    EXPECT_EQ(grid.GetValueRowCol(4, 0), "");
}

class NumberingGrid : public TestGrid {
public:
    void ComposeStyleRowCol(ROWCOL row, ROWCOL col, CGXStyle* style) const override {
        TestGrid::ComposeStyleRowCol(row, col, style);
        if (col == 0 && row > 1)
            style->SetValue(static_cast<int>(row - 1));
    }
};

TEST(StylesOfADerivedGrid, AreWhatAHeaderShows) {
    NumberingGrid grid;
    grid.GetParam()->SetNumberedRowHeaders(FALSE);

    EXPECT_EQ(grid.GetValueRowCol(3, 0), "2");
    EXPECT_EQ(grid.shown(3, 0), "2");
    EXPECT_EQ(grid.GetValueRowCol(1, 0), "");
}

class Lock : public Styles {
protected:
    CGXStyle grey = CGXStyle().SetReadOnly(TRUE).SetInterior(0x808080);
    CGXStyle white = CGXStyle().SetReadOnly(FALSE).SetInterior(0xFFFFFF);
};

TEST_F(Lock, IsOnFromTheStart) {
    EXPECT_TRUE(grid.GetParam()->IsLockReadOnly());
}

TEST_F(Lock, LetsAWritableCellBecomeReadOnly) {
    grid.SetStyleRange(CGXRange(1, 1), grey);

    EXPECT_TRUE(of(1, 1).GetReadOnly());
    EXPECT_EQ(of(1, 1).GetInterior(), 0x808080U);
}

TEST_F(Lock, KeepsTheStyleOfAReadOnlyCellAndLetsItsValueChange) {
    grid.SetStyleRange(CGXRange(1, 1), grey);

    EXPECT_TRUE(grid.SetStyleRange(CGXRange(1, 1), CGXStyle(white).SetValue("new")));
    EXPECT_TRUE(grid.SetValueRange(CGXRange(1, 1), "newer"));

    EXPECT_TRUE(of(1, 1).GetReadOnly());
    EXPECT_EQ(of(1, 1).GetInterior(), 0x808080U);
    EXPECT_EQ(grid.text(1, 1), "newer");
    grid.SetStyleRange(CGXRange(1, 1), CGXStyle(white).SetValue("newest"));
    EXPECT_EQ(grid.text(1, 1), "newest");
}

TEST_F(Lock, LiftedLetsAReadOnlyCellBecomeWritable) {
    grid.SetStyleRange(CGXRange(1, 1), grey);

    grid.GetParam()->SetLockReadOnly(FALSE);
    grid.SetStyleRange(CGXRange(1, 1), white);
    grid.GetParam()->SetLockReadOnly(TRUE);

    EXPECT_FALSE(of(1, 1).GetReadOnly());
    EXPECT_EQ(of(1, 1).GetInterior(), 0xFFFFFFU);
}

TEST_F(Lock, KeepsTheStyleOfACellThatIsReadOnlyByItsColumnOrLine) {
    grid.SetStyleRange(CGXRange().SetCols(1), CGXStyle().SetReadOnly(TRUE));
    grid.SetStyleRange(CGXRange().SetRows(2), CGXStyle().SetReadOnly(TRUE));

    grid.SetStyleRange(CGXRange(1, 1), white);
    grid.SetStyleRange(CGXRange(2, 2), white);

    EXPECT_FALSE(of(1, 1).HasInterior());
    EXPECT_TRUE(of(1, 1).GetReadOnly());
    EXPECT_FALSE(of(2, 2).HasInterior());
}

TEST_F(Lock, LetsACellChangeThatIsWritableInAReadOnlyColumn) {
    grid.SetStyleRange(CGXRange(1, 1), CGXStyle().SetReadOnly(FALSE));
    grid.SetStyleRange(CGXRange().SetCols(1), CGXStyle().SetReadOnly(TRUE));

    grid.SetStyleRange(CGXRange(1, 1), CGXStyle().SetInterior(5));

    EXPECT_EQ(of(1, 1).GetInterior(), 5U);
}

TEST_F(Lock, KeepsTheStyleOfAReadOnlyColumnAndLetsItsValueChange) {
    grid.SetStyleRange(CGXRange().SetCols(1), grey);

    grid.SetStyleRange(CGXRange().SetCols(1), CGXStyle(white).SetValue("default"));

    EXPECT_TRUE(of(1, 1).GetReadOnly());
    EXPECT_EQ(of(1, 1).GetInterior(), 0x808080U);
    EXPECT_EQ(grid.text(1, 1), "default");
}

TEST_F(Lock, KeepsTheStyleOfAReadOnlyLineAndLetsItsValueChange) {
    grid.SetStyleRange(CGXRange().SetRows(2), grey);

    grid.SetStyleRange(CGXRange().SetRows(2), CGXStyle(white).SetValue("default"));

    EXPECT_TRUE(of(2, 1).GetReadOnly());
    EXPECT_EQ(of(2, 1).GetInterior(), 0x808080U);
    EXPECT_EQ(grid.text(2, 1), "default");
}

} // namespace
