#include "platform/grid/range.h"

#include "platform/framework/exception.h"

#include <algorithm>

CGXRange& CGXRange::SetCells(ROWCOL topRow, ROWCOL leftCol, ROWCOL bottomRow, ROWCOL rightCol) {
    kind = Kind::Cells;
    top = topRow;
    left = leftCol;
    bottom = bottomRow;
    right = rightCol;
    return *this;
}

CGXRange& CGXRange::SetRows(ROWCOL first, ROWCOL last) {
    SetCells(first, 0, last, 0);
    kind = Kind::Rows;
    return *this;
}

CGXRange& CGXRange::SetCols(ROWCOL first, ROWCOL last) {
    SetCells(0, first, 0, last);
    kind = Kind::Cols;
    return *this;
}

CGXRange& CGXRange::SetTable() {
    SetCells(0, 0, 0, 0);
    kind = Kind::Table;
    return *this;
}

bool CGXRange::IsCellInRange(ROWCOL row, ROWCOL col) const {
    const bool rowInRange = kind == Kind::Cols || kind == Kind::Table || (top <= row && row <= bottom);
    const bool colInRange = kind == Kind::Rows || kind == Kind::Table || (left <= col && col <= right);
    return kind != Kind::None && rowInRange && colInRange;
}

void CGXRange::ExpandRange(ROWCOL firstRow, ROWCOL firstCol, ROWCOL lastRow, ROWCOL lastCol) {
    if (kind == Kind::Rows)
        SetCells(std::max(top, firstRow), firstCol, std::min(bottom, lastRow), lastCol);
    else if (kind == Kind::Cols)
        SetCells(firstRow, std::max(left, firstCol), lastRow, std::min(right, lastCol));
    else if (kind == Kind::Table)
        SetCells(firstRow, firstCol, lastRow, lastCol);
}

const CGXRange& CGXRangeList::GetHead() const {
    if (ranges_.empty())
        AfxThrowInvalidArgException("CGXRangeList::GetHead of an empty list");
    return ranges_.front();
}

bool CGXRangeList::IsAnyCellFromCol(ROWCOL col) const {
    return std::ranges::any_of(ranges_, [col](const CGXRange& range) {
        const bool wide = range.kind == CGXRange::Kind::Rows || range.kind == CGXRange::Kind::Table;
        return wide || (range.kind != CGXRange::Kind::None && range.left <= col && col <= range.right);
    });
}

bool CGXRangeList::IsAnyCellFromRow(ROWCOL row) const {
    return std::ranges::any_of(ranges_, [row](const CGXRange& range) {
        const bool high = range.kind == CGXRange::Kind::Cols || range.kind == CGXRange::Kind::Table;
        return high || (range.kind != CGXRange::Kind::None && range.top <= row && row <= range.bottom);
    });
}

void CGXRangeList::Add(const CGXRange& range) {
    ranges_.push_back(range);
}
void CGXRangeList::Clear() {
    ranges_.clear();
}
