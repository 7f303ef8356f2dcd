#pragma once

#include "platform/framework/window.h"

class CDocument;

// A window onto a document.
class KOTA_API CView : public CWnd {
    DECLARE_DYNAMIC(CView)
public:
    CView();
    // Leaves its document.
    ~CView() override;

    // The document that the view was added to, null when there is none or it is gone.
    CDocument* GetDocument() const { return document_; }

    // Something of the document changed; `hint` and `hintObject` say what, as the sender chose. `sender` is
    // the view that made the change, or null.
    virtual void OnUpdate(CView* sender, LPARAM hint, CObject* hintObject);

private:
    friend class CDocument;
    CDocument* document_ = nullptr;
};
