#pragma once

#include "platform/framework/window.h"

class CDocument;
class CFrameWnd;

// What a frame makes a view with. Nothing in it is owned.
struct CCreateContext {
    const CRuntimeClass* viewClass = nullptr;
    CDocument* document = nullptr;
};

// What is to be printed.
struct CPrintInfo {};

// A window onto a document, in a frame. It ends with its frame, and then deletes itself.
class KOTA_API CView : public CWnd {
    DECLARE_DYNAMIC(CView)
public:
    CView();
    // Leaves its document.
    ~CView() override;

    // The document that the view was added to, null when there is none or it is gone.
    CDocument* GetDocument() const { return document_; }

    // Makes the view's window inside `frame` and adds the view to the document of `context`.
    virtual BOOL CreateView(CFrameWnd* frame, const CCreateContext& context);
    // Called once, when the document stands ready. The base calls OnUpdate with no hint.
    virtual void OnInitialUpdate();
    // Something of the document changed; `hint` and `hintObject` say what, as the sender chose. `sender` is
    // the view that made the change, or null.
    virtual void OnUpdate(CView* sender, LPARAM hint, CObject* hintObject);
    // The view has become the active one of its frame (activate 1), or is to be it no more. When the whole
    // frame is left or entered, both views are this one.
    virtual void OnActivateView(BOOL activate, CView* activateView, CView* deactiveView);

    // Before the document is printed; 0 does not print. The base gives 0.
    virtual BOOL OnPreparePrinting(CPrintInfo* info);
    // The print commands. Nothing prints here: the user is told so.
    void OnFilePrint();
    void OnFilePrintPreview();

    // A command that the view has no handler for goes on to the document.
    BOOL OnCmdMsg(UINT id, int notification) override;
    // Ctrl+F4 closes the frame.
    LRESULT WindowProc(UINT message, WPARAM wParam, LPARAM lParam) override;

protected:
    // Tells the user that nothing prints here, and gives 0.
    BOOL DoPreparePrinting(CPrintInfo* info);
    void PostNcDestroy() override;

private:
    friend class CDocument;
    CDocument* document_ = nullptr;
    bool ownsItself_ = false; // made by a frame
};

// A view made of the controls of a dialog template.
class KOTA_API CFormView : public CView {
    DECLARE_DYNAMIC(CFormView)
public:
    explicit CFormView(UINT templateId);
    ~CFormView() override;

    BOOL CreateView(CFrameWnd* frame, const CCreateContext& context) override;
    void FocusLeft(HWND window) override;
    // The frame takes the size that the form needs; with `shrinkOnly` it does not grow.
    void ResizeParentToFit(BOOL shrinkOnly = TRUE);
    // The focus goes on to the control that had it last.
    LRESULT WindowProc(UINT message, WPARAM wParam, LPARAM lParam) override;

private:
    UINT templateId_;
    HWND lastFocus_ = nullptr;
};
