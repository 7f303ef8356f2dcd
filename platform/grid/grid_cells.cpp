#include "platform/grid/grid_data.h"
#include "platform/grid/number_value.h"

#include <algorithm>
#include <string>

using kota::grid::ReadOnlyLock;

bool CGXGridCore::Data::isBelowHeaders(CellPlace place) const {
    return place.row > rowBand.headers && place.col > colBand.headers && cells.exists(place.row, place.col);
}

CGXRange CGXGridCore::Data::existing(const CGXRange& range) const {
    CGXRange within = range;
    within.ExpandRange(1, 1, cells.rows(), cells.cols());
    within.bottom = std::min(within.bottom, cells.rows());
    within.right = std::min(within.right, cells.cols());
    return within;
}

bool CGXGridCore::Data::storeValue(ROWCOL row, ROWCOL col, std::string_view text) {
    if (!cells.exists(row, col))
        return false;
    if (!param.IsUndoEnabled()) {
        journal.forget();
        cells.setValue(row, col, text);
    } else if (!cells.holds(row, col, text)) {
        exchange({row, col}, {kota::grid::SmallText(text), cells.cellStyle(row, col)});
    }
    noteCells(row, col, row, col);
    return true;
}

void CGXGridCore::Data::layOverCell(CellPlace place, const CGXStyle& style, ReadOnlyLock lock) {
    if (style.HasValue())
        storeValue(place.row, place.col, style.ValueText());
    const kota::grid::StyleId before = cells.cellStyle(place.row, place.col);
    cells.layOverCell(place.row, place.col, style, lock);
    if (cells.cellStyle(place.row, place.col) == before)
        return;
    kota::grid::CellContent was = cells.content(place.row, place.col);
    was.style = before;
    remember(kota::grid::CellWas{place, std::move(was)}, place);
}

void CGXGridCore::Data::layOverRow(ROWCOL row, const CGXStyle& style, ReadOnlyLock lock) {
    const kota::grid::StyleId before = cells.rowStyle(row);
    cells.layOverRow(row, style, lock);
    if (cells.rowStyle(row) != before)
        remember(kota::grid::LineStyleWas{row, before}, {row, 0});
}

BOOL CGXGridCore::SetStyleRange(const CGXRange& range, const CGXStyle& style) {
    using Kind = CGXRange::Kind;
    const ReadOnlyLock lock = data_->param.IsLockReadOnly() ? ReadOnlyLock::On : ReadOnlyLock::Off;
    kota::grid::CellStore& cells = data_->cells;
    const bool wholeCols = range.kind == Kind::Cols || range.kind == Kind::Table;
    const bool wholeRows = range.kind == Kind::Rows || range.kind == Kind::Table;
    const ROWCOL firstCol = range.kind == Kind::Table ? 1 : range.left;
    const ROWCOL lastRow = wholeCols ? cells.rows() : std::min(range.bottom, cells.rows());
    const ROWCOL lastCol = wholeRows ? cells.cols() : std::min(range.right, cells.cols());
    const bool nothing =
        wholeCols ? firstCol > lastCol : range.top > lastRow || (!wholeRows && firstCol > lastCol);
    if (range.kind == Kind::None || nothing)
        return FALSE;
    if (wholeCols)
        for (ROWCOL col = firstCol; col <= lastCol; ++col)
            cells.layOverCol(col, style, lock);
    else if (wholeRows)
        for (ROWCOL row = range.top; row <= lastRow; ++row)
            data_->layOverRow(row, style, lock);
    else
        for (ROWCOL row = range.top; row <= lastRow; ++row)
            for (ROWCOL col = firstCol; col <= lastCol; ++col)
                data_->layOverCell({row, col}, style, lock);
    data_->noteRange(range);
    return TRUE;
}

BOOL CGXGridCore::SetValueRange(const CGXRange& range, std::string_view text) {
    if (range.kind == CGXRange::Kind::Cells && range.top == range.bottom && range.left == range.right)
        return data_->storeValue(range.top, range.left, text);
    const CGXRange cells = data_->existing(range);
    if (cells.kind == CGXRange::Kind::None || cells.top > cells.bottom || cells.left > cells.right)
        return FALSE;
    const std::string value(text); // which may be that of one of these cells
    for (ROWCOL col = cells.left; col <= cells.right; ++col)
        for (ROWCOL row = cells.top; row <= cells.bottom; ++row)
            data_->storeValue(row, col, value);
    return TRUE;
}

BOOL CGXGridCore::SetValueRange(const CGXRange& range, const char* text) {
    return SetValueRange(range, std::string_view(text ? text : ""));
}
BOOL CGXGridCore::SetValueRange(const CGXRange& range, const CString& text) {
    return SetValueRange(range, text.View());
}
BOOL CGXGridCore::SetValueRange(const CGXRange& range, int number) {
    kota::grid::NumberText text;
    return SetValueRange(range, kota::grid::print(number, text));
}
BOOL CGXGridCore::SetValueRange(const CGXRange& range, double number) {
    kota::grid::NumberText text;
    return SetValueRange(range, kota::grid::print(number, text));
}

std::string_view CGXGridCore::CellText(ROWCOL row, ROWCOL col) const {
    return data_->cells.exists(row, col) ? data_->cells.text(row, col) : std::string_view();
}

CString CGXGridCore::GetValueRowCol(ROWCOL row, ROWCOL col) {
    if ((row != 0 && col != 0) || !data_->cells.exists(row, col))
        return CString(CellText(row, col));
    CGXStyle style;
    ComposeStyleRowCol(row, col, &style);
    return style.GetValue();
}

void CGXGridCore::ComposeStyleRowCol(ROWCOL row, ROWCOL col, CGXStyle* style) const {
    *style = data_->cells.compose(row, col);
    const bool lineNumber = col == 0 && row > 0 && row <= GetRowCount();
    kota::grid::NumberText number;
    if (lineNumber && !style->HasValue() && data_->param.IsNumberedRowHeaders())
        style->SetValue(kota::grid::print(row, number));
}

const CGXStyle& CGXGridCore::ChangeStandardStyle(const CGXStyle& style) {
    CGXStyle& standard = data_->cells.standard();
    standard.ChangeStyle(style);
    data_->note(&kota::GridChanges::layout);
    return standard;
}

BOOL CGXGridCore::RegisterControl(UINT id, std::unique_ptr<CGXControl> control) {
    if (!control)
        return FALSE;
    std::unique_ptr<CGXControl>& place = data_->controls[id];
    if (place && data_->edit.control == place.get())
        data_->endEdit();
    place.swap(control);
    if (control)
        data_->replacedControls.push_back(std::move(control));
    data_->note(&kota::GridChanges::layout);
    return TRUE;
}

CGXControl* CGXGridCore::GetControl(ROWCOL row, ROWCOL col) const {
    CGXStyle style;
    ComposeStyleRowCol(row, col, &style);
    const auto named = data_->controls.find(style.GetControl());
    return named != data_->controls.end() ? named->second.get() : data_->controls.at(GX_IDS_CTRL_EDIT).get();
}

CString CGXGridCore::GetDisplayText(ROWCOL row, ROWCOL col) const {
    const kota::grid::Edit& edit = data_->edit;
    if (edit.control && edit.place == kota::grid::CellPlace{row, col})
        return edit.control->GetCurrentText();
    if (!data_->cells.exists(row, col))
        return CString();
    CGXStyle style;
    ComposeStyleRowCol(row, col, &style);
    return GetControl(row, col)->GetDisplayText(style.GetValue(), style);
}
