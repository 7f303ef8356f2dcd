#include "platform/framework/window.h"

#include "platform/framework/frame.h"
#include "platform/framework/guard.h"
#include "platform/framework/message_box.h"
#include "platform/framework/messages.h"
#include "platform/framework/screen.h"
#include "platform/framework/turn.h"
#include "platform/framework/window_registry.h"

#include <string>
#include <unordered_map>
#include <utility>

IMPLEMENT_DYNAMIC(CWnd, CCmdTarget, kota::platformModule)

CWnd::CWnd() = default;

CWnd::~CWnd() {
    CWnd::DestroyWindow();
}

BOOL CWnd::Create(const kota::WindowSetup& setup) {
    if (handle_)
        return FALSE;
    handle_ = kota::registerWindow(setup, this);
    return TRUE;
}

BOOL CWnd::SubclassDlgItem(UINT id, CWnd* dialog) {
    const CWnd* const control = dialog && !handle_ ? dialog->GetDlgItem(id) : nullptr;
    if (!control || !kota::hasPlainObject(control->handle_))
        return FALSE;
    handle_ = control->handle_;
    kota::releaseWindow(handle_, this);
    return TRUE;
}

HWND CWnd::Detach() {
    if (kota::WindowState* const state = MutableState(); state && state->object == this)
        state->object = nullptr;
    return std::exchange(handle_, nullptr);
}

BOOL CWnd::DestroyWindow() {
    if (!handle_)
        return FALSE;
    // What closes with a window inside may close this one.
    for (const kota::WindowState* state = State(); state && !state->children.empty(); state = State())
        FromHandle(state->children.back())->DestroyWindow();
    if (!handle_)
        return TRUE;
    kota::forgetFocus(handle_);
    const HWND handle = std::exchange(handle_, nullptr);
    kota::unregisterWindow(handle);
    PostNcDestroy(); // NOLINT(clang-analyzer-optin.cplusplus.VirtualCall): a destroyed object has only this
                     // one
    return TRUE;
}

void CWnd::PostNcDestroy() {}

CWnd* CWnd::FromHandle(HWND handle) {
    const kota::WindowState* const state = kota::windowState(handle);
    if (!state)
        return nullptr;
    if (state->object)
        return state->object;
    auto plain = std::make_unique<CWnd>();
    plain->handle_ = handle;
    return kota::adoptWindow(handle, std::move(plain));
}

const kota::WindowState* CWnd::State() const {
    return kota::windowState(handle_);
}
kota::WindowState* CWnd::MutableState() const {
    return kota::windowState(handle_);
}

CWnd* CWnd::GetParent() const {
    const kota::WindowState* const state = State();
    return state ? FromHandle(state->setup.parent) : nullptr;
}

UINT CWnd::GetDlgCtrlID() const {
    const kota::WindowState* const state = State();
    return state ? state->setup.id : 0;
}

CWnd* CWnd::GetDlgItem(UINT id) const {
    const kota::WindowState* const state = State();
    if (!state || id == 0)
        return nullptr;
    for (const HWND handle : state->children) {
        CWnd* const child = FromHandle(handle);
        if (child->GetDlgCtrlID() == id)
            return child;
        if (CWnd* const deeper = child->GetDlgItem(id))
            return deeper;
    }
    return nullptr;
}

bool CWnd::IsChild(const CWnd* window) const {
    for (const CWnd* around = window ? window->GetParent() : nullptr; around; around = around->GetParent())
        if (around == this)
            return true;
    return false;
}

CFrameWnd* CWnd::GetParentFrame() const {
    for (CWnd* around = GetParent(); around; around = around->GetParent())
        if (around->IsKindOf(RUNTIME_CLASS(CFrameWnd)))
            return static_cast<CFrameWnd*>(around);
    return nullptr;
}

void CWnd::SetWindowText(const char* text) {
    kota::WindowState* const state = MutableState();
    if (!state)
        return;
    state->text = text;
    kota::noteChange(handle_, kota::Change::Text);
    if (state->setup.kind == kota::WindowKind::Edit)
        NotifyParent(EN_CHANGE);
}

CString CWnd::GetWindowText() const {
    const kota::WindowState* const state = State();
    return state ? state->text : CString();
}

BOOL CWnd::EnableWindow(BOOL enable) {
    kota::WindowState* const state = MutableState();
    if (!state)
        return FALSE;
    const bool wasDisabled = !std::exchange(state->enabled, enable != 0);
    kota::noteChange(handle_, kota::Change::State);
    return wasDisabled;
}

BOOL CWnd::IsWindowEnabled() const {
    if (!State())
        return FALSE;
    for (const CWnd* window = this; window; window = window->GetParent())
        if (!window->State()->enabled)
            return FALSE;
    return TRUE;
}

void CWnd::ShowWindow(BOOL show) {
    if (kota::WindowState* const state = MutableState()) {
        state->visible = show != 0;
        kota::noteChange(handle_, kota::Change::State);
    }
}

BOOL CWnd::IsWindowVisible() const {
    if (!State())
        return FALSE;
    for (const CWnd* window = this; window; window = window->GetParent())
        if (!window->State()->visible)
            return FALSE;
    return TRUE;
}

void CWnd::SetCheck(BOOL checked) {
    if (kota::WindowState* const state = MutableState()) {
        state->checked = checked != 0;
        kota::noteChange(handle_, kota::Change::State);
    }
}

BOOL CWnd::GetCheck() const {
    const kota::WindowState* const state = State();
    return state && state->checked;
}

