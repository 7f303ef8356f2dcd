#include "platform/framework/turn.h"
#include "platform/grid/grid_data.h"

#include <algorithm>
#include <utility>

void CGXGridCore::Data::tell() {
    const HWND handle = grid.GetSafeHwnd();
    if (told == handle)
        return;
    told = handle;
    kota::noteChange(handle, kota::Change::Contents);
}

void CGXGridCore::Data::noteCells(ROWCOL top, ROWCOL left, ROWCOL bottom, ROWCOL right) {
    CGXRange& noted = changes.cells;
    if (noted.kind == CGXRange::Kind::None)
        noted.SetCells(top, left, bottom, right);
    else
        noted.SetCells(std::min(noted.top, top), std::min(noted.left, left), std::max(noted.bottom, bottom),
                       std::max(noted.right, right));
    tell();
}

void CGXGridCore::Data::noteRange(const CGXRange& range) {
    CGXRange shown = range;
    shown.ExpandRange(0, 0, cells.rows(), cells.cols());
    if (shown.kind != CGXRange::Kind::None)
        noteCells(shown.top, shown.left, shown.bottom, shown.right);
    if (range.kind == CGXRange::Kind::Cols || range.kind == CGXRange::Kind::Table)
        note(&kota::GridChanges::layout);
}

kota::GridChanges CGXGridCore::TakeChanges() {
    data_->told = nullptr;
    return std::exchange(data_->changes, {});
}

void CGXGridCore::Redraw(UINT /*flags*/, BOOL /*update*/) {
    data_->note(&kota::GridChanges::layout);
}

void CGXGridCore::RedrawRowCol(const CGXRange& range) {
    data_->noteRange(range);
    if (data_->edit.control && range.IsCellInRange(data_->edit.place.row, data_->edit.place.col))
        data_->reloadEdit();
}

void CGXGridCore::Data::setSelection(const std::vector<CGXRange>& ranges) {
    CGXRangeList& selection = *param.GetRangeList();
    if (selection.Ranges() == ranges)
        return;
    selection.Clear();
    for (const CGXRange& range : ranges)
        selection.Add(range);
    note(&kota::GridChanges::selection);
}

void CGXGridCore::Data::select(const std::vector<CGXRange>& ranges) {
    if (param.GetRangeList()->Ranges() == ranges)
        return;
    setSelection(ranges);
    grid.OnChangedSelection();
}

void CGXGridCore::GetSelectedRows(std::vector<ROWCOL>& rows) const {
    rows.clear();
    for (const CGXRange& range : data_->param.GetRangeList()->Ranges()) {
        CGXRange lines = range;
        lines.ExpandRange(1, 0, GetRowCount(), 0);
        if (range.kind == CGXRange::Kind::Rows || range.kind == CGXRange::Kind::Table)
            for (ROWCOL row = lines.top; row <= lines.bottom; ++row)
                rows.push_back(row);
    }
    std::ranges::sort(rows);
    rows.erase(std::unique(rows.begin(), rows.end()), rows.end());
}

void CGXGridCore::OnChangedSelection() {}
