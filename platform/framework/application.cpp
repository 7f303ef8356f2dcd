#include "platform/framework/application.h"

#include "platform/framework/document.h"
#include "platform/framework/frame.h"
#include "platform/framework/message_box.h"
#include "platform/framework/path.h"
#include "platform/framework/platform_texts.h"
#include "platform/framework/template.h"
#include "platform/framework/turn.h"

#include <algorithm>
#include <cctype>

namespace {

CWinApp* theApplication = nullptr;

bool sameLetters(const CString& left, const CString& right) {
    return std::ranges::equal(left.View(), right.View(), [](unsigned char a, unsigned char b) {
        return std::tolower(a) == std::tolower(b);
    });
}

} // namespace

CWinThread::CWinThread() = default;
CWinThread::~CWinThread() = default;

CWnd* CWinThread::GetMainWnd() const {
    return CWnd::FromHandle(mainWindow_);
}
void CWinThread::SetMainWnd(CWnd* window) {
    mainWindow_ = window ? window->GetSafeHwnd() : nullptr;
}

CWinApp::CWinApp() {
    theApplication = this;
}

CWinApp::~CWinApp() {
    if (theApplication == this)
        theApplication = nullptr;
    for (CDocTemplate* docTemplate : known_)
        delete docTemplate;
    for (CDocTemplate* docTemplate : adopted_)
        delete docTemplate;
}

void CWinApp::AddDocTemplate(std::unique_ptr<CDocTemplate> docTemplate) {
    kota::keep(docTemplate.get());
    std::erase(adopted_, docTemplate.get());
    known_.push_back(docTemplate.release());
}

bool CWinApp::Knows(const CDocTemplate* docTemplate) const {
    return std::ranges::find(known_, docTemplate) != known_.end();
}

void CWinApp::Adopt(CDocTemplate* docTemplate) {
    kota::keep(docTemplate);
    if (!Knows(docTemplate) && std::ranges::find(adopted_, docTemplate) == adopted_.end())
        adopted_.push_back(docTemplate);
}

void CWinApp::Release(CDocTemplate* docTemplate) {
    if (std::erase(adopted_, docTemplate) > 0)
        kota::deleteLater(docTemplate);
}

CDocument* CWinApp::OpenDocumentFile(const char* path) {
    const CString extension = SplitPath(path).extension;
    for (CDocTemplate* docTemplate : known_) {
        if (CDocument* const open = docTemplate->FindOpen(path)) {
            if (CFrameWnd* const frame =
                    open->Views().empty() ? nullptr : open->Views().front()->GetParentFrame())
                frame->ActivateFrame();
            return open;
        }
        if (sameLetters(docTemplate->GetDocString(CDocTemplate::DocString::FilterExtension), extension))
            return docTemplate->OpenDocumentFile(path);
    }
    return nullptr;
}

void CWinApp::WinHelp(UINT /*context*/) {
    AfxMessageBox(kota::platformText(kota::PlatformText::NoHelp));
}

CWinApp* AfxGetApp() {
    return theApplication;
}
CWinThread* AfxGetThread() {
    return theApplication;
}
CWnd* AfxGetMainWnd() {
    return theApplication ? theApplication->GetMainWnd() : nullptr;
}
