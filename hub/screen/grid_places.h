#pragma once

#include "platform/grid/range.h"

#include <QRect>

#include <vector>

class QHeaderView;
class QTableView;

namespace kota::hub {

// Where the cells of a grid are, headers and frozen cells among them, in the coordinates of the table's
// viewport: what lies above it or to its left is below 0. Lines and columns count as the platform's do.
//
// The frozen columns are hidden in the table, and have their widths in a header of their own. The frozen
// lines are 0 high in the table, since a hidden line would make each scrolling walk over all lines.
class GridPlaces {
public:
    GridPlaces(QTableView& table, QHeaderView& frozenHead) : table_(table), frozenHead_(frozenHead) {}

    // `heights` are those of line 0 and of the frozen lines.
    void freezeRows(const std::vector<int>& heights);
    void freezeCols(ROWCOL frozen);
    void setNumbersWidth(int width) { numbersWidth_ = width; }

    ROWCOL frozenRows() const { return static_cast<ROWCOL>(heights_.size()) - 1; }
    ROWCOL frozenCols() const { return frozenCols_; }
    bool isFrozen(ROWCOL row, ROWCOL col) const { return row <= frozenRows() || col <= frozenCols(); }
    // The header that has the width of a column.
    QHeaderView& headOf(ROWCOL col) const;

    int numbersWidth() const { return numbersWidth_; }
    int headHeight() const { return heights_.front(); }
    int frozenWidth() const;
    int frozenHeight() const;
    // With the lines between the cells.
    QRect area(const CGXRange& cells) const;
    // The line, the column at a coordinate: 0 for a header, one more than there are beyond the last.
    ROWCOL rowAt(int y) const;
    ROWCOL colAt(int x) const;

private:
    int left(ROWCOL col) const;
    int right(ROWCOL col) const;
    int top(ROWCOL row) const;
    int bottom(ROWCOL row) const;
    ROWCOL rows() const;
    ROWCOL cols() const;

    QTableView& table_;
    QHeaderView& frozenHead_;
    std::vector<int> heights_{0};
    ROWCOL frozenCols_ = 0;
    int numbersWidth_ = 0;
};

} // namespace kota::hub
