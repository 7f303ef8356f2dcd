#include "hub/screen/grid_sizes.h"

#include "platform/grid/grid.h"

#include <QHeaderView>
#include <QTableView>

#include <algorithm>

namespace kota::hub {

namespace {

// The platform's units: a character is so many of them wide, and a line of text so many high.
constexpr int unitsOfCharacter = 4;
constexpr int unitsOfLine = 15;
constexpr int margin = 6;

QString headingOf(const QTableView& view, int section) {
    return view.model()->headerData(section, Qt::Horizontal, Qt::DisplayRole).toString();
}

int scaledWidth(const QTableView& view, int width) {
    return width * view.fontMetrics().averageCharWidth() / unitsOfCharacter;
}

int scaledHeight(const QTableView& view, int height) {
    const QFontMetrics metrics = view.fontMetrics();
    return std::max(height * metrics.height() / unitsOfLine, metrics.height() + margin);
}

int widestWord(const QTableView& view, int section) {
    const QFontMetrics metrics = view.horizontalHeader()->fontMetrics();
    int widest = 0;
    for (const QString& word : headingOf(view, section).split(' '))
        widest = std::max(widest, metrics.horizontalAdvance(word));
    return widest + 2 * margin;
}

int headingHeight(const QTableView& view, int section) {
    const QRect room(0, 0, view.columnWidth(section) - 2 * margin, 10000);
    const QFontMetrics metrics = view.horizontalHeader()->fontMetrics();
    return metrics.boundingRect(room, Qt::AlignCenter | Qt::TextWordWrap, headingOf(view, section)).height() +
           2 * margin;
}

} // namespace

void GridSizes::show(const CGXGridCore& grid, QTableView& view) {
    const int columns = view.model()->columnCount();
    widths_.resize(static_cast<std::size_t>(columns), -1);
    int headHeight = scaledHeight(view, grid.GetRowHeight(0));
    for (int section = 0; section < columns; ++section) {
        int& shown = widths_[static_cast<std::size_t>(section)];
        const int width = grid.GetColWidth(static_cast<ROWCOL>(section + 1));
        if (shown != width)
            view.setColumnWidth(section, std::max(scaledWidth(view, width), widestWord(view, section)));
        shown = width;
        headHeight = std::max(headHeight, headingHeight(view, section));
    }
    view.horizontalHeader()->setFixedHeight(headHeight);
    view.verticalHeader()->setFixedWidth(scaledWidth(view, grid.GetColWidth(0)));
    if (grid.GetRowCount() > 0)
        view.verticalHeader()->setDefaultSectionSize(scaledHeight(view, grid.GetRowHeight(1)));
}

} // namespace kota::hub
