#include "platform/framework/dialog.h"

#include "platform/framework/frame.h"
#include "platform/framework/input.h"
#include "platform/framework/message_box.h"
#include "platform/framework/screen.h"
#include "platform/framework/tab_order.h"
#include "platform/framework/turn.h"
#include "platform/framework/window_registry.h"

#include <algorithm>
#include <string_view>
#include <vector>

IMPLEMENT_DYNAMIC(CDialog, CWnd, kota::platformModule)

namespace kota {

namespace {

std::vector<CString> entriesOf(std::string_view joined) {
    std::vector<CString> entries;
    while (!joined.empty()) {
        const std::size_t end = joined.find('\n');
        entries.emplace_back(joined.substr(0, end));
        joined = end == std::string_view::npos ? std::string_view() : joined.substr(end + 1);
    }
    return entries;
}

void createItems(HWND parent, std::span<const DialogItem> items) {
    for (const DialogItem& item : items) {
        const HWND handle = registerWindow({.parent = parent, .id = item.id, .kind = item.kind}, nullptr);
        WindowState& state = *windowState(handle);
        state.enabled = item.enabled;
        state.visible = item.visible;
        state.startsGroup = item.startsGroup;
        state.choices = entriesOf(item.choices);
        // An edit's caption is its label; the text is the user's.
        (item.kind == WindowKind::Edit || item.kind == WindowKind::ComboBox ? state.label : state.text) =
            item.caption;
        createItems(handle, item.items);
    }
}

} // namespace

void createDialogItems(HWND parent, const DialogTemplate& dialog) {
    createItems(parent, dialog.items);
}

} // namespace kota

CDialog::CDialog() = default;
CDialog::CDialog(UINT templateId, CWnd* parent) : templateId_(templateId), parent_(parent) {}
CDialog::~CDialog() = default;

BOOL CDialog::CreateOf(kota::WindowKind kind, UINT templateId, CWnd* parent) {
    const kota::DialogTemplate* const dialog = GetRuntimeClass()->Module().dialog(templateId);
    if (!dialog ||
        !CWnd::Create({.parent = parent ? parent->GetSafeHwnd() : nullptr, .id = templateId, .kind = kind}))
        return FALSE;
    templateId_ = templateId;
    MutableState()->text = dialog->caption;
    kota::createDialogItems(GetSafeHwnd(), *dialog);
    OnInitDialog();
    return TRUE;
}

BOOL CDialog::Create(UINT templateId, CWnd* parent) {
    return CreateOf(kota::WindowKind::Dialog, templateId, parent);
}

namespace {

// The user goes on where they were; in the same window where that control is out of sight by now, and where
// somebody else has put them meanwhile.
void giveFocusBack(HWND before) {
    if (::GetFocus())
        return;
    CWnd* const holder = CWnd::FromHandle(before);
    const CFrameWnd* const frame = holder ? holder->GetParentFrame() : nullptr;
    CWnd* const view = frame ? frame->GetActiveView() : nullptr;
    CWnd* const next = holder && !holder->IsWindowVisible() && view ? view : holder;
    ::SetFocus(next ? next->GetSafeHwnd() : nullptr);
}

} // namespace

int CDialog::DoModal() {
    kota::Screen* const screen = kota::attachedScreen();
    if (!screen)
        return -1;
    const HWND focusBefore = ::GetFocus();
    modal_ = true;
    ended_ = false;
    result_ = -1;
    if (!Create(templateId_, parent_))
        return -1;
    if (CWnd* const first = FirstFocusControl())
        first->SetFocus();
    // While another window keeps the focus, the user could do nothing in the dialog.
    if (focusBefore && FirstFocusControl() && ::GetFocus() == focusBefore)
        EndDialog(IDCANCEL);
    if (!ended_) {
        kota::tellScreen();
        screen->showDialog(*this);
    }
    ended_ = true;
    DestroyWindow();
    giveFocusBack(focusBefore);
    return result_;
}

void CDialog::PostNcDestroy() {
    ended_ = true;
    CWnd::PostNcDestroy();
}

void CDialog::EndDialog(int result) {
    ended_ = true;
    result_ = result;
}

BOOL CDialog::OnInitDialog() {
    UpdateData(FALSE);
    return TRUE;
}

void CDialog::OnOK() {
    if (UpdateData(TRUE))
        EndDialog(IDOK);
}
void CDialog::OnCancel() {
    EndDialog(IDCANCEL);
}

BOOL CDialog::UpdateData(BOOL saveAndValidate) {
    if (!GetSafeHwnd())
        return FALSE;
    CDataExchange exchange{.dialog = this, .saveAndValidate = saveAndValidate != 0};
    try {
        DoDataExchange(&exchange);
        return TRUE;
    } catch (const kota::ExchangeFailure&) {
        return FALSE;
    }
}

void CDialog::DoDataExchange(CDataExchange* /*exchange*/) {}

BOOL CDialog::OnCmdMsg(UINT id, int notification) {
    const bool isOwn = modal_ && (id == IDOK || id == IDCANCEL);
    if (isOwn && notification == CN_UPDATE_COMMAND_UI)
        return TRUE;
    if (modal_ && notification == BN_CLICKED && id == IDOK)
        OnOK();
    else if (modal_ && notification == BN_CLICKED && id == IDCANCEL)
        OnCancel();
    else
        return CWnd::OnCmdMsg(id, notification);
    return TRUE;
}

namespace {

// By an arrow key, the radio button beside one comes on.
bool chooseBeside(const CWnd& radio, WPARAM key) {
    const bool forward = key == VK_DOWN || key == VK_RIGHT;
    if (!forward && key != VK_UP && key != VK_LEFT)
        return false;
    const std::vector<CWnd*> group = kota::radioGroupOf(radio);
    const auto here = std::ranges::find(group, &radio) - group.begin();
    const auto count = std::ssize(group);
    kota::input::click(*group[static_cast<std::size_t>((here + (forward ? 1 : count - 1)) % count)]);
    return true;
}

} // namespace

BOOL CDialog::PreTranslateMessage(MSG* message) {
    if (message->message != WM_KEYDOWN)
        return FALSE;
    using kota::WindowKind;
    CWnd* const target = FromHandle(message->hwnd);
    const WindowKind kind = target ? target->State()->setup.kind : WindowKind::Plain;
    // In a grid Tab goes from cell to cell; Ctrl+Tab leaves it.
    if (message->wParam == VK_TAB && target && (kind != WindowKind::Grid || GetKeyState(VK_CONTROL) < 0)) {
        if (CWnd* const next = kota::nextInTabOrder(*this, *target, GetKeyState(VK_SHIFT) < 0))
            next->SetFocus();
        return TRUE;
    }
    if (kind == WindowKind::RadioButton && chooseBeside(*target, message->wParam))
        return TRUE;
    if (kind == WindowKind::PushButton && message->wParam == VK_RETURN)
        return kota::input::click(*target);
    if (!modal_ || (message->wParam != VK_RETURN && message->wParam != VK_ESCAPE))
        return FALSE;
    message->wParam == VK_RETURN ? OnOK() : OnCancel();
    return TRUE;
}

LRESULT CDialog::WindowProc(UINT message, WPARAM wParam, LPARAM lParam) {
    if (message != WM_CLOSE || !modal_)
        return CWnd::WindowProc(message, wParam, lParam);
    OnCancel();
    return TRUE;
}

CWnd* CDialog::FirstFocusControl() const {
    return kota::firstInTabOrder(*this);
}
