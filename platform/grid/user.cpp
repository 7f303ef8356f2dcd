#include "platform/grid/user.h"

#include "platform/framework/guard.h"
#include "platform/framework/turn.h"
#include "platform/grid/grid_data.h"

#include <algorithm>
#include <vector>

namespace kota::grid {

namespace {

bool takesInput(const CGXGridCore& grid) {
    return grid.IsWindowEnabled() && grid.IsWindowVisible();
}

bool takesFocus(CGXGridCore& grid) {
    if (CWnd::GetFocus() != &grid)
        grid.SetFocus();
    return CWnd::GetFocus() == &grid && takesInput(grid);
}

// One input: a turn, guarded.
template <class Action>
bool perform(CGXGridCore& grid, Action action) {
    const Turn turn;
    bool result = false;
    return guarded([&] { result = takesInput(grid) && action(User::of(grid)); }) && result;
}

// The same for a grid that has the focus, or gets it.
template <class Action>
bool performInFocus(CGXGridCore& grid, Action action) {
    return perform(grid, [&](auto& data) { return takesFocus(grid) && action(data); });
}

// Moves the current cell. False when it is refused, and when the grid or the cell is no longer there, or
// another cell is current.
template <class Data>
bool moveTo(Data& data, CellPlace place, UINT flags) {
    const bool moved = data.grid.SetCurrentCell(place.row, place.col, flags);
    return moved && takesInput(data.grid) && data.current == place && data.cells.exists(place.row, place.col);
}

// Has the current cell's control take something in, with `take`.
template <class Data, class Take>
bool takeIn(Data& data, Take take) {
    const unsigned before = data.edits;
    if (!data.beginEdit())
        return false;
    if (!take(*data.edit.control)) {
        if (data.edits != before && data.edit.control)
            data.endEdit();
        return false;
    }
    if (data.edit.control)
        data.textChanged();
    return true;
}

template <class Data>
bool commitPending(Data& data) {
    return !data.edit.control ||
           (data.grid.SetCurrentCell(data.current.row, data.current.col, GX_KEEPFOCUS) &&
            !data.grid.IsEditPending());
}

template <class Data>
std::vector<CGXRange> lineSelection(Data& data, ROWCOL row, Selecting how) {
    const std::vector<CGXRange>& selected = data.param.GetRangeList()->Ranges();
    const CGXRange line = CGXRange().SetRows(row);
    if (how == Selecting::Add) {
        std::vector<CGXRange> both = selected;
        if (std::ranges::none_of(selected, [=](const CGXRange& range) { return range == line; }))
            both.push_back(line);
        return both;
    }
    const ROWCOL anchor = how == Selecting::Extend && data.selectionAnchor != 0 ? data.selectionAnchor : row;
    return {CGXRange().SetRows(std::min(anchor, row), std::max(anchor, row))};
}

} // namespace

bool clickCell(CGXGridCore& grid, ROWCOL row, ROWCOL col) {
    return performInFocus(grid, [&](auto& data) {
        const CGXRange cell = grid.GetCoveredCellsRowCol(row, col);
        const CellPlace place{cell.top, cell.left};
        if (!data.isBelowHeaders(place) || !data.isEnabled(place))
            return false;
        if (!moveTo(data, place, GX_SCROLLINVIEW | GX_DISPLAYEDITWND))
            return false;
        data.select({});
        if (data.current == place)
            data.toggle();
        return true;
    });
}

bool clickLineHeader(CGXGridCore& grid, ROWCOL row, Selecting how) {
    return performInFocus(grid, [&](auto& data) {
        const ROWCOL firstCol = std::min(grid.GetHeaderCols() + 1, grid.GetColCount());
        const CellPlace place{row, data.current.isNone() ? firstCol : data.current.col};
        if (row <= grid.GetHeaderRows() || row > grid.GetRowCount())
            return false;
        if (!moveTo(data, place, GX_SCROLLINVIEW))
            return false;
        const std::vector<CGXRange> selection = lineSelection(data, row, how);
        if (how != Selecting::Extend || data.selectionAnchor == 0)
            data.selectionAnchor = row;
        data.select(selection);
        return true;
    });
}

bool selectCells(CGXGridCore& grid, const CGXRange& range) {
    return performInFocus(grid, [&](auto& data) {
        CGXRange cells = range;
        if (cells.kind == CGXRange::Kind::Cells)
            cells.SetCells(std::min(range.top, range.bottom), std::min(range.left, range.right),
                           std::max(range.top, range.bottom), std::max(range.left, range.right));
        cells = data.existing(cells);
        if (!commitPending(data) || !data.isBelowHeaders({cells.top, cells.left}))
            return false;
        data.selectionAnchor = cells.top;
        data.select({cells});
        return true;
    });
}

bool typeText(CGXGridCore& grid, const char* text) {
    return performInFocus(grid, [&](auto& data) {
        return takeIn(data, [&](CGXControl& control) { return control.TakeText(text ? text : ""); });
    });
}

bool chooseEntry(CGXGridCore& grid, int index) {
    return performInFocus(grid, [&](auto& data) {
        return takeIn(data, [&](CGXControl& control) {
            const bool taken = control.TakeEntry(index);
            if (taken)
                control.SetDroppedDown(false);
            return taken;
        });
    });
}

int chosenEntry(const CGXGridCore& grid) {
    ROWCOL row = 0;
    ROWCOL col = 0;
    if (!grid.GetCurrentCell(&row, &col))
        return -1;
    CGXControl* const control = grid.GetControl(row, col);
    if (!grid.IsEditing())
        control->Init(row, col);
    return control->ChosenEntry();
}

bool toggle(CGXGridCore& grid) {
    return performInFocus(grid, [](auto& data) { return data.toggle(); });
}

void dropDown(CGXGridCore& grid, bool open) {
    const Turn turn;
    guarded([&] {
        auto& data = User::of(grid);
        if (open && takesInput(grid) && takesFocus(grid) && data.beginEdit()) {
            data.edit.control->SetDroppedDown(true);
        } else if (!open && data.edit.control) {
            data.edit.control->SetDroppedDown(false);
            if (data.edit.changedWhileOpen)
                data.textChanged();
        }
    });
}

bool commit(CGXGridCore& grid) {
    return perform(grid, [](auto& data) { return commitPending(data); });
}

} // namespace kota::grid
