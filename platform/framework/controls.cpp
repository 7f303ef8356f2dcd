#include "platform/framework/controls.h"

IMPLEMENT_DYNAMIC(CEdit, CWnd, kota::platformModule)
IMPLEMENT_DYNAMIC(CComboBox, CWnd, kota::platformModule)

CEdit::CEdit() = default;
CEdit::~CEdit() = default;

CComboBox::CComboBox() = default;
CComboBox::~CComboBox() = default;

int CComboBox::SetCurSel(int entry) {
    return static_cast<int>(
        SendMessage(CB_SETCURSEL, static_cast<WPARAM>(static_cast<std::intptr_t>(entry))));
}
