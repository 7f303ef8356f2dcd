#pragma once

#include "platform/framework/window.h"

#include <memory>
#include <vector>

class CDocTemplate;
class CDocument;

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

    // Makes a template known, and takes it over until the application ends.
    void AddDocTemplate(std::unique_ptr<CDocTemplate> docTemplate);
    const std::vector<CDocTemplate*>& Templates() const { return known_; }
    // Opens a file by the template whose extension it bears, upper or lower case; null when there is none or
    // it failed. A document of a known template that is open already comes to the front.
    virtual CDocument* OpenDocumentFile(const char* path);
    // Shows the page of the help that a context number names.
    virtual void WinHelp(UINT context);

    // For templates alone: a template has its first document, or its last one is gone. One that is not known
    // is deleted then.
    void Adopt(CDocTemplate* docTemplate);
    void Release(CDocTemplate* docTemplate);

private:
    bool Knows(const CDocTemplate* docTemplate) const;

    std::vector<CDocTemplate*> known_;
    std::vector<CDocTemplate*> adopted_;
};

// Null when there is no application.
KOTA_API CWinApp* AfxGetApp();
KOTA_API CWinThread* AfxGetThread();
// The application's main window, null when there is none.
KOTA_API CWnd* AfxGetMainWnd();
