#include "platform/framework/property_sheet.h"

#include "platform/framework/scope.h"
#include "platform/framework/turn.h"
#include "platform/framework/window_registry.h"

#include <algorithm>

IMPLEMENT_DYNAMIC(CPropertyPage, CDialog, kota::platformModule)
IMPLEMENT_DYNAMIC(CPropertySheet, CWnd, kota::platformModule)

namespace {
// The size of a sheet before a screen lays it out.
constexpr CRect nominalRect{0, 0, 1000, 600};
} // namespace

CPropertyPage::CPropertyPage() = default;
CPropertyPage::CPropertyPage(UINT templateId) : CDialog(templateId) {}
CPropertyPage::~CPropertyPage() = default;

CString CPropertyPage::GetCaption() const {
    const kota::DialogTemplate* const dialog = GetRuntimeClass()->Module().dialog(TemplateId());
    return dialog ? CString(dialog->caption) : CString();
}

BOOL CPropertyPage::OnSetActive() {
    return TRUE;
}
BOOL CPropertyPage::OnKillActive() {
    return UpdateData(TRUE);
}

CPropertySheet::CPropertySheet() = default;
CPropertySheet::CPropertySheet(const CString& caption) : caption_(caption) {}
CPropertySheet::~CPropertySheet() = default;

void CPropertySheet::AddPage(CPropertyPage* page) {
    pages_.push_back(page);
}

BOOL CPropertySheet::Create(CWnd* parent, unsigned style, unsigned extendedStyle) {
    if (!CWnd::Create({.parent = parent ? parent->GetSafeHwnd() : nullptr, .kind = kota::WindowKind::Sheet}))
        return FALSE;
    MutableState()->style = style;
    MutableState()->extendedStyle = extendedStyle;
    MutableState()->text = caption_;
    SetWindowRect(nominalRect);
    std::vector<CString> captions;
    for (const CPropertyPage* page : pages_)
        captions.push_back(page->GetCaption());
    kota::createTabs(GetSafeHwnd(), AFX_IDC_TAB_CONTROL, std::move(captions));
    GetTabControl()->SetWindowRect(nominalRect);
    OnInitDialog();
    const kota::ValueScope change(changing_, true);
    if (!pages_.empty())
        ShowPage(0);
    return TRUE;
}

BOOL CPropertySheet::OnInitDialog() {
    return TRUE;
}

CPropertyPage* CPropertySheet::GetPage(int index) const {
    return index >= 0 && index < GetPageCount() ? pages_[static_cast<std::size_t>(index)] : nullptr;
}

int CPropertySheet::GetPageIndex(const CPropertyPage* page) const {
    const auto found = std::ranges::find(pages_, page);
    return found == pages_.end() ? -1 : static_cast<int>(found - pages_.begin());
}

CPropertyPage* CPropertySheet::GetActivePage() const {
    return GetPage(active_);
}

BOOL CPropertySheet::SetActivePage(CPropertyPage* page) {
    return SetActivePage(GetPageIndex(page));
}

BOOL CPropertySheet::SetActivePage(int index) {
    if (!GetPage(index) || !GetSafeHwnd() || changing_)
        return FALSE;
    if (index == active_)
        return TRUE;
    const kota::ValueScope change(changing_, true);
    if (!LeaveActivePage() || !GetSafeHwnd())
        return FALSE;
    ShowPage(index);
    return TRUE;
}

BOOL CPropertySheet::PreTranslateMessage(MSG* message) {
    const bool isPaging = message->message == WM_KEYDOWN && GetKeyState(VK_CONTROL) < 0 &&
                          (message->wParam == VK_PRIOR || message->wParam == VK_NEXT);
    if (!isPaging || active_ < 0)
        return CWnd::PreTranslateMessage(message);
    const int step = message->wParam == VK_NEXT ? 1 : GetPageCount() - 1;
    SetActivePage((active_ + step) % GetPageCount());
    return TRUE;
}

bool CPropertySheet::LeaveActivePage() {
    CPropertyPage* const page = GetActivePage();
    if (!page)
        return true;
    // What is pending in the control with the focus is committed first.
    CWnd* const focus = GetFocus();
    const HWND holder = page->IsChild(focus) ? focus->GetSafeHwnd() : nullptr;
    if (holder) {
        GetTabControl()->SetFocus();
        if (!GetSafeHwnd() || ::GetFocus() == holder)
            return false;
    }
    if (page->OnKillActive())
        return true;
    if (IsWindow(holder))
        ::SetFocus(holder);
    return false;
}

void CPropertySheet::ShowPage(int index) {
    CPropertyPage* const before = GetActivePage();
    CPropertyPage* const page = GetPage(index);
    CWnd* const focus = GetFocus();
    const bool focusMoves = focus && (focus == GetTabControl() || (before && before->IsChild(focus)));
    active_ = index;
    const bool isNew = !page->GetSafeHwnd();
    if (isNew)
        page->CreateOf(kota::WindowKind::Page, page->TemplateId(), this);
    page->OnSetActive();
    if (!GetSafeHwnd())
        return;
    if (before)
        before->ShowWindow(FALSE);
    page->ShowWindow(TRUE);
    GetTabControl()->SendMessage(CB_SETCURSEL, static_cast<WPARAM>(index));
    kota::noteChange(GetSafeHwnd(), kota::Change::Contents);
    CWnd* const first = page->FirstFocusControl();
    if (focusMoves && !page->IsChild(GetFocus()) && page->MayTakeFocus())
        (first ? first : GetTabControl())->SetFocus();
}
