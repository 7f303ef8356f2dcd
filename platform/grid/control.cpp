#include "platform/grid/control.h"

#include "platform/grid/choice_list.h"
#include "platform/grid/grid.h"

CGXControl::CGXControl(CGXGridCore* grid, UINT itemId) : grid_(grid), itemId_(itemId) {}
CGXControl::~CGXControl() = default;

int CGXControl::ChosenEntry() const {
    return -1;
}

kota::CellKind CGXControl::Kind() const {
    return kota::CellKind::Text;
}

void CGXControl::Init(ROWCOL row, ROWCOL col) {
    row_ = row;
    col_ = col;
    text_ = grid_->CellText(row, col);
    modified_ = false;
}

bool CGXControl::TakeText(const char* text) {
    text_ = text;
    return true;
}
bool CGXControl::TakePasted(const char* text) {
    return TakeText(text);
}
bool CGXControl::TakeEntry(int /*index*/) {
    return false;
}

BOOL CGXControl::OnValidate() {
    return TRUE;
}

BOOL CGXControl::GetValue(CString& value) {
    value = text_;
    return TRUE;
}

CString CGXControl::GetDisplayText(const CString& value, const CGXStyle& /*style*/) {
    return value;
}

int CGXControl::FindStringInChoiceList(const CString& text, const CString& choiceList, BOOL exact) {
    return kota::grid::findEntry(choiceList.View(), [&](std::string_view entry) {
        return exact ? entry == text.View() : entry.starts_with(text.View());
    });
}

CString CGXControl::EntryOfChoiceList(int index, const CString& choiceList) {
    return CString(kota::grid::entryAt(choiceList.View(), index).value_or(std::string_view()));
}

CGXEditControl::CGXEditControl(CGXGridCore* grid, UINT itemId) : CGXControl(grid, itemId) {}
CGXEditControl::~CGXEditControl() = default;
