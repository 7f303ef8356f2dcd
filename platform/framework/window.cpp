#include "platform/framework/window.h"

#include "platform/framework/exception.h"
#include "platform/framework/message_box.h"

#include <string>
#include <unordered_map>

namespace {

struct Windows {
    std::unordered_map<HWND, CWnd*> alive;
    std::uintptr_t lastHandle = 0;
    HWND focus = nullptr;
    std::unordered_map<std::string, UINT> registeredMessages;
};

Windows& windows() {
    static Windows all;
    return all;
}

} // namespace

IMPLEMENT_DYNAMIC(CCmdTarget, CObject, kota::platformModule)
IMPLEMENT_DYNAMIC(CWnd, CCmdTarget, kota::platformModule)

CCmdTarget::CCmdTarget() = default;
CCmdTarget::~CCmdTarget() = default;

CWnd::CWnd() = default;

CWnd::~CWnd() {
    CWnd::DestroyWindow();
}

BOOL CWnd::Create() {
    if (handle_)
        return FALSE;
    handle_ = reinterpret_cast<HWND>(++windows().lastHandle);
    windows().alive.emplace(handle_, this);
    return TRUE;
}

BOOL CWnd::DestroyWindow() {
    if (!handle_)
        return FALSE;
    if (windows().focus == handle_)
        windows().focus = nullptr;
    windows().alive.erase(handle_);
    handle_ = nullptr;
    return TRUE;
}

CWnd* CWnd::FromHandle(HWND handle) {
    const auto found = windows().alive.find(handle);
    return found == windows().alive.end() ? nullptr : found->second;
}

LRESULT CWnd::SendMessage(UINT message, WPARAM wParam, LPARAM lParam) {
    return ::SendMessage(handle_, message, wParam, lParam);
}

CWnd* CWnd::SetFocus() {
    return FromHandle(::SetFocus(handle_));
}
CWnd* CWnd::GetFocus() {
    return FromHandle(::GetFocus());
}

LRESULT CWnd::WindowProc(UINT /*message*/, WPARAM /*wParam*/, LPARAM /*lParam*/) {
    return 0;
}

bool IsWindow(HWND handle) {
    return CWnd::FromHandle(handle) != nullptr;
}

LRESULT SendMessage(HWND handle, UINT message, WPARAM wParam, LPARAM lParam) {
    CWnd* window = CWnd::FromHandle(handle);
    if (!window)
        return 0;
    try {
        return window->WindowProc(message, wParam, lParam);
    } catch (const CInvalidArgException& failure) {
        CString text;
        text.Format("An operation was given an invalid argument (%s).", failure.what());
        AfxMessageBox(text);
        return 0;
    }
}

HWND SetFocus(HWND handle) {
    const HWND previous = windows().focus;
    if (handle == previous || (handle && !IsWindow(handle)))
        return previous;
    windows().focus = nullptr;
    SendMessage(previous, WM_KILLFOCUS, reinterpret_cast<WPARAM>(handle), 0);
    // The old holder may have closed the new one, or given the focus elsewhere, on its way out.
    if (windows().focus || !IsWindow(handle))
        return previous;
    windows().focus = handle;
    SendMessage(handle, WM_SETFOCUS, reinterpret_cast<WPARAM>(previous), 0);
    return previous;
}

HWND GetFocus() {
    return windows().focus;
}

UINT RegisterWindowMessage(const char* name) {
    auto& messages = windows().registeredMessages;
    const UINT next = 0xC000 + static_cast<UINT>(messages.size());
    return messages.try_emplace(name ? name : "", next).first->second;
}