void CWnd::SetToolTip(const CString& text) {
    if (kota::WindowState* const state = MutableState()) {
        state->toolTip = text;
        kota::noteChange(handle_, kota::Change::Text);
    }
}

unsigned CWnd::GetStyle() const {
    const kota::WindowState* const state = State();
    return state ? state->style : 0;
}

unsigned CWnd::GetExStyle() const {
    const kota::WindowState* const state = State();
    return state ? state->extendedStyle : 0;
}

void CWnd::ModifyStyleEx(unsigned remove, unsigned add) {
    if (kota::WindowState* const state = MutableState())
        state->extendedStyle = (state->extendedStyle & ~remove) | add;
}

CRect CWnd::GetWindowRect() const {
    const kota::WindowState* const state = State();
    return state ? state->rect : CRect();
}

void CWnd::SetWindowRect(const CRect& rect) {
    if (kota::WindowState* const state = MutableState())
        state->rect = rect;
}

void CWnd::BringWindowToTop() {
    if (handle_)
        kota::noteChange(handle_, kota::Change::Raised);
}

BOOL CWnd::SetForegroundWindow() {
    BringWindowToTop();
    SetFocus();
    return handle_ != nullptr;
}

CMenu* CWnd::GetMenu() {
    return nullptr;
}

void CWnd::DrawMenuBar() {
    if (handle_)
        kota::noteChange(handle_, kota::Change::Menu);
}

LRESULT CWnd::SendMessage(UINT message, WPARAM wParam, LPARAM lParam) {
    return ::SendMessage(handle_, message, wParam, lParam);
}
BOOL CWnd::PostMessage(UINT message, WPARAM wParam, LPARAM lParam) {
    return ::PostMessage(handle_, message, wParam, lParam);
}

int CWnd::MessageBox(const char* text, const char* caption, UINT type) {
    return ::MessageBox(handle_, text, caption, type);
}

BOOL CWnd::PreTranslateMessage(MSG* /*message*/) {
    return FALSE;
}
bool CWnd::LetFocusGo() {
    return true;
}
void CWnd::FocusLeft(HWND /*window*/) {}

void CWnd::NotifyParent(int notification) {
    const kota::WindowState* const state = State();
    if (state)
        ::SendMessage(kota::dialogAround(handle_), WM_COMMAND, commandParam(state->setup.id, notification),
                      reinterpret_cast<LPARAM>(handle_));
}

BOOL CWnd::OnCmdMsg(UINT id, int notification) {
    const bool isEdit = State() && State()->setup.kind == kota::WindowKind::Edit;
    const bool isForText =
        id == ID_EDIT_UNDO || id == ID_EDIT_CUT || id == ID_EDIT_COPY || id == ID_EDIT_PASTE;
    const bool asked = notification == CN_UPDATE_COMMAND_UI;
    kota::Screen* const screen = kota::attachedScreen();
    if (isEdit && isForText && screen && (asked || notification == 0))
        return screen->editText(id, asked);
    return CCmdTarget::OnCmdMsg(id, notification);
}

LRESULT CWnd::WindowProc(UINT message, WPARAM wParam, LPARAM lParam) {
    if (message == WM_COMMAND)
        return OnCmdMsg(commandId(wParam), commandNotification(wParam));
    return DefWindowProc(message, wParam, lParam);
}

LRESULT CWnd::DefWindowProc(UINT message, WPARAM wParam, LPARAM lParam) {
    kota::WindowState* const state = MutableState();
    if (!state)
        return 0;
    const bool edit = state->setup.kind == kota::WindowKind::Edit;
    switch (message) {
    case WM_SETFOCUS:
    case WM_KILLFOCUS:
        if (edit)
            NotifyParent(message == WM_SETFOCUS ? EN_SETFOCUS : EN_KILLFOCUS);
        return 0;
    case WM_HELP: // goes outward until somebody knows help
        return ::SendMessage(state->setup.parent, message, wParam, lParam);
    case EM_LIMITTEXT:
        state->textLimit = static_cast<int>(wParam);
        kota::noteChange(handle_, kota::Change::State);
        return 0;
    case CB_GETCURSEL:
        return state->chosen;
    case CB_SETCURSEL: {
        const auto entry = static_cast<std::intptr_t>(wParam);
        const bool exists = entry >= 0 && entry < std::ssize(state->choices);
        state->chosen = exists ? static_cast<int>(entry) : -1;
        kota::noteChange(handle_, kota::Change::Choices);
        return state->chosen;
    }
    default:
        return 0;
    }
}

bool IsWindow(HWND handle) {
    return kota::windowState(handle) != nullptr;
}

LRESULT SendMessage(HWND handle, UINT message, WPARAM wParam, LPARAM lParam) {
    CWnd* const window = CWnd::FromHandle(handle);
    LRESULT result = 0;
    if (window && !kota::guarded([&] { result = window->WindowProc(message, wParam, lParam); }))
        result = 0;
    return result;
}

BOOL PostMessage(HWND handle, UINT message, WPARAM wParam, LPARAM lParam) {
    if (!IsWindow(handle))
        return FALSE;
    kota::postMessage({handle, message, wParam, lParam});
    return TRUE;
}

UINT RegisterWindowMessage(const char* name) {
    static std::unordered_map<std::string, UINT> registered;
    const UINT next = 0xC000 + static_cast<UINT>(registered.size());
    return registered.try_emplace(name ? name : "", next).first->second;
}
