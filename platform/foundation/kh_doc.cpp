#include "platform/foundation/kh_doc.h"

#include "platform/foundation/kept_file.h"
#include "platform/framework/message_box.h"
#include "platform/framework/platform_texts.h"
#include "platform/framework/screen.h"
#include "platform/framework/template.h"
#include "platform/kvs/kvs.h"

#include <cerrno>
#include <fstream>
#include <system_error>

namespace fs = std::filesystem;
using kota::PlatformText;

namespace {

// Why a file cannot be read, or an empty text.
std::string unreadable(const char* path) {
    std::error_code failed;
    const fs::file_status status = fs::status(path, failed);
    if (fs::exists(status) && !fs::is_regular_file(status))
        return std::string(kota::platformText(PlatformText::NotAFile).View());
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

// Gives the focus back, if a save took it away.
class FocusScope {
public:
    FocusScope() = default;
    ~FocusScope() {
        if (!::GetFocus())
            ::SetFocus(holder_);
    }
    FocusScope(const FocusScope&) = delete;
    FocusScope& operator=(const FocusScope&) = delete;

private:
    HWND holder_ = ::GetFocus();
};

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
        message = kota::platformText(PlatformText::CannotOpen, path, reason.c_str());
        AfxMessageBox(message);
        return FALSE;
    }
    if (looksInterrupted(path)) {
        message = kota::platformText(PlatformText::SaveInterrupted, path,
                                     kota::KeptFile::keptName(path).string().c_str());
        AfxMessageBox(message);
    }
    DeleteContents();
    SetModifiedFlag(FALSE);
    return TRUE;
}

BOOL CKhDoc::DoSave(const char* path) {
    const FocusScope scope;
    if (HasFocus())
        ::SetFocus(nullptr); // a text that is refused stays where it is, and out of the file
    CString name = path;
    if (name.IsEmpty())
        name = AskName();
    if (name.IsEmpty())
        return FALSE;
    if (!MayWriteInstead(name))
        return FALSE;
    CString problem;
    const BOOL saved = SaveKeeping(name, problem);
    if (!problem.IsEmpty())
        AfxMessageBox(problem);
    return saved;
}

CString CKhDoc::AskName() const {
    kota::Screen* const screen = kota::attachedScreen();
    const auto chosen =
        screen ? screen->askSaveName(GetPathName().IsEmpty() ? GetTitle() : GetPathName()) : std::nullopt;
    return chosen.value_or(CString());
}

// Whoever named a file knows of it, but perhaps not of the one that is written.
bool CKhDoc::MayWriteInstead(const CString& named) const {
    const CString written = WrittenPathName(named);
    const CDocTemplate* const docTemplate = GetDocTemplate();
    const CDocument* const open = docTemplate ? docTemplate->FindOpen(written) : nullptr;
    CString question;
    if (open && open != this) {
        question = kota::platformText(PlatformText::OpenElsewhere, static_cast<const char*>(written));
        AfxMessageBox(question);
        return false;
    }
    std::error_code failed;
    const bool isNamed = fs::equivalent(named.View(), written.View(), failed);
    if (written == named || isNamed || !fs::exists(written.View(), failed))
        return true;
    question = kota::platformText(PlatformText::ReplaceFile, static_cast<const char*>(written));
    return AfxMessageBox(question, MB_YESNO) == IDYES;
}

// The old file is back in its place by the time this returns 0. `problem` is what the user has to be told.
BOOL CKhDoc::SaveKeeping(const CString& path, CString& problem) {
    const CString written = WrittenPathName(path);
    kota::KeptFile old(static_cast<const char*>(written));
    if (!old.error().empty()) {
        problem =
            kota::platformText(PlatformText::NotKept, static_cast<const char*>(written), old.error().c_str());
        return FALSE;
    }
    kvsGetErrorGlb(); // what failed earlier is not this save's failure
    if (!OnSaveDocument(path))
        return FALSE;
    if (kvsPeekErrorGlb()) {
        problem = kota::platformText(PlatformText::NotSaved, static_cast<const char*>(kvsPeekErrorTextGlb()));
        kvsGetErrorGlb();
        SetModifiedFlag(TRUE);
        return FALSE;
    }
    old.written();
    SetPathName(written);
    return TRUE;
}
