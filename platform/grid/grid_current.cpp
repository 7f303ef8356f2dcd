#include "platform/grid/grid_data.h"

#include <algorithm>
#include <array>
#include <cstdint>
#include <limits>
#include <optional>

using kota::grid::CellPlace;

namespace {

enum class Reach { Steps, Pages, Edge };

struct Direction {
    int rowStep;
    int colStep;
    Reach reach;
};

// By the GX_ constants, from 1.
constexpr std::array<Direction, 12> directions = {{
    {-1, 0, Reach::Steps}, // GX_UP
    {0, -1, Reach::Steps}, // GX_LEFT
    {1, 0, Reach::Steps},  // GX_DOWN
    {0, 1, Reach::Steps},  // GX_RIGHT
    {-1, 0, Reach::Pages}, // GX_PAGEUP
    {1, 0, Reach::Pages},  // GX_PAGEDOWN
    {-1, 0, Reach::Edge},  // GX_TOP
    {1, 0, Reach::Edge},   // GX_BOTTOM
    {0, -1, Reach::Edge},  // GX_MOSTLEFT
    {0, 1, Reach::Edge},   // GX_MOSTRIGHT
    {1, 1, Reach::Edge},   // GX_BOTTOMRIGHT
    {-1, -1, Reach::Edge}, // GX_TOPLEFT
}};

// A number of lines or columns that reaches every edge.
constexpr std::int64_t allTheWay = std::numeric_limits<ROWCOL>::max();

// From a line to the one `distance` beyond what covers it, `low` to `high`, within the bounds.
ROWCOL moved(ROWCOL from, ROWCOL low, ROWCOL high, std::int64_t distance, ROWCOL first, ROWCOL last) {
    const std::int64_t start = distance < 0 ? low : distance > 0 ? high : from;
    return static_cast<ROWCOL>(std::clamp<std::int64_t>(start + distance, first, last));
}

} // namespace

BOOL CGXGridCore::GetCurrentCell(ROWCOL* row, ROWCOL* col) const {
    if (row)
        *row = data_->current.row;
    if (col)
        *col = data_->current.col;
    return !data_->current.isNone();
}

BOOL CGXGridCore::SetCurrentCell(ROWCOL row, ROWCOL col, UINT flags) {
    if (!data_->commitEdit())
        return FALSE;
    for (const CellPlace place : {data_->current, CellPlace{row, col}})
        if (data_->cells.exists(place.row, place.col))
            data_->noteCells(place.row, place.col, place.row, place.col);
    data_->current = {row, col};
    data_->note(&kota::GridChanges::current);
    if (flags & (GX_SCROLLINVIEW | GX_DISPLAYEDITWND))
        data_->note(&kota::GridChanges::scroll);
    if (!(flags & GX_KEEPFOCUS) && !data_->current.isNone() && GetSafeHwnd() && MayTakeFocus())
        SetFocus();
    return TRUE;
}

std::optional<CellPlace> CGXGridCore::Data::placeBeside(CellPlace start, int direction, int count) const {
    const CellPlace first{rowBand.headers + 1, colBand.headers + 1};
    const CellPlace last{cells.rows(), cells.cols()};
    if (direction < GX_UP || direction > GX_TOPLEFT || count < 1 || first.row > last.row ||
        first.col > last.col)
        return std::nullopt;
    const auto [rowStep, colStep, reach] = directions[static_cast<std::size_t>(direction - 1)];
    const std::int64_t page = std::int64_t{pageRows} * count;
    const std::int64_t distance = reach == Reach::Steps ? count : reach == Reach::Pages ? page : allTheWay;
    const CellPlace from = start.isNone() ? first : start;
    const CGXRange here = grid.GetCoveredCellsRowCol(from.row, from.col);
    CellPlace to{moved(from.row, here.top, here.bottom, rowStep * distance, first.row, last.row),
                 moved(from.col, here.left, here.right, colStep * distance, first.col, last.col)};
    // A step goes on past cells that are not enabled, a jump comes back to the first that is.
    const std::int64_t back = reach == Reach::Steps ? 1 : -1;
    while (!isEnabled(to)) {
        const CellPlace next{moved(to.row, to.row, to.row, back * rowStep, first.row, last.row),
                             moved(to.col, to.col, to.col, back * colStep, first.col, last.col)};
        if (next == to)
            return std::nullopt;
        to = next;
    }
    const CGXRange target = grid.GetCoveredCellsRowCol(to.row, to.col);
    const CellPlace place{target.top, target.left};
    return place == start ? std::nullopt : std::optional(place);
}

BOOL CGXGridCore::MoveCurrentCell(int direction, int count, BOOL /*update*/) {
    const auto place = data_->placeBeside(data_->current, direction, count);
    return place && SetCurrentCell(place->row, place->col, GX_SCROLLINVIEW | GX_DISPLAYEDITWND);
}

// The current cell is one corner of what is selected; the other one moves.
void CGXGridCore::Data::extendSelection(int direction) {
    const std::vector<CGXRange>& selected = param.GetRangeList()->Ranges();
    const bool wholeLines = hasWholeLines();
    CellPlace corner = current;
    if (selected.size() == 1) {
        const CGXRange range = existing(selected.front());
        corner.row = range.top == current.row ? range.bottom : range.top;
        if (!wholeLines)
            corner.col = range.left == current.col ? range.right : range.left;
    }
    const auto moved = placeBeside(corner, direction, 1);
    if (!moved || current.isNone())
        return;
    const auto [top, bottom] = std::minmax(current.row, moved->row);
    const auto [left, right] = std::minmax(current.col, moved->col);
    select({wholeLines ? CGXRange().SetRows(top, bottom) : CGXRange(top, left, bottom, right)});
}

bool CGXGridCore::LetFocusGo() {
    if (!IsEditPending())
        return true;
    const CellPlace current = data_->current;
    return SetCurrentCell(current.row, current.col, GX_KEEPFOCUS) && !IsEditPending();
}
