#include "platform/framework/template.h"

#include "platform/framework/application.h"
#include "platform/framework/document.h"
#include "platform/framework/frame.h"

#include <algorithm>
#include <filesystem>
#include <memory>
#include <string_view>
#include <system_error>

IMPLEMENT_DYNAMIC(CDocTemplate, CObject, kota::platformModule)
IMPLEMENT_DYNAMIC(CMultiDocTemplate, CDocTemplate, kota::platformModule)

CDocTemplate::CDocTemplate(UINT id, const CRuntimeClass* documentClass, const CRuntimeClass* frameClass,
                           const CRuntimeClass* viewClass)
    : id_(id), documentClass_(documentClass), frameClass_(frameClass), viewClass_(viewClass) {}

CDocTemplate::~CDocTemplate() {
    for (CDocument* document : documents_)
        document->docTemplate_ = nullptr;
}

CString CDocTemplate::GetDocString(DocString part) const {
    const CString joined = Module().string(id_);
    std::string_view rest = joined.View();
    for (int skip = static_cast<int>(part); skip > 0; --skip) {
        const std::size_t end = rest.find('\n');
        rest = end == std::string_view::npos ? std::string_view() : rest.substr(end + 1);
    }
    return CString(rest.substr(0, rest.find('\n')));
}

CDocument* CDocTemplate::CreateNewDocument() {
    CObject* const object = documentClass_->CreateObject();
    if (!object || !object->IsKindOf(RUNTIME_CLASS(CDocument))) {
        delete object;
        return nullptr;
    }
    auto* const document = static_cast<CDocument*>(object);
    document->docTemplate_ = this;
    documents_.push_back(document);
    if (CWinApp* const application = AfxGetApp())
        application->Adopt(this);
    return document;
}

CFrameWnd* CDocTemplate::CreateNewFrame(CDocument* document, CFrameWnd* /*other*/) {
    CObject* const object = frameClass_->CreateObject();
    if (!object || !object->IsKindOf(RUNTIME_CLASS(CFrameWnd))) {
        delete object;
        return nullptr;
    }
    auto frame = std::unique_ptr<CFrameWnd>(static_cast<CFrameWnd*>(object));
    if (!frame->LoadFrame(AfxGetMainWnd(), {.viewClass = viewClass_, .document = document}))
        return nullptr;
    return frame.release();
}

void CDocTemplate::InitialUpdateFrame(CFrameWnd* frame, CDocument* document, BOOL makeVisible) {
    frame->InitialUpdateFrame(document, makeVisible);
}

CDocument* CDocTemplate::FindOpen(const char* path) const {
    const CString wanted(path);
    const auto found = std::ranges::find_if(documents_, [&](const CDocument* document) {
        std::error_code failed; // where one of them does not exist
        return document->GetPathName() == wanted ||
               std::filesystem::equivalent(document->GetPathName().View(), wanted.View(), failed);
    });
    return found == documents_.end() ? nullptr : *found;
}

void CDocTemplate::RemoveDocument(CDocument* document) {
    std::erase(documents_, document);
    if (CWinApp* const application = AfxGetApp(); application && documents_.empty())
        application->Release(this);
}

CMultiDocTemplate::~CMultiDocTemplate() = default;

CDocument* CMultiDocTemplate::OpenDocumentFile(const char* path, BOOL makeVisible) {
    CDocument* const document = CreateNewDocument();
    if (!document)
        return nullptr;
    if (!path) {
        CString title;
        title.Format("%s%d", static_cast<const char*>(GetDocString(DocString::DocName)), ++untitled_);
        document->SetTitle(title);
    }
    CFrameWnd* frame = nullptr;
    const bool ready = path ? document->OnOpenDocument(path) : document->OnNewDocument();
    if (ready) {
        if (path)
            document->SetPathName(path);
        frame = CreateNewFrame(document, nullptr);
    }
    if (!frame) {
        document->OnCloseDocument();
        return nullptr;
    }
    const HWND window = frame->GetSafeHwnd();
    InitialUpdateFrame(frame, document, makeVisible);
    return IsWindow(window) ? document : nullptr; // the shell may have closed it meanwhile
}
