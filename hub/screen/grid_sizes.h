#pragma once

#include "platform/grid/range.h"

#include <vector>

class CGXGridCore;

namespace kota::hub {

class GridView;

// The sizes of a grid's lines and columns on the screen: as the platform has them, scaled for the font, and
// never smaller than the headings need. A width that the user set stays until the platform sets another.
class GridSizes {
public:
    void show(const CGXGridCore& grid, GridView& view);

private:
    void showWidths(const CGXGridCore& grid, GridView& view);

    std::vector<int> widths_; // by column, as the platform had them when they were shown last
    ROWCOL frozenCols_ = 0;
};

} // namespace kota::hub
