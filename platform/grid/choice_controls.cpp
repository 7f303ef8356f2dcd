#include "platform/grid/choice_controls.h"

#include "platform/grid/choice_list.h"
#include "platform/grid/grid.h"
#include "platform/grid/number_value.h"

#include <charconv>

namespace kota::grid {

namespace {

CString choiceListOf(const CGXGridCore& grid, ROWCOL row, ROWCOL col) {
    CGXStyle style;
    grid.ComposeStyleRowCol(row, col, &style);
    return style.GetChoiceList();
}

// The number of an entry that is the whole text; -1 when it is none.
int numberIn(std::string_view text) {
    int number = -1;
    const auto result = std::from_chars(text.data(), text.data() + text.size(), number);
    const bool whole = result.ec == std::errc() && result.ptr == text.data() + text.size();
    return whole && number >= 0 ? number : -1;
}

} // namespace

ChoiceControl::ChoiceControl(CGXGridCore* grid, UINT itemId, int base)
    : CGXControl(grid, itemId), base_(base) {}

void ChoiceControl::Init(ROWCOL row, ROWCOL col) {
    CGXControl::Init(row, col);
    const CString value = GetCurrentText();
    const CString list = choiceListOf(*Grid(), row, col);
    index_ = numberIn(value.View()) - base_;
    if (const auto entry = entryAt(list.View(), index_))
        SetCurrentText(CString(*entry));
}

bool ChoiceControl::TakeText(const char* text) {
    return TakeEntry(entryMeantBy(text, choiceListOf(*Grid(), Row(), Col()).View()));
}

bool ChoiceControl::TakePasted(const char* text) {
    return TakeText(text) || TakeEntry(numberIn(text) - base_);
}

bool ChoiceControl::TakeEntry(int index) {
    const CString list = choiceListOf(*Grid(), Row(), Col());
    const auto entry = entryAt(list.View(), index);
    if (!entry)
        return false;
    index_ = index;
    SetCurrentText(CString(*entry));
    return true;
}

BOOL ChoiceControl::GetValue(CString& value) {
    if (index_ < 0)
        return FALSE;
    NumberText number;
    value = print(index_ + base_, number);
    return TRUE;
}

CString ChoiceControl::GetDisplayText(const CString& value, const CGXStyle& style) {
    const CString list = style.GetChoiceList();
    const auto entry = entryAt(list.View(), numberIn(value.View()) - base_);
    return entry ? CString(*entry) : value;
}

bool FreeChoiceControl::TakeEntry(int index) {
    const CString list = choiceListOf(*Grid(), Row(), Col());
    const auto entry = entryAt(list.View(), index);
    return entry && TakeText(CString(*entry));
}

int FreeChoiceControl::ChosenEntry() const {
    return FindStringInChoiceList(GetCurrentText(), choiceListOf(*Grid(), Row(), Col()), TRUE);
}

bool CheckBoxControl::TakeText(const char* /*text*/) {
    return false;
}

CString CheckBoxControl::GetDisplayText(const CString& /*value*/, const CGXStyle& /*style*/) {
    return CString();
}

} // namespace kota::grid
