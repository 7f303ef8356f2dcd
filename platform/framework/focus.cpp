#include "platform/framework/application.h"
#include "platform/framework/frame.h"
#include "platform/framework/guard.h"
#include "platform/framework/scope.h"
#include "platform/framework/turn.h"
#include "platform/framework/window.h"
#include "platform/framework/window_registry.h"

namespace {

HWND theFocus = nullptr;
HWND nextFocus = nullptr; // while the focus is on its way there

// The document's frame in front of the others; null when there is none.
CFrameWnd* frameInFront() {
    CWnd* const mainWindow = AfxGetMainWnd();
    const bool holdsFrames = mainWindow && mainWindow->IsKindOf(RUNTIME_CLASS(CMDIFrameWnd));
    return holdsFrames ? static_cast<CMDIFrameWnd*>(mainWindow)->MDIGetActive() : nullptr;
}

bool canTakeFocus(HWND handle) {
    const CWnd* const window = CWnd::FromHandle(handle);
    return window && window->IsWindowEnabled();
}

// Whether a window stands in a document's frame that is not in front.
bool isBehind(HWND handle) {
    const CWnd* const window = CWnd::FromHandle(handle);
    const CFrameWnd* const frame = window ? window->GetParentFrame() : nullptr;
    const CFrameWnd* const front = frameInFront();
    return frame && front && frame != front && frame != AfxGetMainWnd();
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
    const bool wasBehind = isBehind(handle);
    if (handle == previous || (handle && !canTakeFocus(handle)) || !holderLetsGo())
        return previous;
    // Whoever heard of what the holder committed may have brought another document to the front.
    if (!wasBehind && isBehind(handle))
        return previous;
    const HWND leaving = theFocus;
    if (handle == leaving || (handle && !canTakeFocus(handle)))
        return previous;
    for (CWnd* window = CWnd::FromHandle(leaving); window; window = window->GetParent())
        window->FocusLeft(leaving);
    theFocus = nullptr;
    if (leaving)
        kota::noteChange(leaving, kota::Change::Focus);
    {
        const kota::ValueScope onItsWay(nextFocus, handle);
        SendMessage(leaving, WM_KILLFOCUS, reinterpret_cast<WPARAM>(handle), 0);
    }
    // The old holder may have closed or disabled the new one, or given the focus elsewhere, on its way out.
    if (theFocus || !canTakeFocus(handle))
        return previous;
    theFocus = handle;
    kota::noteChange(handle, kota::Change::Focus);
    SendMessage(handle, WM_SETFOCUS, reinterpret_cast<WPARAM>(previous), 0);
    return previous;
}

HWND GetFocus() {
    return theFocus;
}

bool CWnd::MayTakeFocus() const {
    if (!IsWindowVisible())
        return false;
    const CWnd* const holder = FromHandle(theFocus ? theFocus : nextFocus);
    CFrameWnd* const frame = holder ? holder->GetParentFrame() : frameInFront();
    return !frame || frame == GetParentFrame() || frame->IsChild(this);
}

CWnd* CWnd::SetFocus() {
    return FromHandle(::SetFocus(handle_));
}
CWnd* CWnd::GetFocus() {
    return FromHandle(::GetFocus());
}
