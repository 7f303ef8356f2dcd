#include "platform/framework/exception.h"
#include "platform/grid/range.h"

#include <gmock/gmock.h>

namespace {

TEST(Range, OfCellsHoldsItsRectangle) {
    const CGXRange range(2, 3, 4, 5);

    EXPECT_TRUE(range.IsCellInRange(2, 3));
    EXPECT_TRUE(range.IsCellInRange(4, 5));
    EXPECT_FALSE(range.IsCellInRange(1, 3));
    EXPECT_FALSE(range.IsCellInRange(5, 3));
    EXPECT_FALSE(range.IsCellInRange(2, 2));
    EXPECT_FALSE(range.IsCellInRange(2, 6));
}

TEST(Range, OfLinesHoldsThemInEveryColumn) {
    const CGXRange range = CGXRange().SetRows(2, 3);

    EXPECT_TRUE(range.IsCellInRange(2, 0));
    EXPECT_TRUE(range.IsCellInRange(3, 100));
    EXPECT_FALSE(range.IsCellInRange(4, 0));
}

TEST(Range, OfColumnsHoldsThemInEveryLine) {
    const CGXRange range = CGXRange().SetCols(2);

    EXPECT_TRUE(range.IsCellInRange(0, 2));
    EXPECT_TRUE(range.IsCellInRange(100, 2));
    EXPECT_FALSE(range.IsCellInRange(0, 1));
}

TEST(Range, OfAllHoldsEveryCellAndAFreshOneNone) {
    EXPECT_TRUE(CGXRange().SetTable().IsCellInRange(7, 7));
    EXPECT_FALSE(CGXRange().IsCellInRange(0, 0));
}

TEST(Range, OfLinesExpandsToARectangleWithinTheBounds) {
    CGXRange range = CGXRange().SetRows(0, 9);

    range.ExpandRange(1, 0, 4, 3);

    EXPECT_EQ(range, CGXRange(1, 0, 4, 3));
}

TEST(Range, OfColumnsExpandsToARectangleWithinTheBounds) {
    CGXRange range = CGXRange().SetCols(2, 9);

    range.ExpandRange(1, 0, 4, 3);

    EXPECT_EQ(range, CGXRange(1, 2, 4, 3));
}

TEST(Range, OfAllExpandsToTheBounds) {
    CGXRange range = CGXRange().SetTable();

    range.ExpandRange(1, 1, 4, 3);

    EXPECT_EQ(range, CGXRange(1, 1, 4, 3));
}

TEST(Range, OfCellsAndAFreshOneDoNotExpand) {
    CGXRange cells(2, 2, 9, 9);
    CGXRange none;

    cells.ExpandRange(1, 1, 4, 3);
    none.ExpandRange(1, 1, 4, 3);

    EXPECT_EQ(cells, CGXRange(2, 2, 9, 9));
    EXPECT_EQ(none.kind, CGXRange::Kind::None);
}

TEST(RangeList, GivesItsRangesInTheirOrder) {
    CGXRangeList list;
    EXPECT_TRUE(list.IsEmpty());

    list.Add(CGXRange().SetRows(4));
    list.Add(CGXRange().SetRows(2));

    EXPECT_EQ(list.GetCount(), 2);
    EXPECT_EQ(list.GetHead(), CGXRange().SetRows(4));
    list.Clear();
    EXPECT_TRUE(list.IsEmpty());
}

TEST(RangeList, HasNoHeadWhenItIsEmpty) {
    const CGXRangeList list;

    EXPECT_THROW(list.GetHead(), CInvalidArgException);
}

TEST(RangeList, TouchesTheHeaderColumnByWholeLinesAndAllAlone) {
    const auto touches = [](const CGXRange& range) {
        CGXRangeList list;
        list.Add(range);
        return list.IsAnyCellFromCol(0);
    };

    EXPECT_TRUE(touches(CGXRange().SetRows(2)));
    EXPECT_TRUE(touches(CGXRange().SetTable()));
    EXPECT_TRUE(touches(CGXRange(1, 0)));
    EXPECT_FALSE(touches(CGXRange(1, 1, 3, 3)));
    EXPECT_FALSE(touches(CGXRange().SetCols(1, 3)));
    EXPECT_FALSE(touches(CGXRange()));
}

TEST(RangeList, TouchesALineByWholeColumnsToo) {
    CGXRangeList list;
    list.Add(CGXRange(2, 1, 3, 1));
    EXPECT_TRUE(list.IsAnyCellFromRow(3));
    EXPECT_FALSE(list.IsAnyCellFromRow(4));

    list.Add(CGXRange().SetCols(1));

    EXPECT_TRUE(list.IsAnyCellFromRow(4));
}

} // namespace
