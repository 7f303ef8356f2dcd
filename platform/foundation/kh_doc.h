#pragma once

#include "platform/framework/document.h"

// The foundation's document: one file of the file library, saved so that nothing is lost.
class KOTA_API CKhDoc : public CDocument {
    DECLARE_DYNAMIC(CKhDoc)
public:
    CKhDoc();
    ~CKhDoc() override;

    // Empties the document for what the file holds; reading it is left to the derived class. 0 when the file
    // cannot be opened, after telling the user why: then the document is as it was.
    BOOL OnOpenDocument(const char* path) override;

    // Takes over what is being typed, as far as it is valid, and saves through OnSaveDocument, and so that
    // nothing is lost: the version before is kept as NAME~ beside the file, whose folder must be writable for
    // that. When the file library could not write, the old file is put back, the user is told why, the
    // document is marked as modified, and the result is 0. After a save the document's path and title are
    // those of the file that was written.
    BOOL DoSave(const char* path) override;

protected:
    // The file that OnSaveDocument writes when it is given `path`.
    virtual CString WrittenPathName(const char* path) const;

private:
    // Asks the user for a name; empty when they changed their mind.
    CString AskName() const;
    bool MayWriteInstead(const CString& named) const;
    BOOL SaveKeeping(const CString& path, CString& problem);
};
