#pragma once

#include "platform/framework/module.h"
#include "platform/framework/object.h"
#include "platform/framework/text.h"

#include <vector>

class CDocument;
class CFrameWnd;

// What ties the classes of a document, its frame and its view together, with the names that the document's
// kind goes by. It belongs to its maker. An application that knows it by AddDocTemplate owns it until it
// ends; otherwise the application adopts it with its first document and deletes it after the last one.
class KOTA_API CDocTemplate : public CObject {
    DECLARE_DYNAMIC(CDocTemplate)
public:
    // The parts of the string resource of the template's number, which line feeds join.
    enum class DocString {
        WindowTitle,
        DocName,
        FileNewName,
        FilterName,
        FilterExtension,
        RegFileTypeId,
        RegFileTypeName
    };

    // `id` is looked up in the module of the document's class.
    CDocTemplate(UINT id, const CRuntimeClass* documentClass, const CRuntimeClass* frameClass,
                 const CRuntimeClass* viewClass);
    ~CDocTemplate() override;

    UINT Id() const { return id_; }
    const kota::Module& Module() const { return documentClass_->Module(); }
    // Empty for a part that the resource has not.
    CString GetDocString(DocString part) const;
    const CRuntimeClass* DocumentClass() const { return documentClass_; }

    // Opens a file, or makes a new document with null, in a frame of its own. The document belongs to its
    // views and ends with the last one. Null, and nothing is left, when that failed.
    virtual CDocument* OpenDocumentFile(const char* path, BOOL makeVisible = TRUE) = 0;
    // A new document without a frame, which ends by OnCloseDocument; null when its class cannot be made by
    // name.
    CDocument* CreateNewDocument();
    // A further frame with a view of the document; null when that failed. `other` may be null.
    CFrameWnd* CreateNewFrame(CDocument* document, CFrameWnd* other);
    // See CFrameWnd::InitialUpdateFrame.
    void InitialUpdateFrame(CFrameWnd* frame, CDocument* document, BOOL makeVisible);
    // The open document of this template whose file is that of a path, or null.
    CDocument* FindOpen(const char* path) const;
    const std::vector<CDocument*>& Documents() const { return documents_; }

    // For documents alone: a document takes leave.
    void RemoveDocument(CDocument* document);

private:
    UINT id_;
    const CRuntimeClass* documentClass_;
    const CRuntimeClass* frameClass_;
    const CRuntimeClass* viewClass_;
    std::vector<CDocument*> documents_;
};

// A template of any number of documents at a time.
class KOTA_API CMultiDocTemplate : public CDocTemplate {
    DECLARE_DYNAMIC(CMultiDocTemplate)
public:
    using CDocTemplate::CDocTemplate;
    ~CMultiDocTemplate() override;

    CDocument* OpenDocumentFile(const char* path, BOOL makeVisible = TRUE) override;

private:
    int untitled_ = 0; // how many new documents there were
};
