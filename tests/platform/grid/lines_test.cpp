#include "tests/platform/grid/test_grid.h"

namespace {

class Lines : public testing::Test {
protected:
    Lines() {
        for (ROWCOL row = 1; row <= 4; ++row)
            grid.write(row, 1, std::to_string(row * 10).c_str());
    }
    std::string column(ROWCOL col = 1) const {
        std::string texts;
        for (ROWCOL row = 1; row <= grid.GetRowCount(); ++row)
            texts += (row > 1 ? " " : "") + (grid.text(row, col).empty() ? "-" : grid.text(row, col));
        return texts;
    }

    TestGrid grid{4};
};

TEST_F(Lines, AreAppended) {
    EXPECT_TRUE(grid.InsertRows(5, 2));

    EXPECT_EQ(grid.GetRowCount(), 6U);
    EXPECT_EQ(column(), "10 20 30 40 - -");
}

TEST_F(Lines, AreInsertedInFrontOfALine) {
    EXPECT_TRUE(grid.InsertRows(2, 2));

    EXPECT_EQ(column(), "10 - - 20 30 40");
}

TEST_F(Lines, AreNotInsertedBeyondTheEndOrInTheHeader) {
    EXPECT_FALSE(grid.InsertRows(6, 1));
    EXPECT_FALSE(grid.InsertRows(0, 1));
    EXPECT_FALSE(grid.InsertRows(1, 0xFFFFFFFF));

    EXPECT_EQ(grid.GetRowCount(), 4U);
    EXPECT_EQ(column(), "10 20 30 40");
}

TEST_F(Lines, AreRemoved) {
    EXPECT_TRUE(grid.RemoveRows(2, 3));

    EXPECT_EQ(column(), "10 40");
}

TEST_F(Lines, AreRemovedAsFarAsTheyExist) {
    EXPECT_TRUE(grid.RemoveRows(3, 100));
    EXPECT_FALSE(grid.RemoveRows(3, 100));
    EXPECT_FALSE(grid.RemoveRows(2, 1));
    EXPECT_FALSE(grid.RemoveRows(0, 0));

    EXPECT_EQ(column(), "10 20");
}

TEST_F(Lines, AreForgottenWhenTheCountFalls) {
    grid.SetStyleRange(CGXRange(3, 1), CGXStyle().SetInterior(5));
    grid.SetStyleRange(CGXRange().SetRows(4), CGXStyle().SetInterior(6));
    grid.SetRowHeight(4, 4, 33);
    grid.SetRowCount(2);

    grid.SetRowCount(5);

    EXPECT_EQ(column(), "10 20 - - -");
    CGXStyle style;
    grid.ComposeStyleRowCol(3, 1, &style);
    EXPECT_FALSE(style.HasInterior());
    grid.ComposeStyleRowCol(4, 1, &style);
    EXPECT_FALSE(style.HasInterior());
    EXPECT_EQ(grid.GetRowHeight(4), 20);
}

TEST_F(Lines, TakeTheirStylesAndHeightsAlong) {
    grid.SetStyleRange(CGXRange(3, 1), CGXStyle().SetInterior(5));
    grid.SetStyleRange(CGXRange().SetRows(3), CGXStyle().SetUserAttribute(1, "line"));
    grid.SetRowHeight(3, 3, 33);

    grid.InsertRows(1, 2);
    grid.RemoveRows(2, 2);

    CGXStyle style;
    grid.ComposeStyleRowCol(4, 1, &style);
    EXPECT_EQ(style.GetInterior(), 5U);
    EXPECT_EQ(style.GetUserAttribute(1), "line");
    EXPECT_EQ(grid.GetRowHeight(4), 33);
    EXPECT_EQ(grid.GetRowHeight(3), 20);
    grid.ComposeStyleRowCol(3, 1, &style);
    EXPECT_FALSE(style.HasInterior());
}

TEST_F(Lines, AreWithoutStylesWhenTheyAreNew) {
    grid.SetStyleRange(CGXRange(2, 1, 4, 1), CGXStyle().SetInterior(5));
    grid.SetStyleRange(CGXRange().SetRows(2, 4), CGXStyle().SetUserAttribute(1, "line"));
    grid.SetRowHeight(2, 4, 33);

    grid.InsertRows(2, 1);

    CGXStyle style;
    grid.ComposeStyleRowCol(2, 1, &style);
    EXPECT_FALSE(style.HasInterior());
    EXPECT_EQ(style.GetUserAttribute(1), "");
    EXPECT_EQ(grid.GetRowHeight(2), 20);
    EXPECT_EQ(grid.GetRowHeight(3), 33);
}

TEST_F(Lines, KeepTheHeaderWhenAllGo) {
    grid.write(0, 1, "River");

    grid.SetRowCount(0);

    EXPECT_EQ(grid.GetRowCount(), 0U);
    EXPECT_EQ(grid.text(0, 1), "River");
}

TEST_F(Lines, NeverMoveTheCurrentCell) {
    grid.goTo(3, 1);

    grid.InsertRows(1, 1);
    grid.RemoveRows(3, 5);
    EXPECT_EQ(grid.current(), "3,1");
    grid.SetRowCount(1);
    EXPECT_EQ(grid.current(), "3,1");
    grid.SetRowCount(10);

    EXPECT_EQ(grid.current(), "3,1");
    EXPECT_THAT(grid.calls, testing::IsEmpty());
}

TEST_F(Lines, ThatAreWrittenLastFirstHoldTheirTexts) {
    grid.SetRowCount(100);

    grid.write(100, 2, "last");
    grid.write(50, 2, "middle");

    EXPECT_EQ(grid.text(100, 2), "last");
    EXPECT_EQ(grid.text(50, 2), "middle");
    EXPECT_EQ(grid.text(99, 2), "");
}

TEST_F(Lines, MayBeAMillion) {
    constexpr ROWCOL million = 1'000'000;
    grid.SetColCount(6);
    grid.SetRowCount(million);
    grid.SetStyleRange(CGXRange().SetCols(6), CGXStyle().SetValue("default"));

    for (ROWCOL row = 1; row <= million; ++row)
        for (ROWCOL col = 1; col <= 5; ++col)
            grid.SetValueRange(CGXRange(row, col), static_cast<int>(row * 10 + col));
    grid.RemoveRows(1, 1);
    grid.InsertRows(million, 1);

    EXPECT_EQ(grid.GetRowCount(), million);
    EXPECT_EQ(grid.text(1, 1), "21");
    EXPECT_EQ(grid.text(million - 1, 5), "10000005");
    EXPECT_EQ(grid.text(million, 5), "");
    EXPECT_EQ(grid.text(million, 6), "default");
    EXPECT_EQ(grid.GetValueRowCol(million, 0), "1000000");
    grid.SetRowCount(1);
    EXPECT_EQ(grid.text(1, 5), "25");
}

TEST(Columns, AreForgottenWhenTheCountFalls) {
    TestGrid grid;
    grid.write(1, 5, "x");
    grid.SetColWidth(5, 5, 99);
    grid.SetColCount(4);

    grid.SetColCount(5);

    EXPECT_EQ(grid.GetColCount(), 5U);
    EXPECT_EQ(grid.text(1, 5), "");
    EXPECT_EQ(grid.GetColWidth(5), 60);
    EXPECT_EQ(grid.GetControl(1, 5)->Kind(), kota::CellKind::Text);
}

TEST(Sizes, AreThoseOfTheGridUntilTheyAreSet) {
    TestGrid grid;
    EXPECT_EQ(grid.GetRowHeight(0), 20);
    EXPECT_EQ(grid.GetColWidth(1), 60);

    EXPECT_TRUE(grid.SetRowHeight(0, 1, 40));
    EXPECT_TRUE(grid.SetColWidth(0, 2, 30));

    EXPECT_EQ(grid.GetRowHeight(0), 40);
    EXPECT_EQ(grid.GetRowHeight(1), 40);
    EXPECT_EQ(grid.GetRowHeight(2), 20);
    EXPECT_EQ(grid.GetColWidth(0), 30);
    EXPECT_EQ(grid.GetColWidth(2), 30);
    EXPECT_EQ(grid.GetColWidth(3), 60);
}

TEST(Sizes, OfALastBelowTheFirstAreThoseOfTheFirst) {
    TestGrid grid;

    EXPECT_TRUE(grid.SetRowHeight(1, 0, 40));
    EXPECT_TRUE(grid.SetColWidth(2, 1, 40));

    EXPECT_EQ(grid.GetRowHeight(0), 20);
    EXPECT_EQ(grid.GetRowHeight(1), 40);
    EXPECT_EQ(grid.GetRowHeight(2), 20);
    EXPECT_EQ(grid.GetColWidth(1), 60);
    EXPECT_EQ(grid.GetColWidth(2), 40);
}

TEST(Sizes, OfWhatIsNotThereAreNotSet) {
    TestGrid grid;

    EXPECT_FALSE(grid.SetRowHeight(5, 9, 40));
    EXPECT_FALSE(grid.SetColWidth(6, 9, 40));

    grid.SetRowCount(5);
    EXPECT_EQ(grid.GetRowHeight(5), 20);
    EXPECT_EQ(grid.GetColWidth(6), 60);
}

TEST(CoveredCells, AreOneCell) {
    TestGrid grid;

    EXPECT_TRUE(grid.SetCoveredCellsRowCol(1, 1, 2, 3));

    EXPECT_EQ(grid.GetCoveredCellsRowCol(2, 2), CGXRange(1, 1, 2, 3));
    EXPECT_EQ(grid.GetCoveredCellsRowCol(3, 3), CGXRange(3, 3));
}

TEST(CoveredCells, GiveWayToThoseThatOverlapThem) {
    TestGrid grid;
    grid.SetCoveredCellsRowCol(1, 1, 2, 3);

    grid.SetCoveredCellsRowCol(1, 3, 1, 4);

    EXPECT_EQ(grid.GetCoveredCellsRowCol(1, 1), CGXRange(1, 1));
    EXPECT_EQ(grid.GetCoveredCellsRowCol(1, 4), CGXRange(1, 3, 1, 4));
    grid.SetCoveredCellsRowCol(1, 3, 1, 3);
    EXPECT_EQ(grid.GetCoveredCellsRowCol(1, 4), CGXRange(1, 4));
}

TEST(CoveredCells, MustExistAndFollowTheirLines) {
    TestGrid grid;
    EXPECT_FALSE(grid.SetCoveredCellsRowCol(4, 1, 5, 1));
    EXPECT_FALSE(grid.SetCoveredCellsRowCol(1, 1, 1, 6));
    grid.SetCoveredCellsRowCol(1, 1, 1, 2);

    grid.InsertRows(1, 1);

    EXPECT_EQ(grid.GetCoveredCellsRowCol(2, 2), CGXRange(2, 1, 2, 2));
    grid.RemoveRows(2, 2);
    EXPECT_EQ(grid.GetCoveredCellsRowCol(2, 2), CGXRange(2, 2));
}

TEST(FrozenLines, AreHeadersAsFarAsTold) {
    TestGrid grid;

    grid.SetFrozenRows(2, 1);
    grid.SetFrozenCols(1, 5);

    EXPECT_EQ(grid.GetFrozenRows(), 2U);
    EXPECT_EQ(grid.GetHeaderRows(), 1U);
    EXPECT_EQ(grid.GetFrozenCols(), 1U);
    EXPECT_EQ(grid.GetHeaderCols(), 1U);
}

TEST(View, StartsBehindWhatIsFrozenAndEndsWithTheGrid) {
    TestGrid grid;
    EXPECT_EQ(grid.GetLeftCol(), 1U);
    EXPECT_EQ(grid.GetTopRow(), 1U);

    grid.SetLeftCol(4);
    grid.SetTopRow(9);
    EXPECT_EQ(grid.GetLeftCol(), 4U);
    EXPECT_EQ(grid.GetTopRow(), 4U);
    grid.SetColCount(2);
    EXPECT_EQ(grid.GetLeftCol(), 2U);
    grid.SetRowCount(0);
    EXPECT_EQ(grid.GetTopRow(), 1U);

    grid.SetLeftCol(0);
    grid.SetFrozenCols(1, 1);
    EXPECT_EQ(grid.GetLeftCol(), 2U);
    EXPECT_FALSE(grid.HasGridToolTips());
    grid.EnableGridToolTips();
    EXPECT_TRUE(grid.HasGridToolTips());
}

} // namespace
