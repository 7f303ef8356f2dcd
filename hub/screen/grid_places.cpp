#include "hub/screen/grid_places.h"

#include <QHeaderView>
#include <QTableView>

#include <algorithm>
#include <numeric>

namespace kota::hub {

namespace {

int section(ROWCOL place) {
    return static_cast<int>(place) - 1;
}

} // namespace

void GridPlaces::freezeRows(const std::vector<int>& heights) {
    QHeaderView& lines = *table_.verticalHeader();
    const int frozen = static_cast<int>(heights.size()) - 1;
    for (int line = frozen; line < std::min(static_cast<int>(frozenRows()), lines.count()); ++line)
        lines.resizeSection(line, lines.defaultSectionSize());
    for (int line = 0; line < std::min(frozen, lines.count()); ++line)
        lines.resizeSection(line, 0);
    heights_ = heights;
}

void GridPlaces::freezeCols(ROWCOL frozen) {
    frozenCols_ = frozen;
    for (ROWCOL col = 1; col <= cols(); ++col) {
        table_.setColumnHidden(section(col), col <= frozen);
        frozenHead_.setSectionHidden(section(col), col > frozen);
    }
}

ROWCOL GridPlaces::rows() const {
    return static_cast<ROWCOL>(table_.verticalHeader()->count());
}
ROWCOL GridPlaces::cols() const {
    return static_cast<ROWCOL>(frozenHead_.count());
}

QHeaderView& GridPlaces::headOf(ROWCOL col) const {
    return col <= frozenCols_ ? frozenHead_ : *table_.horizontalHeader();
}

int GridPlaces::frozenWidth() const {
    return frozenCols_ == 0 ? 0 : frozenHead_.length();
}
int GridPlaces::frozenHeight() const {
    return std::accumulate(heights_.begin() + 1, heights_.end(), 0);
}

int GridPlaces::left(ROWCOL col) const {
    if (col == 0)
        return -frozenWidth() - numbersWidth_;
    if (col <= frozenCols_)
        return frozenHead_.sectionPosition(section(col)) - frozenWidth();
    return table_.horizontalHeader()->sectionViewportPosition(section(col));
}

int GridPlaces::right(ROWCOL col) const {
    return left(col) + (col == 0 ? numbersWidth_ : headOf(col).sectionSize(section(col))) - 1;
}

int GridPlaces::top(ROWCOL row) const {
    if (row > frozenRows())
        return table_.verticalHeader()->sectionViewportPosition(section(row));
    return std::accumulate(heights_.begin(), heights_.begin() + row, -frozenHeight() - headHeight());
}

int GridPlaces::bottom(ROWCOL row) const {
    return top(row) +
           (row > frozenRows() ? table_.verticalHeader()->sectionSize(section(row)) : heights_[row]) - 1;
}

QRect GridPlaces::area(const CGXRange& cells) const {
    QRect area(QPoint(left(cells.left), top(cells.top)), QPoint(right(cells.right), bottom(cells.bottom)));
    // Of cells that reach out of the frozen ones, the frozen part stays in view.
    if (cells.left <= frozenCols_ && cells.right > frozenCols_)
        area.setRight(std::max(area.right(), -1));
    if (cells.top <= frozenRows() && cells.bottom > frozenRows())
        area.setBottom(std::max(area.bottom(), -1));
    return area;
}

ROWCOL GridPlaces::rowAt(int y) const {
    ROWCOL row = 0;
    while (row <= frozenRows() && y < 0 && y > bottom(row))
        ++row;
    if (y < 0)
        return row;
    const int found = table_.rowAt(y);
    // A line that is 0 high stands at 0, too.
    return found < 0 ? rows() + 1 : std::max(static_cast<ROWCOL>(found) + 1, frozenRows() + 1);
}

ROWCOL GridPlaces::colAt(int x) const {
    ROWCOL col = 0;
    while (col <= frozenCols_ && x < 0 && x > right(col))
        ++col;
    if (x < 0)
        return col;
    const int found = table_.columnAt(x);
    return found < 0 ? cols() + 1 : static_cast<ROWCOL>(found) + 1;
}

} // namespace kota::hub
