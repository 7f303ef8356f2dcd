#include "hub/screen/pictures.h"
#include "platform/grid/user.h"
#include "tests/hub/colours.h"
#include "tests/hub/shown_grid.h"

#include <QHelpEvent>
#include <QToolTip>

#include <array>

namespace {

using kota::test::contrast;
using kota::test::darkPalette;
using kota::test::ShownGrid;

class AColouredGrid : public ShownGrid, public testing::WithParamInterface<bool> {
protected:
    AColouredGrid() : before_(QApplication::palette()) {
        if (GetParam())
            QApplication::setPalette(darkPalette());
        constexpr std::array<COLORREF, 5> interiors = {0xC0C0C0, 0x808080, 0xFFFFFF, 0x000000, 0xFF0000};
        for (ROWCOL row = 2; row <= 6; ++row)
            grid.SetStyleRange(CGXRange(row, 1, row, 5), CGXStyle().SetInterior(interiors[row - 2]));
        grid.SetStyleRange(CGXRange(1, 3, 8, 3), CGXStyle().SetControl(GX_IDS_CTRL_CHECKBOX));
        grid.SetStyleRange(CGXRange(1, 2, 8, 2), CGXStyle().SetControl(GX_IDS_CTRL_ZEROBASED_EX));
        grid.SetStyleRange(CGXRange(7, 1, 7, 5), CGXStyle().SetReadOnly(TRUE));
        grid.SetValueRange(CGXRange(1, 1, 8, 1), "####");
        grid.SetValueRange(CGXRange(1, 3, 4, 3), "1"); // those below are not checked
        show();
    }
    ~AColouredGrid() override { QApplication::setPalette(before_); }

    // The strongest contrast in a cell to the colour in its corner.
    double contrastIn(ROWCOL row, ROWCOL col) {
        const QRect cell = view().visualRect(index(row, col)).translated(view().viewport()->pos());
        const QImage image = picture();
        const QColor background = image.pixelColor(cell.topLeft() + QPoint(3, 3));
        double strongest = 1;
        for (int y = cell.top() + 3; y < cell.bottom() - 2; ++y)
            for (int x = cell.left() + 3; x < cell.right() - 2; ++x)
                strongest = std::max(strongest, contrast(image.pixelColor(x, y), background));
        return strongest;
    }
    QColor edgeOf(ROWCOL row, ROWCOL col) {
        const QRect cell = view().visualRect(index(row, col)).translated(view().viewport()->pos());
        return picture().pixelColor(cell.left() + 1, cell.center().y());
    }

private:
    QPalette before_;
};

TEST_P(AColouredGrid, CanBeRead) {
    for (ROWCOL row = 1; row <= 8; ++row)
        for (ROWCOL col = 1; col <= 3; ++col) {
            const bool hasNoArrow = row == 7 && col == 2; // it takes no input
            EXPECT_TRUE(hasNoArrow || contrastIn(row, col) > 3) << row << ", " << col;
        }
    EXPECT_TRUE(takePicture(GetParam() ? "Dark" : "Light"));
}

TEST_P(AColouredGrid, ShowsWhatIsSelected) {
    const QColor plain = edgeOf(8, 4);
    change([this] { kota::grid::selectCells(grid, CGXRange(1, 1, 8, 4)); });
    EXPECT_GT(contrast(edgeOf(8, 4), plain), 1.5);
    EXPECT_GT(contrastIn(8, 1), 3);
}

TEST_P(AColouredGrid, ShowsTheCurrentCell) {
    for (const ROWCOL row : {1U, 7U, 8U}) {
        const QColor plain = edgeOf(row, 4);
        change([&] { grid.SetCurrentCell(row, 4); });
        EXPECT_GT(contrast(edgeOf(row, 4), plain), 3) << row;
    }
    const QColor selected = [this] {
        change([this] { kota::grid::selectCells(grid, CGXRange(8, 4, 8, 5)); });
        return edgeOf(8, 5);
    }();
    EXPECT_GT(contrast(edgeOf(8, 4), selected), 3);
}

TEST_P(AColouredGrid, ShowsPicturesOnItsWindows) {
    constexpr std::array<const char*, 4> rows = {"2 1 2 1", ". c None", "o c #37474f", ".o"};
    const kota::BitmapResource outline{.id = 1, .rows = rows};
    const QColor drawn = kota::hub::pictureOf(&outline).toImage().pixelColor(1, 0);
    EXPECT_GT(contrast(drawn, QApplication::palette().color(QPalette::Window)), 3);
    EXPECT_EQ(kota::hub::pictureOf(&outline).toImage().pixelColor(0, 0).alpha(), 0);
}

INSTANTIATE_TEST_SUITE_P(Palettes, AColouredGrid, testing::Bool());

class ATextThatDoesNotFit : public ShownGrid {
protected:
    ATextThatDoesNotFit() {
        grid.EnableGridToolTips();
        show();
    }
    ~ATextThatDoesNotFit() override { QToolTip::hideText(); }

    // The tip that the pointer gets when it rests on a cell.
    std::string tip(ROWCOL row, ROWCOL col) {
        QToolTip::hideText();
        settle();
        QWidget& there = at(centre(row, col));
        const QPoint place = there.mapFrom(&view(), centre(row, col));
        QHelpEvent rest(QEvent::ToolTip, place, there.mapToGlobal(place));
        QApplication::sendEvent(&there, &rest);
        return QToolTip::isVisible() ? QToolTip::text().toStdString() : "";
    }
};

TEST_F(ATextThatDoesNotFit, IsToldAsATip) {
    change([this] {
        grid.SetValueRange(CGXRange(2, 2), "OXYGEN DEMAND OF THE SEDIMENT");
        grid.SetValueRange(CGXRange(3, 2), "SALT");
        grid.SetValueRange(CGXRange(4, 2), "OXYGEN DEMAND OF THE SEDIMENT");
        grid.SetStyleRange(CGXRange(4, 2), CGXStyle().SetUserAttribute(GX_IDS_UA_TOOLTIPTEXT, "Its own"));
    });
    EXPECT_EQ(tip(2, 2), "OXYGEN DEMAND OF THE SEDIMENT");
    EXPECT_EQ(tip(4, 2), "Its own");
    change([this] { grid.SetFrozenCols(2, 0); });
    EXPECT_EQ(tip(2, 2), "OXYGEN DEMAND OF THE SEDIMENT");
}

TEST_F(ATextThatDoesNotFit, IsNotToldWhereItFits) {
    change([this] { grid.SetValueRange(CGXRange(3, 2), "SALT"); });
    EXPECT_EQ(tip(3, 2), "");
}

} // namespace
