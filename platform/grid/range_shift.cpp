#include "platform/grid/range_shift.h"

#include <algorithm>

namespace kota::grid {

namespace {

bool hasRows(const CGXRange& range) {
    return range.kind == CGXRange::Kind::Cells || range.kind == CGXRange::Kind::Rows;
}
bool hasCols(const CGXRange& range) {
    return range.kind == CGXRange::Kind::Cells || range.kind == CGXRange::Kind::Cols;
}

} // namespace

void shiftForInsertedRows(std::vector<CGXRange>& ranges, ROWCOL row, ROWCOL count) {
    for (CGXRange& range : ranges) {
        if (!hasRows(range))
            continue;
        if (range.top >= row)
            range.top += count;
        if (range.bottom >= row)
            range.bottom += count;
    }
}

void shiftForRemovedRows(std::vector<CGXRange>& ranges, ROWCOL first, ROWCOL last) {
    const ROWCOL count = last - first + 1;
    std::erase_if(ranges, [=](CGXRange& range) {
        if (!hasRows(range) || range.bottom < first)
            return false;
        if (range.top >= first && range.bottom <= last)
            return true;
        if (range.top > first)
            range.top = range.top > last ? range.top - count : first;
        range.bottom = range.bottom > last ? range.bottom - count : first - 1;
        return false;
    });
}

void clipToCols(std::vector<CGXRange>& ranges, ROWCOL cols) {
    std::erase_if(ranges, [cols](CGXRange& range) {
        if (!hasCols(range))
            return false;
        range.right = std::min(range.right, cols);
        return range.left > cols;
    });
}

} // namespace kota::grid
