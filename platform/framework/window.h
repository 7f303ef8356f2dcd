#pragma once

#include "platform/framework/command.h"
#include "platform/framework/messages.h"
#include "platform/framework/text.h"
#include "platform/framework/window_state.h"

class CFrameWnd;
class CMenu;

// A message on its way to a window.
struct MSG {
    HWND hwnd = nullptr;
    UINT message = 0;
    WPARAM wParam = 0;
    LPARAM lParam = 0;
};

// A window: an object with a handle that takes messages. It is nothing on a screen by itself; a screen draws
// it from its state and brings the user's input.
class KOTA_API CWnd : public CCmdTarget {
    DECLARE_DYNAMIC(CWnd)
public:
    CWnd();
    // Destroys the window, when it still has one.
    ~CWnd() override;

    // Gives the object its window. 1 done, 0 when it has one already.
    BOOL Create(const kota::WindowSetup& setup = {});
    // Takes over the window of the control `id` of `dialog`, with its state. 1 done, 0 when there is no such
    // control or an object has it already.
    BOOL SubclassDlgItem(UINT id, CWnd* dialog);
    // Lets go of the window, which lives on without an object, and gives its handle.
    HWND Detach();
    // Takes the window away, those inside it and the focus with it: the handles are dead from then on.
    // 0 when there is none.
    virtual BOOL DestroyWindow();

    // The handle, null before Create and after DestroyWindow.
    HWND GetSafeHwnd() const { return handle_; }
    // The object of a living window's handle, null for any other. A control that no object has taken over
    // gets a plain one, which lives as long as the window.
    static CWnd* FromHandle(HWND handle);
    // What the window shows; null without a window.
    const kota::WindowState* State() const;

    CWnd* GetParent() const;
    UINT GetDlgCtrlID() const;
    // The control of that number among those inside the window, at any depth; null when there is none.
    CWnd* GetDlgItem(UINT id) const;
    // Whether `window` stands inside this one, at any depth.
    bool IsChild(const CWnd* window) const;
    // The nearest frame around the window, null when there is none.
    CFrameWnd* GetParentFrame() const;

    // Setting the text of an edit tells its parent EN_CHANGE at once, each time.
    void SetWindowText(const char* text);
    CString GetWindowText() const;
    void GetWindowText(CString& text) const { text = GetWindowText(); }
    // Gives whether the window was disabled before, not 0 if so.
    BOOL EnableWindow(BOOL enable = TRUE);
    // Whether the window and all around it are enabled.
    BOOL IsWindowEnabled() const;
    void ShowWindow(BOOL show);
    BOOL IsWindowVisible() const;
    void SetCheck(BOOL checked);
    BOOL GetCheck() const;
    // What a screen shows when the pointer rests on the window; empty for nothing.
    void SetToolTip(const CString& text);
    unsigned GetStyle() const;
    unsigned GetExStyle() const;
    void ModifyStyleEx(unsigned remove, unsigned add);
    CRect GetWindowRect() const;
    void SetWindowRect(const CRect& rect);
    // Asks the screen to bring the window in front of its siblings.
    void BringWindowToTop();
    // The same, and gives it the focus.
    BOOL SetForegroundWindow();

    virtual CMenu* GetMenu(); // owned by the window; null for none
    // The menu as it stands is to be shown.
    void DrawMenuBar();

    // Runs WindowProc before it returns. 0 without a window.
    LRESULT SendMessage(UINT message, WPARAM wParam = 0, LPARAM lParam = 0);
    // Puts the message off to the end of the turn. 0 without a window.
    BOOL PostMessage(UINT message, WPARAM wParam = 0, LPARAM lParam = 0);
    // Takes the focus, unless the window that has it keeps it, and gives the window that had it, or null.
    CWnd* SetFocus();
    static CWnd* GetFocus();
    // Whether the window may take the focus without being asked to by the user: not from another document's
    // frame.
    bool MayTakeFocus() const;
    // Shows a box owned by this window.
    int MessageBox(const char* text, const char* caption = nullptr, UINT type = 0);

    // Sees each key on its way to this window or to one inside it. 1: taken, it goes no further.
    virtual BOOL PreTranslateMessage(MSG* message);
    // Asked before the focus leaves the window; false keeps it here. What is pending is committed in this.
    virtual bool LetFocusGo();
    // The focus leaves this window or one inside it.
    virtual void FocusLeft(HWND window);
    // An edit hands the commands of the Edit menu to the screen.
    BOOL OnCmdMsg(UINT id, int notification) override;
    // What the window does with a message: a command goes to OnCmdMsg, the rest to DefWindowProc.
    virtual LRESULT WindowProc(UINT message, WPARAM wParam, LPARAM lParam);

protected:
    // What a window of its kind does by itself.
    LRESULT DefWindowProc(UINT message, WPARAM wParam, LPARAM lParam);
    // The last that happens to the object of a window that was destroyed. Windows that own themselves end
    // here, by kota::deleteLater.
    virtual void PostNcDestroy();
    kota::WindowState* MutableState() const;
    // Tells the parent of a control what happened to it.
    void NotifyParent(int notification);

private:
    HWND handle_ = nullptr;
};

KOTA_API bool IsWindow(HWND handle); // whether it is that of a living window

// Runs the window's WindowProc and gives its result; 0 for a handle of no living window. An
// invalid-argument failure inside ends the handler: the user is told in a box and the result is 0.
KOTA_API LRESULT SendMessage(HWND handle, UINT message, WPARAM wParam, LPARAM lParam);
KOTA_API BOOL PostMessage(HWND handle, UINT message, WPARAM wParam, LPARAM lParam);

// Moves the focus, to none with null, and gives the handle that had it. The old holder may refuse
// (LetFocusGo), and then nothing changes; a disabled window does not take it. The old holder gets
// WM_KILLFOCUS before the new one gets WM_SETFOCUS, both before the call returns.
KOTA_API HWND SetFocus(HWND handle);
KOTA_API HWND GetFocus();

// Below 0 while the key is held: VK_SHIFT, VK_CONTROL or VK_MENU.
KOTA_API short GetKeyState(WPARAM key);

// The number of a message known by name, the same for every module and every call: 0xC000 and above.
KOTA_API UINT RegisterWindowMessage(const char* name);
