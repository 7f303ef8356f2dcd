#include "platform/grid/grid.h"

#include "platform/framework/messages.h"
#include "platform/grid/choice_controls.h"
#include "platform/grid/grid_data.h"
#include "platform/grid/range_shift.h"

#include <algorithm>
#include <limits>
#include <utility>

IMPLEMENT_DYNAMIC(CGXGridCore, CWnd, kota::platformModule)
IMPLEMENT_DYNAMIC(CGXGridWnd, CGXGridCore, kota::platformModule)

CGXGridCore::Data::Data(CGXGridCore& owner) : grid(owner) {
    using namespace kota::grid;
    controls[GX_IDS_CTRL_EDIT] = std::make_unique<CGXEditControl>(&owner, 0);
    controls[GX_IDS_CTRL_TEXTFIT] = std::make_unique<FreeChoiceControl>(&owner, 0);
    controls[GX_IDS_CTRL_CHECKBOX] = std::make_unique<CheckBoxControl>(&owner, 0);
    controls[GX_IDS_CTRL_ONEBASED_EX] = std::make_unique<ChoiceControl>(&owner, 0, 1);
    controls[GX_IDS_CTRL_ZEROBASED_EX] = std::make_unique<ChoiceControl>(&owner, 0, 0);
}

CGXGridCore::CGXGridCore() : data_(std::make_unique<Data>(*this)) {}
CGXGridCore::~CGXGridCore() = default;

CGXGridParam* CGXGridCore::GetParam() {
    return &data_->param;
}
const CGXGridParam* CGXGridCore::GetParam() const {
    return &data_->param;
}

BOOL CGXGridCore::SetRowCount(ROWCOL count, UINT /*flags*/) {
    const ROWCOL before = GetRowCount();
    if (count > before)
        data_->addRows(before + 1, count - before);
    else if (count < before)
        data_->takeRows(count + 1, before);
    return TRUE;
}

BOOL CGXGridCore::SetColCount(ROWCOL count, UINT /*flags*/) {
    if (count == GetColCount())
        return TRUE;
    if (data_->edit.control && data_->edit.place.col > count)
        data_->endEdit();
    data_->journal.forget();
    data_->cells.setCols(count);
    kota::grid::clipToCols(data_->covered, count);
    data_->changeSelection([count](std::vector<CGXRange>& ranges) { kota::grid::clipToCols(ranges, count); });
    data_->note(&kota::GridChanges::layout);
    return TRUE;
}

ROWCOL CGXGridCore::GetRowCount() const {
    return data_->cells.rows();
}
ROWCOL CGXGridCore::GetColCount() const {
    return data_->cells.cols();
}

BOOL CGXGridCore::InsertRows(ROWCOL row, ROWCOL count) {
    const ROWCOL lines = GetRowCount();
    if (row == 0 || row > lines + 1 || count > std::numeric_limits<ROWCOL>::max() - 1 - lines)
        return FALSE;
    if (count > 0)
        data_->addRows(row, count);
    return TRUE;
}

BOOL CGXGridCore::RemoveRows(ROWCOL first, ROWCOL last) {
    const ROWCOL from = std::max(first, 1U);
    const ROWCOL to = std::min(last, GetRowCount());
    if (from > to)
        return FALSE;
    data_->takeRows(from, to);
    return TRUE;
}

BOOL CGXGridCore::AppendLine() {
    return InsertRows(GetRowCount() + 1, 1);
}

void CGXGridCore::DeleteSelection() {
    std::vector<ROWCOL> lines;
    GetSelectedRows(lines);
    std::ranges::reverse(lines);
    for (const ROWCOL line : lines)
        RemoveRows(line, line);
}

void CGXGridCore::Data::addRows(ROWCOL row, ROWCOL count) {
    cells.insertRows(row, count);
    followAddedRows(row, count);
}

void CGXGridCore::Data::putRows(ROWCOL row, kota::grid::TakenLines lines) {
    const ROWCOL count = lines.count();
    cells.putRows(row, std::move(lines));
    followAddedRows(row, count);
}

void CGXGridCore::Data::followAddedRows(ROWCOL row, ROWCOL count) {
    remember(kota::grid::LinesCame{row, count}, {row, 0});
    kota::grid::shiftForInsertedRows(covered, row, count);
    changeSelection(
        [=](std::vector<CGXRange>& ranges) { kota::grid::shiftForInsertedRows(ranges, row, count); });
    if (selectionAnchor >= row)
        selectionAnchor += count;
    if (edit.control && edit.place.row >= row)
        edit.control->row_ = edit.place.row += count;
    note(&kota::GridChanges::layout);
}

