#include "platform/framework/document.h"

#include "platform/framework/frame.h"
#include "platform/framework/message_box.h"
#include "platform/framework/path.h"
#include "platform/framework/platform_texts.h"
#include "platform/framework/template.h"
#include "platform/framework/view.h"

#include <algorithm>
#include <string>
#include <utility>

IMPLEMENT_DYNAMIC(CDocument, CCmdTarget, kota::platformModule)

CDocument::CDocument() = default;

CDocument::~CDocument() {
    for (CView* view : std::exchange(views_, {}))
        view->document_ = nullptr;
    if (docTemplate_)
        docTemplate_->RemoveDocument(this);
}

void CDocument::SetTitle(const char* title) {
    title_ = title;
    UpdateFrameTitles();
}

void CDocument::UpdateFrameTitles() {
    std::vector<CFrameWnd*> frames;
    for (const CView* view : views_)
        if (CFrameWnd* const frame = view->GetParentFrame();
            frame && std::ranges::find(frames, frame) == frames.end())
            frames.push_back(frame);
    for (std::size_t i = 0; i < frames.size(); ++i) {
        frames[i]->SetWindowText(frames.size() == 1 ? title_ : title_ + ":" + std::to_string(i + 1).c_str());
        frames[i]->SetModifiedMark(modified_);
    }
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
    if (std::exchange(modified_, modified != 0) != modified_)
        UpdateFrameTitles();
}

void CDocument::AddView(CView* view) {
    if (view->document_)
        view->document_->RemoveView(view);
    view->document_ = this;
    views_.push_back(view);
}

void CDocument::RemoveView(CView* view) {
    if (std::erase(views_, view) == 0)
        return;
    view->document_ = nullptr;
    if (views_.empty() && docTemplate_)
        OnCloseDocument();
    else
        UpdateFrameTitles();
}

void CDocument::OnCloseDocument() {
    // A view in a frame takes leave when it ends, and the last one calls this again.
    const std::vector<CView*> present = views_;
    for (CView* view : present) {
        if (std::ranges::find(views_, view) == views_.end())
            continue;
        if (CFrameWnd* const frame = view->GetParentFrame()) {
            frame->DestroyWindow();
        } else {
            std::erase(views_, view);
            view->document_ = nullptr;
        }
    }
    if (!views_.empty())
        return;
    DeleteContents();
    delete this;
}

bool CDocument::HasFocus() const {
    const CWnd* const focus = CWnd::GetFocus();
    return focus && std::ranges::any_of(views_, [&](const CView* view) { return view->IsChild(focus); });
}

BOOL CDocument::TakePendingInput() {
    if (!HasFocus())
        return TRUE;
    const HWND holder = ::GetFocus();
    const unsigned boxes = kota::boxesShown();
    ::SetFocus(nullptr);
    const bool taken = ::GetFocus() != holder && kota::boxesShown() == boxes;
    if (!::GetFocus())
        ::SetFocus(holder);
    return taken;
}

BOOL CDocument::CanCloseFrame(CFrameWnd* frame) {
    const bool another = std::ranges::any_of(
        views_, [&](const CView* view) { return view->GetParentFrame() && view->GetParentFrame() != frame; });
    return another || SaveModified();
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

BOOL CDocument::OnCmdMsg(UINT id, int notification) {
    static constexpr auto commands = kota::commandMap<CDocument>({
        {ID_FILE_CLOSE, 0, &CDocument::OnFileClose},
        {ID_FILE_SAVE, 0, &CDocument::OnFileSave},
        {ID_FILE_SAVE_AS, 0, &CDocument::OnFileSaveAs},
    });
    return kota::runCommand(*this, commands, id, notification) || CCmdTarget::OnCmdMsg(id, notification);
}

void CDocument::OnFileSave() {
    DoSave(pathName_);
}
void CDocument::OnFileSaveAs() {
    DoSave("");
}

void CDocument::OnFileClose() {
    if (TakePendingInput() && SaveModified())
        OnCloseDocument();
}

BOOL CDocument::SaveModified() {
    if (!IsModified())
        return TRUE;
    CString question;
    const CString name = title_.IsEmpty() ? kota::platformText(kota::PlatformText::TheDocument) : title_;
    question = kota::platformText(kota::PlatformText::SaveChanges, static_cast<const char*>(name));
    switch (AfxMessageBox(question, MB_YESNOCANCEL)) {
    case IDYES:
        return DoSave(pathName_);
    case IDNO:
        return TRUE;
    default:
        return FALSE;
    }
}
