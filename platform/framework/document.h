#pragma once

#include "platform/framework/text.h"
#include "platform/framework/window.h"

#include <vector>

class CDocTemplate;
class CFrameWnd;
class CArchive; // only ever named: no document of the system goes through an archive
class CView;

// A document: what a file holds, in memory, with the views that show it.
class KOTA_API CDocument : public CCmdTarget {
    DECLARE_DYNAMIC(CDocument)
public:
    CDocument();
    // Takes leave of its views. Does not call DeleteContents: whoever ends the document does, before.
    ~CDocument() override;

    const CString& GetTitle() const { return title_; }
    virtual void SetTitle(const char* title); // and that of its frames
    // The file's path as last opened or saved; empty for a document that was never saved.
    const CString& GetPathName() const { return pathName_; }
    // Sets the path, and the file's name as the title.
    virtual void SetPathName(const char* path);

    virtual BOOL IsModified(); // whether there are changes that are not saved
    virtual void SetModifiedFlag(BOOL modified = TRUE);

    // Views are not owned. A view that is constructed for a document adds itself by AddView.
    void AddView(CView* view);
    void RemoveView(CView* view);
    // The views in the order in which they were added.
    const std::vector<CView*>& Views() const { return views_; }
    // Calls OnUpdate of every view but the sender; null leaves none out. A view that another view's OnUpdate
    // takes away is not called. The document itself must outlive the call.
    void UpdateAllViews(CView* sender, LPARAM hint = 0, CObject* hintObject = nullptr);

    virtual void Serialize(CArchive& archive); // never called
    // Empties the document before it is used anew or destroyed.
    virtual void DeleteContents();
    // Makes the document a new one: empty, without a path, not modified. The title is the caller's to set.
    // 1 done.
    virtual BOOL OnNewDocument();
    // Reads the file. 1 done, 0 when the document is not open.
    virtual BOOL OnOpenDocument(const char* path) = 0;
    // Writes the file. 1 done, 0 when it was not written.
    virtual BOOL OnSaveDocument(const char* path) = 0;

    // Saves under `path`, or under a name asked for when it is empty. 1 done.
    virtual BOOL DoSave(const char* path) = 0;
    // Ends a document that a template made: closes the frames of its views, and empties and deletes it when
    // the last view has left.
    virtual void OnCloseDocument();
    // Whether a frame of the document may be closed: not when it is the last one and the user, asked about
    // changes, wants to stay.
    virtual BOOL CanCloseFrame(CFrameWnd* frame);
    // Gives the frames of the document its title, numbered where there are several, and the mark of changes.
    void UpdateFrameTitles();
    // Whether a control in a view of the document has the focus.
    bool HasFocus() const;
    // Has that control take over what the user typed. 0 when it refuses, or tells the user in a box why it
    // did not.
    BOOL TakePendingInput();
    // The template that made the document; null when somebody else did, who owns it.
    CDocTemplate* GetDocTemplate() const { return docTemplate_; }
    // Saves under the document's own name, or asks for another one: the commands of the File menu.
    BOOL OnCmdMsg(UINT id, int notification) override;

    // Asks whether changes shall be saved, and saves them if so. 1: the document may be closed.
    virtual BOOL SaveModified();

private:
    friend class CDocTemplate;
    void OnFileSave();
    void OnFileSaveAs();
    void OnFileClose();

    CDocTemplate* docTemplate_ = nullptr;
    CString title_;
    CString pathName_;
    std::vector<CView*> views_;
    bool modified_ = false;
};
