#pragma once

#include "platform/framework/export.h"
#include "platform/framework/types.h"

#include <vector>

// A number of a line or a column of a grid. 0 is the header.
using ROWCOL = unsigned;

// Cells of a grid: a rectangle, whole lines, whole columns, or all. The bounds of whole lines and columns
// count for their own direction alone.
class KOTA_API CGXRange {
public:
    enum class Kind { None, Cells, Rows, Cols, Table };

    CGXRange() = default;
    CGXRange(ROWCOL row, ROWCOL col) { SetCells(row, col); }
    CGXRange(ROWCOL firstRow, ROWCOL firstCol, ROWCOL lastRow, ROWCOL lastCol) {
        SetCells(firstRow, firstCol, lastRow, lastCol);
    }

    CGXRange& SetCells(ROWCOL row, ROWCOL col) { return SetCells(row, col, row, col); }
    CGXRange& SetCells(ROWCOL firstRow, ROWCOL firstCol, ROWCOL lastRow, ROWCOL lastCol);
    CGXRange& SetRows(ROWCOL row) { return SetRows(row, row); }
    CGXRange& SetRows(ROWCOL first, ROWCOL last);
    CGXRange& SetCols(ROWCOL col) { return SetCols(col, col); }
    CGXRange& SetCols(ROWCOL first, ROWCOL last);
    CGXRange& SetTable();

    bool IsCellInRange(ROWCOL row, ROWCOL col) const;
    // Makes a rectangle of whole lines, whole columns or all, within these bounds; a rectangle stays.
    void ExpandRange(ROWCOL firstRow, ROWCOL firstCol, ROWCOL lastRow, ROWCOL lastCol);

    friend bool operator==(const CGXRange&, const CGXRange&) = default;

    Kind kind = Kind::None;
    ROWCOL top = 0;
    ROWCOL left = 0;
    ROWCOL bottom = 0;
    ROWCOL right = 0;
};

// What is selected in a grid: ranges, in the order in which they were selected.
class KOTA_API CGXRangeList {
public:
    bool IsEmpty() const { return ranges_.empty(); }
    int GetCount() const { return static_cast<int>(ranges_.size()); }
    // The first range. An empty list raises the invalid-argument failure.
    const CGXRange& GetHead() const;
    // Whether a range holds a cell of this column; of column 0, whole lines and all do.
    bool IsAnyCellFromCol(ROWCOL col) const;
    bool IsAnyCellFromRow(ROWCOL row) const;

    void Add(const CGXRange& range);
    void Clear();
    const std::vector<CGXRange>& Ranges() const { return ranges_; }

private:
    std::vector<CGXRange> ranges_;
};
