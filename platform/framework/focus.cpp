#include "platform/framework/guard.h"
#include "platform/framework/turn.h"
#include "platform/framework/window.h"
#include "platform/framework/window_registry.h"

namespace {

HWND theFocus = nullptr;

bool canTakeFocus(HWND handle) {
    const CWnd* const window = CWnd::FromHandle(handle);
    return window && window->IsWindowEnabled();
}

// Whether the holder lets the focus go. It may close windows and move the focus on the way.
bool holderLetsGo() {
    CWnd* const holder = CWnd::FromHandle(theFocus);
    bool letsGo = true;
    if (holder)
        kota::guarded([&] { letsGo = holder->LetFocusGo(); });
    return letsGo;
}

} // namespace

namespace kota {

void forgetFocus(HWND handle) {
    if (theFocus == handle)
        theFocus = nullptr;
}

} // namespace kota

HWND SetFocus(HWND handle) {
    const HWND previous = theFocus;
    if (handle == previous || (handle && !canTakeFocus(handle)) || !holderLetsGo())
        return previous;
    const HWND leaving = theFocus;
    if (handle == leaving || (handle && !IsWindow(handle)))
        return previous;
    theFocus = nullptr;
    SendMessage(leaving, WM_KILLFOCUS, reinterpret_cast<WPARAM>(handle), 0);
    // The old holder may have closed the new one, or given the focus elsewhere, on its way out.
    if (theFocus || !IsWindow(handle))
        return previous;
    theFocus = handle;
    kota::noteChange(handle, kota::Change::Focus);
    SendMessage(handle, WM_SETFOCUS, reinterpret_cast<WPARAM>(previous), 0);
    return previous;
}

HWND GetFocus() {
    return theFocus;
}

CWnd* CWnd::SetFocus() {
    return FromHandle(::SetFocus(handle_));
}
CWnd* CWnd::GetFocus() {
    return FromHandle(::GetFocus());
}
