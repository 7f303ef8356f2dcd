#include "platform/framework/view.h"

#include "platform/framework/dialog.h"
#include "platform/framework/document.h"
#include "platform/framework/frame.h"
#include "platform/framework/platform_texts.h"
#include "platform/framework/tab_order.h"
#include "platform/framework/turn.h"

IMPLEMENT_DYNAMIC(CView, CWnd, kota::platformModule)
IMPLEMENT_DYNAMIC(CFormView, CView, kota::platformModule)

CView::CView() = default;

CView::~CView() {
    if (document_)
        document_->RemoveView(this);
}

BOOL CView::CreateView(CFrameWnd* frame, const CCreateContext& context) {
    if (!Create({.parent = frame->GetSafeHwnd(), .kind = kota::WindowKind::View}))
        return FALSE;
    ownsItself_ = true;
    if (context.document)
        context.document->AddView(this);
    return TRUE;
}

void CView::PostNcDestroy() {
    if (ownsItself_)
        kota::deleteLater(this);
}

void CView::OnInitialUpdate() {
    OnUpdate(nullptr, 0, nullptr);
}

void CView::OnUpdate(CView* /*sender*/, LPARAM /*hint*/, CObject* /*hintObject*/) {}
void CView::OnActivateView(BOOL /*activate*/, CView* /*activateView*/, CView* /*deactiveView*/) {}

BOOL CView::OnPreparePrinting(CPrintInfo* /*info*/) {
    return FALSE;
}

BOOL CView::DoPreparePrinting(CPrintInfo* /*info*/) {
    MessageBox(kota::platformText(kota::PlatformText::NoPrinting));
    return FALSE;
}

void CView::OnFilePrint() {
    CPrintInfo info;
    OnPreparePrinting(&info);
}
void CView::OnFilePrintPreview() {
    OnFilePrint();
}

BOOL CView::OnCmdMsg(UINT id, int notification) {
    return CWnd::OnCmdMsg(id, notification) || (document_ && document_->OnCmdMsg(id, notification));
}

LRESULT CView::WindowProc(UINT message, WPARAM wParam, LPARAM lParam) {
    if (message == WM_KEYDOWN && wParam == VK_F4 && GetKeyState(VK_CONTROL) < 0 && GetParentFrame())
        return GetParentFrame()->PostMessage(WM_CLOSE);
    return CWnd::WindowProc(message, wParam, lParam);
}

CFormView::CFormView(UINT templateId) : templateId_(templateId) {}
CFormView::~CFormView() = default;

BOOL CFormView::CreateView(CFrameWnd* frame, const CCreateContext& context) {
    const kota::DialogTemplate* const form = GetRuntimeClass()->Module().dialog(templateId_);
    if (!form || !CView::CreateView(frame, context))
        return FALSE;
    kota::createDialogItems(GetSafeHwnd(), *form);
    return TRUE;
}

void CFormView::FocusLeft(HWND window) {
    if (window != GetSafeHwnd())
        lastFocus_ = window;
}

void CFormView::ResizeParentToFit(BOOL /*shrinkOnly*/) {
    if (CWnd* const frame = GetParentFrame())
        kota::noteChange(frame->GetSafeHwnd(), kota::Change::State);
}

LRESULT CFormView::WindowProc(UINT message, WPARAM wParam, LPARAM lParam) {
    if (message == WM_SETFOCUS) {
        CWnd* const last = FromHandle(lastFocus_);
        CWnd* const holder =
            last && IsChild(last) && last->IsWindowVisible() ? last : kota::firstInTabOrder(*this);
        if (holder)
            holder->SetFocus();
        return 0;
    }
    return CView::WindowProc(message, wParam, lParam);
}
