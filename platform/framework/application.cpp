#include "platform/framework/application.h"

namespace {
CWinApp* theApplication = nullptr;
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
