#include "hub/screen/grid_sizes.h"

#include "hub/screen/grid_model.h"
#include "hub/screen/grid_view.h"

#include <algorithm>

namespace kota::hub {

namespace {

// The platform's units: a character is so many of them wide, and a line of text so many high.
constexpr int unitsOfCharacter = 4;
constexpr int unitsOfLine = 15;
constexpr int margin = 6;

int scaledWidth(const GridView& view, int width) {
    return width * view.fontMetrics().averageCharWidth() / unitsOfCharacter;
}

int scaledHeight(const GridView& view, int height) {
    const QFontMetrics metrics = view.fontMetrics();
    return std::max(height * metrics.height() / unitsOfLine, metrics.height() + margin);
}

// The widest word of a column's headings but for those over several columns.
int widestWord(const CGXGridCore& grid, const GridView& view, ROWCOL col) {
    const QFontMetrics metrics = view.horizontalHeader()->fontMetrics();
    int widest = 0;
    for (ROWCOL row = 0; row <= grid.GetHeaderRows(); ++row) {
        const CGXRange cells = view.grid().cover(row, col);
        if (cells.left != cells.right)
            continue;
        for (const QString& word : view.grid().look(row, col).text.split(' '))
            widest = std::max(widest, metrics.horizontalAdvance(word));
    }
    return widest + 2 * margin;
}

int headingHeight(const GridView& view, ROWCOL row, ROWCOL col) {
    const CGXRange cells = view.grid().cover(row, col);
    if (cells.bottom != row)
        return 0;
    const QRect room(0, 0, view.places().area(cells).width() - 2 * margin, 10000);
    const QFontMetrics metrics = view.horizontalHeader()->fontMetrics();
    const QString text = view.grid().look(row, col).text;
    return metrics.boundingRect(room, Qt::AlignCenter | Qt::TextWordWrap, text).height() + 2 * margin;
}

// Of line 0 and of the frozen lines.
std::vector<int> frozenHeights(const CGXGridCore& grid, const GridView& view) {
    std::vector<int> heights;
    for (ROWCOL row = 0; row <= std::min(grid.GetFrozenRows(), grid.GetRowCount()); ++row) {
        int height = scaledHeight(view, grid.GetRowHeight(row));
        if (row <= grid.GetHeaderRows())
            for (ROWCOL col = 1; col <= grid.GetColCount(); ++col)
                height = std::max(height, headingHeight(view, row, col));
        heights.push_back(height);
    }
    return heights;
}

} // namespace

void GridSizes::showWidths(const CGXGridCore& grid, GridView& view) {
    const ROWCOL frozen = view.places().frozenCols();
    if (frozen != frozenCols_)
        widths_.clear();
    frozenCols_ = frozen;
    widths_.resize(grid.GetColCount(), -1);
    for (ROWCOL col = 1; col <= grid.GetColCount(); ++col) {
        int& shown = widths_[col - 1];
        const int width = grid.GetColWidth(col);
        if (shown != width)
            view.places().headOf(col).resizeSection(
                static_cast<int>(col) - 1, std::max(scaledWidth(view, width), widestWord(grid, view, col)));
        shown = width;
    }
}

void GridSizes::show(const CGXGridCore& grid, GridView& view) {
    const ROWCOL firstLine = std::min(grid.GetFrozenRows() + 1, grid.GetRowCount());
    const int lineHeight = scaledHeight(view, grid.GetRowHeight(firstLine));
    if (firstLine > 0 && view.verticalHeader()->defaultSectionSize() != lineHeight)
        view.verticalHeader()->setDefaultSectionSize(lineHeight);
    GridPlaces& places = view.places();
    const QString lastNumber = QString::number(grid.GetRowCount());
    places.setNumbersWidth(
        std::max(scaledWidth(view, grid.GetColWidth(0)),
                 view.verticalHeader()->fontMetrics().horizontalAdvance(lastNumber) + 2 * margin));
    places.freezeCols(std::min(grid.GetFrozenCols(), grid.GetColCount()));
    showWidths(grid, view);
    places.freezeRows(frozenHeights(grid, view));
    view.followLayout();
}

} // namespace kota::hub
