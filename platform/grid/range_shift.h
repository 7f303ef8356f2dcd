#pragma once

#include "platform/grid/range.h"

#include <vector>

// How ranges follow when lines or columns come and go: what is left of each, without those of which nothing
// is left.
namespace kota::grid {

void shiftForInsertedRows(std::vector<CGXRange>& ranges, ROWCOL row, ROWCOL count);
void shiftForRemovedRows(std::vector<CGXRange>& ranges, ROWCOL first, ROWCOL last);
// Columns beyond `cols` are gone.
void clipToCols(std::vector<CGXRange>& ranges, ROWCOL cols);

} // namespace kota::grid
