#pragma once

#include "platform/framework/object.h"
#include "platform/framework/types.h"

// A handle of a window: a number that is never used twice, so that a handle kept across a message can be
// checked. Null is none.
struct WindowHandle;
using HWND = WindowHandle*;

inline constexpr UINT WM_SETFOCUS = 0x0007;
inline constexpr UINT WM_KILLFOCUS = 0x0008;

// The root of all that takes commands.
class KOTA_API CCmdTarget : public CObject {
    DECLARE_DYNAMIC(CCmdTarget)
public:
    CCmdTarget();
    ~CCmdTarget() override;
};

// A window: an object with a handle that takes messages. It is nothing on a screen by itself.
class KOTA_API CWnd : public CCmdTarget {
    DECLARE_DYNAMIC(CWnd)
public:
    CWnd();
    // Destroys the window, when it still has one.
    ~CWnd() override;

    // Gives the object its window. 1 done, 0 when it has one already.
    BOOL Create();
    // Takes the window away, and the focus with it: the handle is dead from then on. 0 when there is none.
    virtual BOOL DestroyWindow();
    // The handle, null before Create and after DestroyWindow.
    HWND GetSafeHwnd() const { return handle_; }
    // The object of a living window's handle, null for any other.
    static CWnd* FromHandle(HWND handle);

    // Runs WindowProc before it returns. 0 without a window.
    LRESULT SendMessage(UINT message, WPARAM wParam = 0, LPARAM lParam = 0);
    // Takes the focus and gives the window that had it, or null.
    CWnd* SetFocus();
    static CWnd* GetFocus();

    // What the window does with a message. The default answers 0 to all.
    virtual LRESULT WindowProc(UINT message, WPARAM wParam, LPARAM lParam);

private:
    HWND handle_ = nullptr;
};

KOTA_API bool IsWindow(HWND handle);

// Runs the window's WindowProc and gives its result; 0 for a handle of no living window. An
// invalid-argument failure inside ends the handler: the user is told in a box and the result is 0.
KOTA_API LRESULT SendMessage(HWND handle, UINT message, WPARAM wParam, LPARAM lParam);

// Moves the focus, to none with null, and gives the handle that had it. The old holder gets WM_KILLFOCUS
// before the new one gets WM_SETFOCUS, both before the call returns.
KOTA_API HWND SetFocus(HWND handle);
KOTA_API HWND GetFocus();

// The number of a message known by name, the same for every module and every call: 0xC000 and above.
KOTA_API UINT RegisterWindowMessage(const char* name);
