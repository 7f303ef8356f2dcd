#include "platform/framework/document.h"

#include "platform/framework/message_box.h"
#include "platform/framework/path.h"
#include "platform/framework/view.h"

#include <algorithm>

IMPLEMENT_DYNAMIC(CDocument, CCmdTarget, kota::platformModule)
IMPLEMENT_DYNAMIC(CView, CWnd, kota::platformModule)

CDocument::CDocument() = default;

CDocument::~CDocument() {
    while (!views_.empty())
        RemoveView(views_.back());
}

void CDocument::SetTitle(const char* title) {
    title_ = title;
}

void CDocument::SetPathName(const char* path) {
    pathName_ = path;
    const PathParts parts = SplitPath(pathName_);
    SetTitle(parts.fileName + parts.extension);
}

BOOL CDocument::IsModified() {
    return modified_;
}
void CDocument::SetModifiedFlag(BOOL modified) {
    modified_ = modified != 0;
}

void CDocument::AddView(CView* view) {
    if (view->document_)
        view->document_->RemoveView(view);
    view->document_ = this;
    views_.push_back(view);
}

void CDocument::RemoveView(CView* view) {
    if (std::erase(views_, view) > 0)
        view->document_ = nullptr;
}

void CDocument::UpdateAllViews(CView* sender, LPARAM hint, CObject* hintObject) {
    const std::vector<CView*> present = views_;
    for (CView* view : present) {
        const bool stillThere = std::ranges::find(views_, view) != views_.end();
        if (view != sender && stillThere)
            view->OnUpdate(sender, hint, hintObject);
    }
}

void CDocument::Serialize(CArchive& /*archive*/) {}
void CDocument::DeleteContents() {}

BOOL CDocument::OnNewDocument() {
    DeleteContents();
    pathName_.Empty();
    SetModifiedFlag(FALSE);
    return TRUE;
}

BOOL CDocument::SaveModified() {
    if (!IsModified())
        return TRUE;
    CString question;
    question.Format("Save changes to %s?",
                    title_.IsEmpty() ? "the document" : static_cast<const char*>(title_));
    switch (AfxMessageBox(question, MB_YESNOCANCEL)) {
    case IDYES:
        return DoSave(pathName_);
    case IDNO:
        return TRUE;
    default:
        return FALSE;
    }
}

CView::CView() = default;

CView::~CView() {
    if (document_)
        document_->RemoveView(this);
}

void CView::OnUpdate(CView* /*sender*/, LPARAM /*hint*/, CObject* /*hintObject*/) {}
