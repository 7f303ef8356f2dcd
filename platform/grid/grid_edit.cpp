#include "platform/framework/number_text.h"
#include "platform/framework/scope.h"
#include "platform/framework/turn.h"
#include "platform/grid/grid_data.h"

bool CGXGridCore::IsEditing() const {
    return data_->edit.control != nullptr;
}
bool CGXGridCore::IsEditPending() const {
    return data_->edit.control && data_->edit.control->GetModify();
}
void CGXGridCore::SetWarningText(const char* text) {
    data_->warningText = text;
}
const kota::GridWarning& CGXGridCore::Warning() const {
    return data_->warning;
}

BOOL CGXGridCore::OnStartEditing(ROWCOL /*row*/, ROWCOL /*col*/) {
    return TRUE;
}
void CGXGridCore::OnModifyCell(ROWCOL /*row*/, ROWCOL /*col*/) {}
void CGXGridCore::OnClickedButtonRowCol(ROWCOL /*row*/, ROWCOL /*col*/) {}

bool CGXGridCore::Data::isEnabled(CellPlace place) const {
    CGXStyle style;
    grid.ComposeStyleRowCol(place.row, place.col, &style);
    return style.GetEnabled();
}

bool CGXGridCore::Data::canChange(CellPlace place) const {
    if (!isBelowHeaders(place))
        return false;
    CGXStyle style;
    grid.ComposeStyleRowCol(place.row, place.col, &style);
    return style.GetEnabled() && !(param.IsLockReadOnly() && style.GetReadOnly());
}

bool CGXGridCore::Data::beginEdit() {
    const auto isOfAnotherCell = [this] { return edit.control && edit.place != current; };
    if (isOfAnotherCell() && !grid.SetCurrentCell(current.row, current.col, GX_KEEPFOCUS))
        return false;
    const CellPlace place = current;
    if (isOfAnotherCell() || !canChange(place))
        return false;
    if (edit.control)
        return true;
    if (isCurrentCheckBox())
        return false;
    const HWND window = grid.GetSafeHwnd();
    if (!grid.OnStartEditing(place.row, place.col))
        return false;
    if (grid.GetSafeHwnd() != window || current != place || !canChange(place) || isOfAnotherCell())
        return false;
    if (!edit.control)
        openEdit(place);
    return true;
}

void CGXGridCore::Data::openEdit(CellPlace place) {
    CGXControl* const control = grid.GetControl(place.row, place.col);
    control->Init(place.row, place.col);
    control->SetModify(false);
    edit = {
        .control = control, .place = place, .gesture = gesture(), .textBefore = control->GetCurrentText()};
    ++edits;
    note(&kota::GridChanges::editing);
}

void CGXGridCore::Data::endEdit() {
    edit.control->SetModify(false);
    edit.control->SetDroppedDown(false);
    noteCells(edit.place.row, edit.place.col, edit.place.row, edit.place.col);
    lastEdit = {kota::turnNumber(), edit.gesture};
    edit = {};
    ++edits;
    warning.text.Empty();
    note(&kota::GridChanges::editing);
}

void CGXGridCore::Data::reloadEdit() {
    edit.control->Init(edit.place.row, edit.place.col);
    edit.control->SetModify(false);
    edit.textBefore = edit.control->GetCurrentText();
    edit.changedWhileOpen = false;
    warning.text.Empty();
    note(&kota::GridChanges::editing);
}

void CGXGridCore::Data::textChanged() {
    const CellPlace place = edit.place;
    edit.control->SetModify(true);
    edit.changedWhileOpen = edit.control->IsDroppedDown();
    warning.text.Empty();
    noteCells(place.row, place.col, place.row, place.col);
    grid.OnModifyCell(place.row, place.col);
}

void CGXGridCore::CancelEdit() {
    const kota::grid::Edit cancelled = data_->edit;
    if (!cancelled.control)
        return;
    const bool typed = cancelled.control->GetModify();
    cancelled.control->SetCurrentText(cancelled.textBefore);
    data_->endEdit();
    if (typed)
        OnModifyCell(cancelled.place.row, cancelled.place.col);
}

bool CGXGridCore::Data::commitEdit() {
    CGXControl* const control = edit.control;
    if (!control)
        return true;
    if (validating)
        return false;
    const kota::ValueScope scope(validating, true);
    const unsigned thisEdit = edits;
    CString value;
    bool hasValue = false;
    if (control->GetModify()) {
        warningText.Empty();
        const bool valid = control->OnValidate();
        // Whoever was called may have ended the edit, or loaded it anew.
        if (!valid && control->GetModify()) {
            warning = {edit.place.row, edit.place.col, warningText};
            note(&kota::GridChanges::warned);
            note(&kota::GridChanges::scroll);
            return false;
        }
        hasValue = control->GetModify() && control->GetValue(value);
    }
    if (edits != thisEdit)
        return true;
    const CellPlace place = edit.place;
    endEdit();
    if (hasValue)
        storeValue(place.row, place.col, value.View());
    return true;
}

bool CGXGridCore::Data::isCurrentCheckBox() const {
    return grid.GetControl(current.row, current.col)->Kind() == kota::CellKind::CheckBox;
}

bool CGXGridCore::Data::toggle() {
    const CellPlace place = current;
    if (!canChange(place) || !isCurrentCheckBox())
        return false;
    check(place, kota::textToInt(cells.text(place.row, place.col)) == 0);
    return true;
}

void CGXGridCore::Data::check(CellPlace place, bool checked) {
    storeValue(place.row, place.col, checked ? "1" : "0");
    const HWND window = grid.GetSafeHwnd();
    grid.OnModifyCell(place.row, place.col);
    if (grid.GetSafeHwnd() == window && cells.exists(place.row, place.col))
        grid.OnClickedButtonRowCol(place.row, place.col);
}
