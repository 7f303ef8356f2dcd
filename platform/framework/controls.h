#pragma once

#include "platform/framework/window.h"

// Faces of a dialog's controls, for those that a dialog keeps as members.

// A line of text.
class KOTA_API CEdit : public CWnd {
    DECLARE_DYNAMIC(CEdit)
public:
    CEdit();
    ~CEdit() override;
    // How many characters a user may type, 0 for any number.
    void LimitText(int characters) { SendMessage(EM_LIMITTEXT, static_cast<WPARAM>(characters)); }
};

// A choice among entries.
class KOTA_API CComboBox : public CWnd {
    DECLARE_DYNAMIC(CComboBox)
public:
    CComboBox();
    ~CComboBox() override;
    // From 0, -1 for none.
    int GetCurSel() { return static_cast<int>(SendMessage(CB_GETCURSEL)); }
    // Chooses an entry and gives it; -1, and none is chosen, when there is no such entry.
    int SetCurSel(int entry);
};
