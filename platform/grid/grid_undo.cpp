#include "platform/framework/turn.h"
#include "platform/grid/grid_data.h"

#include <algorithm>

using kota::grid::CellPlace;
using kota::grid::Replay;

namespace {

// Ends a replay however it is left.
class ReplayScope {
public:
    ReplayScope(kota::grid::Journal& journal, Replay which) : journal_(journal), which_(which) {}
    ~ReplayScope() { journal_.end(which_); }
    ReplayScope(const ReplayScope&) = delete;
    ReplayScope& operator=(const ReplayScope&) = delete;

private:
    kota::grid::Journal& journal_;
    Replay which_;
};

} // namespace

// An edit is one gesture from its first key to its commit, with whatever else the key did that committed it.
unsigned CGXGridCore::Data::gesture() const {
    if (edit.control)
        return edit.gesture;
    return lastEdit.turn == kota::turnNumber() ? lastEdit.gesture : kota::turnNumber();
}

void CGXGridCore::Data::remember(kota::grid::Change change, CellPlace place) {
    if (param.IsUndoEnabled())
        journal.note(std::move(change), place, gesture());
    else
        journal.forget();
}

void CGXGridCore::Data::exchange(CellPlace place, kota::grid::CellContent content) {
    kota::grid::CellContent before = cells.exchange(place.row, place.col, std::move(content));
    remember(kota::grid::CellWas{place, std::move(before)}, place);
    noteCells(place.row, place.col, place.row, place.col);
}

void CGXGridCore::Data::takeBack(kota::grid::Change change) {
    using namespace kota::grid;
    if (auto* const cell = std::get_if<CellWas>(&change)) {
        exchange(cell->place, std::move(cell->content));
    } else if (const auto* const line = std::get_if<LineStyleWas>(&change)) {
        remember(LineStyleWas{line->row, cells.rowStyle(line->row)}, {line->row, 0});
        cells.setRowStyle(line->row, line->style);
        noteRange(CGXRange().SetRows(line->row));
    } else if (const auto* const came = std::get_if<LinesCame>(&change)) {
        takeRows(came->row, came->row + came->count - 1);
    } else if (auto* const went = std::get_if<LinesWent>(&change)) {
        putRows(went->row, std::move(went->lines));
    }
}

bool CGXGridCore::Data::replay(Replay which) {
    if (!canReplay(which))
        return false;
    kota::grid::Step step = journal.begin(which);
    const ReplayScope scope(journal, which);
    std::vector<CellPlace> changed;
    std::ranges::reverse(step.changes);
    for (kota::grid::Change& change : step.changes) {
        if (const auto* const cell = std::get_if<kota::grid::CellWas>(&change))
            changed.push_back(cell->place);
        takeBack(std::move(change));
    }
    setSelection({});
    const HWND window = grid.GetSafeHwnd();
    for (const CellPlace& cell : changed)
        if (grid.GetSafeHwnd() == window && cells.exists(cell.row, cell.col))
            grid.OnModifyCell(cell.row, cell.col);
    if (grid.GetSafeHwnd() == window)
        commitAt(step.place);
    return true;
}

// Ends as an edit does: the current cell goes to the place, and whoever hears of edits hears of this.
void CGXGridCore::Data::commitAt(CellPlace place) {
    const ROWCOL row = std::min(place.row, cells.rows());
    const ROWCOL col = row == 0 ? 0 : std::clamp(place.col, colBand.headers + 1, std::max(cells.cols(), 1U));
    grid.OnModifyCell(row, col);
    grid.SetCurrentCell(row, col, GX_SCROLLINVIEW | GX_DISPLAYEDITWND);
}

bool CGXGridCore::Data::canReplay(Replay which) const {
    return param.IsUndoEnabled() && journal.canReplay(which);
}

bool CGXGridCore::CanUndo() const {
    return IsEditPending() || data_->canReplay(Replay::Undo);
}
bool CGXGridCore::CanRedo() const {
    return !IsEditPending() && data_->canReplay(Replay::Redo);
}

BOOL CGXGridCore::Undo() {
    if (IsEditPending()) {
        CancelEdit();
        return TRUE;
    }
    return data_->commitEdit() && data_->replay(Replay::Undo);
}

BOOL CGXGridCore::Redo() {
    return !IsEditPending() && data_->commitEdit() && data_->replay(Replay::Redo);
}
