#include "platform/grid/user.h"
#include "tests/hub/shown_grid.h"

#include <QLabel>

#include <memory>

namespace {

using kota::test::ShownGrid;

// Takes numbers without letters.
class Digits : public CGXEditControl {
public:
    explicit Digits(CGXGridCore* grid) : CGXEditControl(grid, 0) {}
    BOOL OnValidate() override {
        Grid()->SetWarningText("Digits only");
        return GetCurrentText().View().find('x') == std::string_view::npos;
    }
};

// Two frozen columns, and two frozen lines of which the first is a header.
class AFrozenGrid : public ShownGrid {
protected:
    AFrozenGrid() {
        grid.RegisterControl(4711, std::make_unique<Digits>(&grid));
        grid.SetStyleRange(CGXRange().SetTable(), CGXStyle().SetControl(4711));
        grid.SetFrozenRows(2, 1);
        grid.SetFrozenCols(2, 0);
        for (ROWCOL col = 1; col <= 12; ++col)
            grid.SetValueRange(CGXRange(1, col), "Unit");
        show();
    }
    void scrollToTheEnd() {
        view().horizontalScrollBar()->setValue(view().horizontalScrollBar()->maximum());
        view().verticalScrollBar()->setValue(view().verticalScrollBar()->maximum());
        settle();
    }
    QRect seen() { return view().rect(); }
    // A colour at the edge of a cell, where it has no text.
    QColor colourOf(ROWCOL row, ROWCOL col) {
        const QRect cell = view().visualRect(index(row, col)).translated(view().viewport()->pos());
        return picture().pixelColor(cell.right() - 4, cell.top() + 4);
    }
    QLabel* shownWarning() {
        for (QLabel* label : view().findChildren<QLabel*>())
            if (label->isVisible())
                return label;
        return nullptr;
    }
};

TEST_F(AFrozenGrid, KeepsItsFrozenCellsInPlaceWhenItScrolls) {
    const QPoint both = centre(2, 1);
    const QPoint column = centre(3, 2);
    const QPoint line = centre(2, 3);
    scrollToTheEnd();

    EXPECT_EQ(centre(2, 1), both);
    EXPECT_EQ(centre(100, 2).x(), column.x());
    EXPECT_EQ(centre(2, 12).y(), line.y());
    EXPECT_TRUE(seen().contains(centre(100, 2)));
    EXPECT_TRUE(seen().contains(centre(2, 12)));
    EXPECT_FALSE(seen().contains(centre(3, 2)));
}

TEST_F(AFrozenGrid, TakesClicksInItsFrozenCells) {
    scrollToTheEnd();
    const std::pair<ROWCOL, ROWCOL> cells[] = {{2, 1}, {2, 12}, {100, 2}, {99, 1}, {100, 12}};
    for (const auto& [row, col] : cells) {
        click(row, col);
        EXPECT_EQ(cursor(), std::make_pair(row, col));
    }
    click(1, 1);
    EXPECT_EQ(cursor(), std::make_pair(100U, 12U)) << "a header is no cell to go to";
}

TEST_F(AFrozenGrid, IsEditedInItsFrozenCells) {
    scrollToTheEnd();
    const std::pair<ROWCOL, ROWCOL> cells[] = {{2, 1}, {2, 12}, {100, 2}};
    for (const auto& [row, col] : cells) {
        click(row, col);
        type("12");
        auto* const line = qobject_cast<QLineEdit*>(QApplication::focusWidget());
        ASSERT_TRUE(line && line->isVisible());
        EXPECT_TRUE(line->rect().contains(line->mapFrom(&view(), centre(row, col))));
        click(99, 11);
        EXPECT_EQ(held(row, col), "12");
        scrollToTheEnd();
    }
}

TEST_F(AFrozenGrid, OpensAFrozenCellThatIsClickedTwice) {
    click(3, 1);
    QWidget& there = at(centre(3, 1));
    QTest::mouseDClick(&there, Qt::LeftButton, {}, there.mapFrom(&view(), centre(3, 1)));
    settle();
    EXPECT_TRUE(grid.IsEditing());
}

TEST_F(AFrozenGrid, WarnsAtAFrozenCell) {
    scrollToTheEnd();
    click(2, 1);
    type("x");
    click(100, 12);
    ASSERT_TRUE(shownWarning());
    EXPECT_EQ(shownWarning()->text(), "Digits only");
    EXPECT_EQ(cursor(), std::make_pair(2U, 1U));
    EXPECT_GT(shownWarning()->y(), centre(2, 1).y());
    EXPECT_LT(shownWarning()->y(), centre(2, 1).y() + 40);
}

TEST_F(AFrozenGrid, ScrollsOnlyAsFarAsTheCurrentCellNeeds) {
    scrollToTheEnd();
    const int across = view().horizontalScrollBar()->value();
    change([this] { grid.SetCurrentCell(50, 1); });
    EXPECT_TRUE(seen().contains(centre(50, 1)));
    EXPECT_EQ(view().horizontalScrollBar()->value(), across);
    const int down = view().verticalScrollBar()->value();
    change([this] { grid.SetCurrentCell(2, 4); });
    EXPECT_TRUE(seen().contains(centre(2, 4)));
    EXPECT_EQ(view().verticalScrollBar()->value(), down);
}

TEST_F(AFrozenGrid, BeginsBehindItsFrozenCells) {
    EXPECT_EQ(view().rowAt(2), 2);
    EXPECT_EQ(view().columnAt(0), 2);
    click(3, 3);
    press(Qt::Key_PageDown);
    press(Qt::Key_Home, Qt::ControlModifier);
    EXPECT_EQ(cursor(), std::make_pair(2U, 1U));
    press(Qt::Key_Down);
    EXPECT_EQ(view().rowAt(2), 2) << "the first line that scrolls";
}

TEST_F(AFrozenGrid, DrawsAHeaderLineLikeAHeader) {
    EXPECT_EQ(colourOf(1, 4), colourOf(1, 1));
    EXPECT_NE(colourOf(1, 4), colourOf(2, 4));
    EXPECT_EQ(view().model()->headerData(0, Qt::Vertical), "") << "no number";
    EXPECT_EQ(view().model()->headerData(1, Qt::Vertical), "2");
    change([this] { grid.SetValueRange(CGXRange(1, 0), "No."); });
    EXPECT_EQ(view().model()->headerData(0, Qt::Vertical), "No.");
}

TEST_F(AFrozenGrid, ShowsWhatIsSelectedAmongItsFrozenCells) {
    const QColor plain = colourOf(3, 2);
    change([this] { kota::grid::clickLineHeader(grid, 3); });
    EXPECT_NE(colourOf(3, 2), plain);
    EXPECT_EQ(colourOf(3, 2), colourOf(3, 5));
    EXPECT_EQ(colourOf(4, 2), plain);
}

TEST_F(AFrozenGrid, ShowsAValueThatAFrozenCellIsGiven) {
    const QImage before = picture();
    change([this] { grid.SetValueRange(CGXRange(3, 2), "88888"); });
    EXPECT_NE(picture(), before);
    const QImage then = picture();
    change([this] { grid.SetValueRange(CGXRange(2, 4), "88888"); });
    EXPECT_NE(picture(), then);
}

TEST_F(AFrozenGrid, GivesUpItsFrozenCells) {
    change([this] {
        grid.SetFrozenRows(0, 0);
        grid.SetFrozenCols(0, 0);
    });
    EXPECT_EQ(view().rowAt(2), 0);
    EXPECT_EQ(view().columnAt(2), 0);
    EXPECT_EQ(view().visualRect(index(1, 1)).height(), view().visualRect(index(50, 1)).height());
    scrollToTheEnd();
    EXPECT_FALSE(seen().contains(centre(1, 1)));
}

TEST_F(AFrozenGrid, LetsTheUserWidenAFrozenColumn) {
    const QRect cell = view().visualRect(index(3, 1)).translated(view().viewport()->pos());
    const int right = centre(3, 3).x();
    const QPoint edge(cell.right(), 8);
    QWidget& head = at(edge);
    const QPoint from = head.mapFrom(&view(), edge);
    QTest::mousePress(&head, Qt::LeftButton, {}, from);
    QMouseEvent move(QEvent::MouseMove, from + QPoint(30, 0), head.mapToGlobal(from + QPoint(30, 0)),
                     Qt::NoButton, Qt::LeftButton, {});
    QApplication::sendEvent(&head, &move);
    QTest::mouseRelease(&head, Qt::LeftButton, {}, from + QPoint(30, 0));
    settle();
    EXPECT_EQ(view().visualRect(index(3, 1)).width(), cell.width() + 30);
    EXPECT_EQ(centre(3, 3).x(), right + 30);
}

// Headings over several columns, in line 0 and below, and cells that are one.
class AGridWithCoveredCells : public ShownGrid {
protected:
    AGridWithCoveredCells() {
        grid.SetFrozenRows(1, 1);
        show();
    }
    bool shows(const CGXRange& cell) {
        const QImage before = picture();
        change([&] { grid.SetValueRange(cell, "#####"); });
        return picture() != before;
    }
};

TEST_F(AGridWithCoveredCells, ShowsOneHeadingOverSeveralColumns) {
    change([this] { grid.SetCoveredCellsRowCol(0, 2, 0, 4); });
    EXPECT_TRUE(shows({0, 2}));
    EXPECT_FALSE(shows({0, 3}));
    EXPECT_FALSE(shows({0, 4}));
    EXPECT_TRUE(shows({0, 5}));
}

TEST_F(AGridWithCoveredCells, ShowsOneHeadingOverSeveralColumnsInAHeaderLine) {
    change([this] { grid.SetCoveredCellsRowCol(1, 2, 1, 4); });
    EXPECT_TRUE(shows({1, 2}));
    EXPECT_FALSE(shows({1, 3}));
    EXPECT_TRUE(shows({1, 5}));
}

TEST_F(AGridWithCoveredCells, ShowsAHeadingOverBothHeaderLines) {
    change([this] { grid.SetCoveredCellsRowCol(0, 1, 1, 1); });
    EXPECT_TRUE(shows({0, 1}));
    EXPECT_FALSE(shows({1, 1}));
    const QImage before = picture();
    change([this] { grid.SetCoveredCellsRowCol(0, 1, 0, 1); });
    EXPECT_NE(picture(), before);
}

TEST_F(AGridWithCoveredCells, TakesCellsThatAreOneAsOne) {
    change([this] { grid.SetCoveredCellsRowCol(3, 2, 4, 3); });
    const QRect one = view().visualRect(index(3, 2));
    EXPECT_EQ(view().visualRect(index(4, 3)), one);
    EXPECT_GT(one.height(), view().visualRect(index(5, 2)).height());
    EXPECT_FALSE(shows({4, 3}));
    click(4, 3);
    EXPECT_EQ(cursor(), std::make_pair(3U, 2U));
    type("1");
    click(6, 1);
    EXPECT_EQ(held(3, 2), "1");
}

TEST_F(AGridWithCoveredCells, FindsCellsThatAreOneWhenTheyComeIntoView) {
    change([this] { grid.SetCoveredCellsRowCol(80, 2, 81, 3); });
    change([this] { grid.SetCurrentCell(85, 1); });
    EXPECT_FALSE(shows({81, 3}));
    EXPECT_TRUE(shows({80, 2}));
}

TEST_F(AFrozenGrid, CanBeLookedAt) {
    change([this] {
        grid.SetCoveredCellsRowCol(0, 3, 0, 5);
        grid.SetCoveredCellsRowCol(0, 1, 1, 1);
        grid.SetValueRange(CGXRange(2, 1, 100, 12), "0.344");
        grid.SetValueRange(CGXRange(0, 3), "A heading over three columns");
        grid.SetStyleRange(CGXRange(2, 1, 2, 12), CGXStyle().SetReadOnly(TRUE));
    });
    change([this] { kota::grid::selectCells(grid, CGXRange(4, 1, 6, 4)); });
    click(3, 2);
    EXPECT_TRUE(takePicture("Frozen"));
    scrollToTheEnd();
    EXPECT_TRUE(takePicture("Frozen and scrolled"));
}

} // namespace
