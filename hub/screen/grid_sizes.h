#pragma once

#include <vector>

class CGXGridCore;
class QTableView;

namespace kota::hub {

// The sizes of a grid's lines and columns on the screen: as the platform has them, scaled for the font, and
// never smaller than the headings need. A width that the user set stays until the platform sets another.
class GridSizes {
public:
    void show(const CGXGridCore& grid, QTableView& view);

private:
    std::vector<int> widths_; // by column, as the platform had them when they were shown last
};

} // namespace kota::hub
