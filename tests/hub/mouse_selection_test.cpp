#include "tests/hub/shown_grid.h"

namespace {

using kota::test::ShownGrid;

class AMouseSelection : public ShownGrid {
protected:
    AMouseSelection() {
        grid.SetStyleRange(CGXRange().SetCols(3), CGXStyle().SetControl(GX_IDS_CTRL_CHECKBOX));
        show();
    }
    // Holds the button down on the widget at `from` and moves to `to`, both in the view.
    void drag(QPoint from, QPoint to) {
        QWidget& there = at(from);
        QTest::mousePress(&there, Qt::LeftButton, {}, there.mapFrom(&view(), from));
        settle();
        move(there, to);
        held_ = &there;
    }
    void move(QWidget& there, QPoint to) {
        const QPoint place = there.mapFrom(&view(), to);
        QMouseEvent move(QEvent::MouseMove, place, there.mapToGlobal(place), Qt::NoButton, Qt::LeftButton,
                         {});
        QApplication::sendEvent(&there, &move);
        settle();
    }
    void release(QPoint at) {
        QTest::mouseRelease(held_, Qt::LeftButton, {}, held_->mapFrom(&view(), at));
        settle();
    }
    QPoint lineHead(ROWCOL row) { return {10, centre(row, 1).y()}; }
    CGXRange selected() const {
        const auto& ranges = grid.GetParam()->GetRangeList()->Ranges();
        return ranges.size() == 1 ? ranges.front() : CGXRange();
    }

private:
    QWidget* held_ = nullptr;
};

TEST_F(AMouseSelection, SelectsTheCellsThatTheMouseIsDraggedOver) {
    drag(centre(4, 2), centre(7, 4));
    EXPECT_EQ(selected(), CGXRange(4, 2, 7, 4));
    EXPECT_EQ(cursor(), std::make_pair(4U, 2U));
    move(at(centre(4, 2)), centre(3, 1));
    EXPECT_EQ(selected(), CGXRange(3, 1, 4, 2));
    release(centre(3, 1));
    move(at(centre(4, 2)), centre(9, 4));
    EXPECT_EQ(selected(), CGXRange(3, 1, 4, 2)) << "the button is up";
}

TEST_F(AMouseSelection, SelectsFromTheCurrentCellWithShift) {
    click(5, 4);
    click(3, 2, Qt::ShiftModifier);
    EXPECT_EQ(selected(), CGXRange(3, 2, 5, 4));
    click(6, 4, Qt::ShiftModifier);
    EXPECT_EQ(selected(), CGXRange(5, 4, 6, 4));
    EXPECT_EQ(cursor(), std::make_pair(5U, 4U));
    click(2, 2);
    EXPECT_EQ(selected(), CGXRange());
}

TEST_F(AMouseSelection, ChangesACheckBoxThatIsClickedAndNotOneThatIsDraggedFrom) {
    drag(centre(2, 3), centre(4, 4));
    release(centre(4, 4));
    EXPECT_EQ(selected(), CGXRange(2, 3, 4, 4));
    EXPECT_EQ(held(2, 3), "");
    click(2, 3);
    EXPECT_EQ(held(2, 3), "1");
}

TEST_F(AMouseSelection, ScrollsWhenTheMouseIsDraggedBeyondAnEdge) {
    const int top = view().verticalScrollBar()->value();
    const QPoint below(centre(4, 2).x(), view().height() + 20);
    drag(centre(4, 2), below);
    EXPECT_GT(view().verticalScrollBar()->value(), top);
    const ROWCOL reached = selected().bottom;
    EXPECT_TRUE(view().rect().contains(centre(reached, 2)));
    EXPECT_TRUE(QTest::qWaitFor([&] { return selected().bottom > reached; })) << "it goes on by itself";
    release(below);
}

TEST_F(AMouseSelection, StaysBelowTheHeaderLines) {
    change([this] { grid.SetFrozenRows(1, 1); });
    drag(centre(4, 2), centre(1, 4));
    EXPECT_EQ(selected(), CGXRange(2, 2, 4, 4));
    release(centre(1, 4));
}

TEST_F(ShownGrid, HasRoomForTheNumberOfItsLastLine) {
    grid.SetRowCount(1234567);
    show();

    const QHeaderView& numbers = *view().verticalHeader();
    EXPECT_GE(numbers.width(), numbers.fontMetrics().horizontalAdvance("1234567"));
}

TEST_F(AMouseSelection, SelectsTheLinesWhoseHeadersTheMouseIsDraggedOver) {
    drag(lineHead(3), lineHead(6));
    std::vector<ROWCOL> lines;
    grid.GetSelectedRows(lines);
    EXPECT_EQ(lines, (std::vector<ROWCOL>{3, 4, 5, 6}));
    move(at(lineHead(3)), lineHead(2));
    grid.GetSelectedRows(lines);
    EXPECT_EQ(lines, (std::vector<ROWCOL>{2, 3}));
    release(lineHead(2));
    move(at(lineHead(3)), lineHead(8));
    grid.GetSelectedRows(lines);
    EXPECT_EQ(lines.size(), 2U) << "the button is up";
}

} // namespace
