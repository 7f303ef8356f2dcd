#include "editing/dlg_property_sheet.h"

#include "resources/module.h"

IMPLEMENT_DYNAMIC(CDlgPropertySheet, CPropertySheet, kota0AdModule)

namespace {

constexpr unsigned childAndVisible = 0x50000000;
constexpr unsigned WS_EX_CONTROLPARENT = 0x10000;

} // namespace

CDlgPropertySheet::CDlgPropertySheet(const CString& caption) : CPropertySheet(caption) {}
CDlgPropertySheet::~CDlgPropertySheet() = default;

void CDlgPropertySheet::EmbedInView(CWnd* view, UINT placeholderId) {
    Create(view, childAndVisible, WS_EX_CONTROLPARENT);
    view->ModifyStyleEx(0, WS_EX_CONTROLPARENT);
    CWnd* const placeholder = placeholderId == noPlaceholder ? nullptr : view->GetDlgItem(placeholderId);
    if (!placeholder)
        return;
    const CRect place = placeholder->GetWindowRect();
    const CRect own = GetWindowRect();
    SetWindowRect({place.left, place.top, place.left + own.Width(), place.top + own.Height()});
    placeholder->DestroyWindow();
}

BOOL CDlgPropertySheet::OnInitDialog() {
    // The tabs need half of the width that they are given; the sheet gives as much away.
    CWnd* const tabs = GetTabControl();
    CRect tabRect = tabs->GetWindowRect();
    CRect own = GetWindowRect();
    const int spare = tabRect.Width() / 2;
    tabRect.right -= spare;
    own.right -= spare;
    tabs->SetWindowRect(tabRect);
    SetWindowRect(own);
    return CPropertySheet::OnInitDialog();
}

BOOL CDlgPropertySheet::PreTranslateMessage(MSG* message) {
    if (message->message != WM_KEYDOWN || message->wParam != VK_F4 || GetKeyState(VK_CONTROL) >= 0)
        return CPropertySheet::PreTranslateMessage(message);
    if (ownerView)
        ownerView->PostMessage(message->message, message->wParam, message->lParam);
    return TRUE;
}

LRESULT CDlgPropertySheet::WindowProc(UINT message, WPARAM wParam, LPARAM lParam) {
    if (message != WM_HELP)
        return CPropertySheet::WindowProc(message, wParam, lParam);
    if (CPropertyPage* const page = GetActivePage())
        page->SendMessage(WM_COMMAND, commandParam(ID_HELP, 0));
    return TRUE;
}
