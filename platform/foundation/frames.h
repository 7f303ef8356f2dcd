#pragma once

#include "platform/foundation/toolbar.h"
#include "platform/framework/frame.h"

#include <vector>

// The foundation's frame of a document.
class KOTA_API CKhMDIChildWnd : public CMDIChildWnd {
    DECLARE_DYNCREATE(CKhMDIChildWnd)
public:
    CKhMDIChildWnd();
    ~CKhMDIChildWnd() override;
};

// A main window at whose sides bars can be docked.
class KOTA_API SECMDIFrameWnd : public CMDIFrameWnd {
    DECLARE_DYNAMIC(SECMDIFrameWnd)
public:
    SECMDIFrameWnd();
    ~SECMDIFrameWnd() override;

    // The sides of the frame that take bars, of CBRS_ALIGN_ANY. `flags` is 0.
    void EnableDocking(UINT sides, UINT flags);
    UINT DockingSides() const { return dockingSides_; }
    // Docks a bar of the frame at one of `sides`, 0 for its first; without a rectangle the screen places it.
    void DockControlBar(CControlBar* bar, UINT sides, const CRect* rect = nullptr);
    // The bars docked so far that still have a window, in their order.
    std::vector<CControlBar*> DockedBars() const;

private:
    UINT dockingSides_ = 0;
    std::vector<HWND> docked_;
};

// The shell's main window. Its menu bar holds the menus of the shell, and the document in front adds its own
// behind the second one: those that share no command with a menu of the shell.
class KOTA_API CKhMDIFrameWnd : public SECMDIFrameWnd {
    DECLARE_DYNAMIC(CKhMDIFrameWnd)
public:
    CKhMDIFrameWnd();
    ~CKhMDIFrameWnd() override;

    // The shell's own menu, which must outlive the window.
    void LoadMenu(const kota::MenuTemplate& own);
    // As an editor asks that knows a tool bar by a command: hides the docked bars with that command, or shows
    // the one among them that belongs to the document in front.
    void ShowToolBar(UINT command, bool show);
    // Hands a message of an editor on to the active views of all documents' frames, the sender's among them.
    // A view that is closed meanwhile is left out.
    void PassOn(UINT message, WPARAM wParam, LPARAM lParam);

protected:
    void OnUpdateFrameMenu(const CDocTemplate* front) override;

private:
    const kota::MenuTemplate* own_ = nullptr;
};
