#include "platform/framework/frame.h"

#include "platform/framework/document.h"
#include "platform/framework/template.h"
#include "platform/framework/turn.h"

#include <utility>

IMPLEMENT_DYNAMIC(CFrameWnd, CWnd, kota::platformModule)

CFrameWnd::CFrameWnd() = default;
CFrameWnd::~CFrameWnd() = default;

BOOL CFrameWnd::PreCreateWindow(CREATESTRUCT& /*create*/) {
    return TRUE;
}

BOOL CFrameWnd::LoadFrame(CWnd* parent, const CCreateContext& context) {
    CREATESTRUCT create;
    if (!PreCreateWindow(create) ||
        !Create({.parent = parent ? parent->GetSafeHwnd() : nullptr, .kind = kota::WindowKind::Frame}))
        return FALSE;
    if (!OnCreateClient(&create, context)) {
        DestroyWindow();
        return FALSE;
    }
    ownsItself_ = true;
    return TRUE;
}

BOOL CFrameWnd::OnCreateClient(CREATESTRUCT* /*create*/, const CCreateContext& context) {
    CObject* const object = context.viewClass ? context.viewClass->CreateObject() : nullptr;
    if (!object || !object->IsKindOf(RUNTIME_CLASS(CView))) {
        delete object;
        return FALSE;
    }
    auto* const view = static_cast<CView*>(object);
    if (!view->CreateView(this, context)) {
        kota::deleteLater(view); // it may have a window and a document already
        return FALSE;
    }
    activeView_ = view->GetSafeHwnd();
    return TRUE;
}

void CFrameWnd::InitialUpdateFrame(CDocument* document, BOOL makeVisible) {
    if (document)
        document->UpdateFrameTitles();
    if (CView* const view = GetActiveView())
        view->OnInitialUpdate();
    ShowWindow(makeVisible);
    if (makeVisible)
        ActivateFrame();
}

void CFrameWnd::SetModifiedMark(bool modified) {
    kota::WindowState* const state = MutableState();
    if (state && std::exchange(state->modified, modified) != modified)
        kota::noteChange(GetSafeHwnd(), kota::Change::Text);
}

void CFrameWnd::RecalcLayout() {
    kota::noteChange(GetSafeHwnd(), kota::Change::State);
}

void CFrameWnd::ActivateFrame() {
    BringWindowToTop();
    if (CView* const view = GetActiveView())
        view->SetFocus();
}

void CFrameWnd::OnClose() {
    CDocument* const document = GetActiveDocument();
    if (document && (!document->TakePendingInput() || !document->CanCloseFrame(this)))
        return;
    DestroyWindow();
}

CView* CFrameWnd::GetActiveView() const {
    return static_cast<CView*>(FromHandle(activeView_));
}

CDocument* CFrameWnd::GetActiveDocument() const {
    const CView* const view = GetActiveView();
    return view ? view->GetDocument() : nullptr;
}

void CFrameWnd::SetActiveView(CView* view) {
    CView* const before = GetActiveView();
    if (view == before)
        return;
    if (before)
        before->OnActivateView(FALSE, view, before);
    activeView_ = view ? view->GetSafeHwnd() : nullptr;
    if (view)
        view->OnActivateView(TRUE, view, before);
}

BOOL CFrameWnd::OnCmdMsg(UINT id, int notification) {
    CView* const view = GetActiveView();
    // The control with the focus comes first: the commands of the Edit menu are its own.
    CWnd* const focus = GetFocus();
    const bool isControl = view && view->IsChild(focus);
    return (isControl && focus->OnCmdMsg(id, notification)) || (view && view->OnCmdMsg(id, notification)) ||
           CWnd::OnCmdMsg(id, notification);
}

LRESULT CFrameWnd::WindowProc(UINT message, WPARAM wParam, LPARAM lParam) {
    if (message == WM_CLOSE) {
        OnClose();
        return 0;
    }
    if (message == WM_SETFOCUS) {
        if (CView* const view = GetActiveView())
            view->SetFocus();
        return 0;
    }
    return CWnd::WindowProc(message, wParam, lParam);
}

void CFrameWnd::PostNcDestroy() {
    if (ownsItself_)
        kota::deleteLater(this);
}
