#pragma once

#include "platform/framework/object.h"
#include "platform/framework/text.h"
#include "platform/grid/range.h"

class CGXGridCore;
class CGXStyle;

namespace kota {

// What a cell is to the user, so that a screen knows what to draw and how it is edited.
enum class CellKind { Text, FreeChoice, Choice, CheckBox };

} // namespace kota

// What edits the cells that name it by its control id: one object for all cells of a grid. It holds the text
// of the cell that is being edited; the value that the cell stores stays as it was until the text is
// committed.
class KOTA_API CGXControl : public CObject {
public:
    // `grid` must outlive the control. `itemId` is the number of the control's own window among the grid's.
    CGXControl(CGXGridCore* grid, UINT itemId);
    ~CGXControl() override;

    CGXGridCore* Grid() const { return grid_; }
    UINT ItemId() const { return itemId_; }
    virtual kota::CellKind Kind() const;

    // Loads the text of a cell from its stored value.
    virtual void Init(ROWCOL row, ROWCOL col);
    // The text of the cell being edited, as the user sees it now.
    const CString& GetCurrentText() const { return text_; }
    // Whether the user changed that text since it was loaded or committed.
    bool GetModify() const { return modified_; }
    void SetModify(bool modified) { modified_ = modified; }
    // Takes a text of the user. False: a text of this kind cannot stand here, and nothing changed.
    virtual bool TakeText(const char* text);
    // The same for a text that comes from elsewhere, which may also be the value that a cell stores.
    virtual bool TakePasted(const char* text);
    // Takes the entry at a zero-based place of the cell's choice list. False when there is no such entry, and
    // in a control without a list.
    virtual bool TakeEntry(int index);
    // The zero-based place of the entry that the text of the cell being edited is; -1 when it is none.
    virtual int ChosenEntry() const;

    // Called when the cell is left with a changed text. 0: the text is refused, after SetWarningText of the
    // grid; the cell is not left.
    virtual BOOL OnValidate();
    // The value that the current text stands for, to be stored. 0 when there is none.
    virtual BOOL GetValue(CString& value);
    // The text that a cell shows while it is not edited. `value` is the cell's stored value.
    virtual CString GetDisplayText(const CString& value, const CGXStyle& style);

    // Whether the list of entries stands open in front of the user.
    bool IsDroppedDown() const { return droppedDown_; }
    void SetDroppedDown(bool open) { droppedDown_ = open; }
    // The zero-based place of the entry that is `text`, or with exact 0 begins with it; -1 when there is
    // none.
    static int FindStringInChoiceList(const CString& text, const CString& choiceList, BOOL exact);
    // The entry at a zero-based place, empty beyond the list.
    static CString EntryOfChoiceList(int index, const CString& choiceList);

protected:
    void SetCurrentText(const CString& text) { text_ = text; }
    ROWCOL Row() const { return row_; }
    ROWCOL Col() const { return col_; }

private:
    friend class CGXGridCore;

    CGXGridCore* grid_;
    UINT itemId_;
    ROWCOL row_ = 0;
    ROWCOL col_ = 0;
    CString text_;
    bool modified_ = false;
    bool droppedDown_ = false;
};

// A line of text.
class KOTA_API CGXEditControl : public CGXControl {
public:
    CGXEditControl(CGXGridCore* grid, UINT itemId);
    ~CGXEditControl() override;
};
