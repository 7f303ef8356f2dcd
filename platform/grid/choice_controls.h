#pragma once

#include "platform/grid/control.h"

// The ready-made controls of cells that are more than a line of text.
namespace kota::grid {

// A list of entries of which the cell holds the number, counted from `base`.
class ChoiceControl : public CGXControl {
public:
    ChoiceControl(CGXGridCore* grid, UINT itemId, int base);

    CellKind Kind() const override { return CellKind::Choice; }
    void Init(ROWCOL row, ROWCOL col) override;
    bool TakeText(const char* text) override;
    bool TakePasted(const char* text) override;
    bool TakeEntry(int index) override;
    int ChosenEntry() const override { return index_; }
    BOOL GetValue(CString& value) override;
    // The entry, or the value itself where it is no entry's number.
    CString GetDisplayText(const CString& value, const CGXStyle& style) override;

private:
    int base_;
    int index_ = -1; // of the current text among the entries; below 0 when it is none
};

// A list of entries that are proposals for a free text.
class FreeChoiceControl : public CGXEditControl {
public:
    using CGXEditControl::CGXEditControl;

    CellKind Kind() const override { return CellKind::FreeChoice; }
    bool TakeEntry(int index) override;
    int ChosenEntry() const override;
};

// A box that is checked where the cell's value is a number other than 0.
class CheckBoxControl : public CGXControl {
public:
    using CGXControl::CGXControl;

    CellKind Kind() const override { return CellKind::CheckBox; }
    bool TakeText(const char* text) override;
    // A check box has no text.
    CString GetDisplayText(const CString& value, const CGXStyle& style) override;
};

} // namespace kota::grid