void CGXGridCore::Data::takeRows(ROWCOL first, ROWCOL last) {
    const auto follow = [=](ROWCOL row) {
        return row < first ? row : row > last ? row - (last - first + 1) : 0;
    };
    remember(kota::grid::LinesWent{first, cells.takeRows(first, last)}, {first, 0});
    kota::grid::shiftForRemovedRows(covered, first, last);
    changeSelection(
        [=](std::vector<CGXRange>& ranges) { kota::grid::shiftForRemovedRows(ranges, first, last); });
    selectionAnchor = follow(selectionAnchor);
    if (edit.control && follow(edit.place.row) == 0)
        endEdit();
    else if (edit.control)
        edit.control->row_ = edit.place.row = follow(edit.place.row);
    note(&kota::GridChanges::layout);
}

int CGXGridCore::GetRowHeight(ROWCOL row) const {
    return data_->cells.height(row);
}
int CGXGridCore::GetColWidth(ROWCOL col) const {
    return col <= GetColCount() ? data_->cells.width(col) : kota::grid::CellStore::defaultWidth;
}

BOOL CGXGridCore::SetRowHeight(ROWCOL first, ROWCOL last, int height) {
    if (first > GetRowCount())
        return FALSE;
    for (ROWCOL row = first; row <= std::clamp(last, first, GetRowCount()); ++row)
        data_->cells.setHeight(row, height);
    data_->note(&kota::GridChanges::layout);
    return TRUE;
}

BOOL CGXGridCore::SetColWidth(ROWCOL first, ROWCOL last, int width) {
    if (first > GetColCount())
        return FALSE;
    for (ROWCOL col = first; col <= std::clamp(last, first, GetColCount()); ++col)
        data_->cells.setWidth(col, width);
    data_->note(&kota::GridChanges::layout);
    return TRUE;
}

BOOL CGXGridCore::SetFrozenRows(ROWCOL frozen, ROWCOL headers) {
    data_->rowBand = {frozen, std::min(headers, frozen)};
    data_->note(&kota::GridChanges::layout);
    return TRUE;
}
BOOL CGXGridCore::SetFrozenCols(ROWCOL frozen, ROWCOL headers) {
    data_->colBand = {frozen, std::min(headers, frozen)};
    data_->note(&kota::GridChanges::layout);
    return TRUE;
}
ROWCOL CGXGridCore::GetFrozenRows() const {
    return data_->rowBand.frozen;
}
ROWCOL CGXGridCore::GetFrozenCols() const {
    return data_->colBand.frozen;
}
ROWCOL CGXGridCore::GetHeaderRows() const {
    return data_->rowBand.headers;
}
ROWCOL CGXGridCore::GetHeaderCols() const {
    return data_->colBand.headers;
}

BOOL CGXGridCore::SetCoveredCellsRowCol(ROWCOL top, ROWCOL left, ROWCOL bottom, ROWCOL right) {
    if (top > bottom || left > right || bottom > GetRowCount() || right > GetColCount())
        return FALSE;
    std::erase_if(data_->covered, [=](const CGXRange& range) {
        return range.top <= bottom && top <= range.bottom && range.left <= right && left <= range.right;
    });
    if (top != bottom || left != right)
        data_->covered.emplace_back(top, left, bottom, right);
    data_->note(&kota::GridChanges::layout);
    return TRUE;
}

CGXRange CGXGridCore::GetCoveredCellsRowCol(ROWCOL row, ROWCOL col) const {
    for (const CGXRange& range : data_->covered)
        if (range.IsCellInRange(row, col))
            return range;
    return {row, col};
}

ROWCOL CGXGridCore::GetLeftCol() const {
    return std::clamp(data_->leftCol, std::min(GetFrozenCols() + 1, std::max(GetColCount(), 1U)),
                      std::max(GetColCount(), 1U));
}
ROWCOL CGXGridCore::GetTopRow() const {
    return std::clamp(data_->topRow, std::min(GetFrozenRows() + 1, std::max(GetRowCount(), 1U)),
                      std::max(GetRowCount(), 1U));
}
void CGXGridCore::SetLeftCol(ROWCOL col) {
    data_->leftCol = col;
    data_->note(&kota::GridChanges::current);
}
void CGXGridCore::SetTopRow(ROWCOL row) {
    data_->topRow = row;
    data_->note(&kota::GridChanges::current);
}
void CGXGridCore::SetPageRows(ROWCOL count) {
    data_->pageRows = std::max(count, 1U);
}

BOOL CGXGridCore::EnableGridToolTips(BOOL enable) {
    data_->toolTips = enable != 0;
    return TRUE;
}
bool CGXGridCore::HasGridToolTips() const {
    return data_->toolTips;
}

CGXGridWnd::CGXGridWnd() = default;
CGXGridWnd::~CGXGridWnd() = default;

BOOL CGXGridWnd::Initialize() {
    SetRowCount(0);
    SetColCount(0);
    return TRUE;
}

void CGXGridWnd::Invalidate(BOOL /*erase*/) {
    Redraw();
}
