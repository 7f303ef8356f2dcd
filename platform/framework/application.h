#pragma once

#include "platform/framework/window.h"

// A thread with a user interface. The system knows one, the application's.
class KOTA_API CWinThread : public CCmdTarget {
public:
    CWinThread();
    ~CWinThread() override;

    // The window that the shell's messages go to, null before it exists and after it was destroyed.
    CWnd* GetMainWnd() const;
    // Not owned.
    void SetMainWnd(CWnd* window);

private:
    HWND mainWindow_ = nullptr;
};

// The application. There is at most one at a time: the one constructed last, for as long as it lives.
class KOTA_API CWinApp : public CWinThread {
public:
    CWinApp();
    ~CWinApp() override;
};

// Null when there is no application.
KOTA_API CWinApp* AfxGetApp();
KOTA_API CWinThread* AfxGetThread();
// The application's main window, null when there is none.
KOTA_API CWnd* AfxGetMainWnd();
