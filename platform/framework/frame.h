#pragma once

#include "platform/framework/menu.h"
#include "platform/framework/resources.h"
#include "platform/framework/view.h"

#include <cstddef>
#include <vector>

class CDocTemplate;

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
    virtual BOOL LoadFrame(CWnd* parent, const CCreateContext& context);
    virtual BOOL PreCreateWindow(CREATESTRUCT& create);
    virtual BOOL OnCreateClient(CREATESTRUCT* create, const CCreateContext& context);
    // Calls OnInitialUpdate of the view, and brings the frame to the front if it is to be seen.
    void InitialUpdateFrame(CDocument* document, BOOL makeVisible);
    // Shows whether the document has changes that are not saved.
    void SetModifiedMark(bool modified);
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

    BOOL LoadFrame(CWnd* parent, const CCreateContext& context) override;
    void ActivateFrame() override;
    BOOL DestroyWindow() override;

private:
    friend class CMDIFrameWnd;
    std::vector<bool> topEntries_; // of the menu, while another one is shown: which are enabled
};

// A main window that holds the documents' frames.
class KOTA_API CMDIFrameWnd : public CFrameWnd {
    DECLARE_DYNAMIC(CMDIFrameWnd)
public:
    CMDIFrameWnd();
    ~CMDIFrameWnd() override;

    // The frame in front; null when there is none.
    CMDIChildWnd* MDIGetActive() const;
    // Its document; null when there is none.
    CDocument* FrontDocument() const;
    // Brings a frame to the front; null brings none. The one before is told first.
    void MDIActivate(CMDIChildWnd* child);
    // The frames, in the order in which they were made.
    std::vector<CMDIChildWnd*> Children() const;

    // Asks about the changes of all documents before it closes any.
    void OnClose() override;
    CMenu* GetMenu() override { return &menu_; }
    // A command goes to the frame in front first. The main window's own are "New Window", and
    // the next and the previous frame.
    BOOL OnCmdMsg(UINT id, int notification) override;

    // Shows the menu that goes with a frame, with its top entries enabled as they were when it was shown
    // last; null when no frame is left.
    void ShowMenuOf(CMDIChildWnd* child);
    // The command that a key runs for the frame in front or for the main window; 0 for none.
    UINT CommandOf(const kota::Accelerator& pressed) const;
    // The prompt of a command and, behind a line feed, its tool tip: the front document's, or else this
    // window's.
    CString GetMessageString(UINT id) const;
    // Files were dropped on the window. The base does nothing with them.
    virtual void OnDropFiles(const std::vector<CString>& paths);
    // Has the document in front take over what is being typed; false when that is refused.
    bool TakePendingInput() const;
    // The main window's own keys, which must outlive it.
    void LoadAccelerators(const kota::AcceleratorTable& own) { ownKeys_ = &own; }

protected:
    // Builds the menu for the documents of a template, null for no document. The base leaves it as it is.
    virtual void OnUpdateFrameMenu(const CDocTemplate* front);

private:
    void OnWindowNew();
    void OnNextPane();
    void OnPreviousPane();
    // Brings the frame so many places behind the one in front to the front, round the end.
    void ActivateBeside(std::ptrdiff_t step);

    CMenu menu_;
    HWND menuOf_ = nullptr;
    HWND activeChild_ = nullptr;
    const kota::AcceleratorTable* ownKeys_ = nullptr;
};
