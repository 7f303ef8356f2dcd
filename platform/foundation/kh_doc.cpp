#include "platform/foundation/kh_doc.h"

#include "platform/foundation/kept_file.h"
#include "platform/framework/message_box.h"
#include "platform/framework/screen.h"
#include "platform/kvs/kvs.h"

#include <cerrno>
#include <fstream>
#include <system_error>

namespace fs = std::filesystem;

namespace {

// Why a file cannot be read, or an empty text.
std::string unreadable(const char* path) {
    std::error_code failed;
    const fs::file_status status = fs::status(path, failed);
    if (fs::exists(status) && !fs::is_regular_file(status))
        return "not a file";
    errno = 0;
    if (std::ifstream(path).is_open())
        return {};
    return std::generic_category().message(errno);
}

// An empty file beside a kept one is what is left where a program was ended in the middle of a save.
bool looksInterrupted(const char* path) {
    std::error_code failed;
    return fs::file_size(path, failed) == 0 && fs::exists(kota::KeptFile::keptName(path), failed);
}

} // namespace

IMPLEMENT_DYNAMIC(CKhDoc, CDocument, kota::platformModule)

CKhDoc::CKhDoc() = default;
CKhDoc::~CKhDoc() = default;

CString CKhDoc::WrittenPathName(const char* path) const {
    return path;
}

BOOL CKhDoc::OnOpenDocument(const char* path) {
    path = path ? path : "";
    CString message;
    if (const std::string reason = unreadable(path); !reason.empty()) {
        message.Format("%s cannot be opened: %s.", path, reason.c_str());
        AfxMessageBox(message);
        return FALSE;
    }
    if (looksInterrupted(path)) {
        message.Format("%s is empty: a save of it was interrupted. The version before is in %s.", path,
                       kota::KeptFile::keptName(path).string().c_str());
        AfxMessageBox(message);
    }
    DeleteContents();
    SetModifiedFlag(FALSE);
    return TRUE;
}

BOOL CKhDoc::DoSave(const char* path) {
    TakePendingInput(); // a text that is refused stays in its cell, and out of the file
    CString name = path;
    if (name.IsEmpty()) {
        kota::Screen* screen = kota::attachedScreen();
        const auto chosen = screen ? screen->askSaveName(GetTitle()) : std::nullopt;
        if (!chosen)
            return FALSE;
        name = *chosen;
    }
    CString problem;
    const HWND focus = ::GetFocus();
    const BOOL saved = SaveKeeping(name, problem);
    if (!::GetFocus()) // which a save takes away
        ::SetFocus(focus);
    if (!problem.IsEmpty())
        AfxMessageBox(problem);
    return saved;
}

// The old file is back in its place by the time this returns 0. `problem` is what the user has to be told.
BOOL CKhDoc::SaveKeeping(const CString& path, CString& problem) {
    const CString written = WrittenPathName(path);
    kota::KeptFile old(static_cast<const char*>(written));
    if (!old.error().empty()) {
        problem.Format("%s was not saved, since the version before could not be kept: %s.",
                       static_cast<const char*>(written), old.error().c_str());
        return FALSE;
    }
    kvsGetErrorGlb(); // what failed earlier is not this save's failure
    if (!OnSaveDocument(path))
        return FALSE;
    if (kvsPeekErrorGlb()) {
        problem.Format("The document was not saved: %s.", static_cast<const char*>(kvsPeekErrorTextGlb()));
        kvsGetErrorGlb();
        SetModifiedFlag(TRUE);
        return FALSE;
    }
    old.written();
    SetPathName(written);
    return TRUE;
}
