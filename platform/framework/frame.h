#pragma once

#include "platform/framework/menu.h"
#include "platform/framework/view.h"

// How a frame's window is to be made.
struct CREATESTRUCT {
    unsigned style = 0;
    unsigned extendedStyle = 0;
};

// A window around a view. It deletes itself after it was destroyed, but for frames that somebody owns.
class KOTA_API CFrameWnd : public CWnd {
    DECLARE_DYNAMIC(CFrameWnd)
public:
    CFrameWnd();
    ~CFrameWnd() override;

    // Makes the frame's window inside `parent`, and the view of `context` in it. 0 when that failed; then
    // the frame has no window.
    BOOL LoadFrame(CWnd* parent, const CCreateContext& context);
    virtual BOOL PreCreateWindow(CREATESTRUCT& create);
    virtual BOOL OnCreateClient(CREATESTRUCT* create, const CCreateContext& context);
    // Calls OnInitialUpdate of the view, and brings the frame to the front if it is to be seen.
    void InitialUpdateFrame(CDocument* document, BOOL makeVisible);
    virtual void RecalcLayout();
    virtual void ActivateFrame();
    // Asks about changes if this is the document's last frame, and destroys the frame unless the user keeps
    // it.
    virtual void OnClose();

    CView* GetActiveView() const;
    CDocument* GetActiveDocument() const;
    // Makes a view of the frame the active one, null for none.
    void SetActiveView(CView* view);

    // A command goes to the active view first.
    BOOL OnCmdMsg(UINT id, int notification) override;
    LRESULT WindowProc(UINT message, WPARAM wParam, LPARAM lParam) override;

protected:
    void PostNcDestroy() override;

private:
    HWND activeView_ = nullptr;
    bool ownsItself_ = false;
};

// A document's frame inside the main window.
class KOTA_API CMDIChildWnd : public CFrameWnd {
    DECLARE_DYNCREATE(CMDIChildWnd)
public:
    CMDIChildWnd();
    ~CMDIChildWnd() override;

    void ActivateFrame() override;
    BOOL DestroyWindow() override;
};

// A main window that holds the documents' frames.
class KOTA_API CMDIFrameWnd : public CFrameWnd {
    DECLARE_DYNAMIC(CMDIFrameWnd)
public:
    CMDIFrameWnd();
    ~CMDIFrameWnd() override;

    // The frame in front; null when there is none.
    CMDIChildWnd* MDIGetActive() const;
    // Brings a frame to the front; null brings none. The one before is told first.
    void MDIActivate(CMDIChildWnd* child);
    // The frames, in the order in which they were made.
    std::vector<CMDIChildWnd*> Children() const;

    // Closes the frames first, and stays if one of them does.
    void OnClose() override;
    CMenu* GetMenu() override { return &menu_; }
    // A command goes to the frame in front first. "New Window" is the main window's own.
    BOOL OnCmdMsg(UINT id, int notification) override;

private:
    void OnWindowNew();

    CMenu menu_;
    HWND activeChild_ = nullptr;
};
