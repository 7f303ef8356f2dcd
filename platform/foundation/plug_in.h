#pragma once

#include "platform/framework/extension.h"
#include "platform/framework/text.h"

#include <memory>
#include <string>
#include <vector>

class CDocTemplate;
class CKhMDIFrameWnd;
class CKhToolBarEx;

namespace kota {

// A plug-in as a shell loads it: by its file, through its exports, each under its plain name. It stays loaded
// to the end of the program, since objects of it may live as long. It is asked for its counts when it is
// loaded, before anything else.
class KOTA_API PlugIn {
public:
    // Throws std::runtime_error, with the reason, when the library or one of its exports is not there, and
    // when it was built for another version of the platform (kota::abiVersion).
    explicit PlugIn(const std::string& path);

    const std::string& path() const { return path_; }
    // The name of its editor in the user's language.
    CString editorName() const;
    // The number of the editor's bitmap in the module of its templates.
    UINT bitmapId() const;
    // The templates that the plug-in offers, each new.
    std::vector<std::unique_ptr<CDocTemplate>> makeTemplates() const;
    int toolBarCount() const { return toolBarCount_; }
    // A new tool bar, docked at the frame; null when there is none of that index or it cannot be made.
    std::unique_ptr<CKhToolBarEx> makeToolBar(CKhMDIFrameWnd& frame, UINT style, UINT id, int index) const;
    // Empty when there is none of that index.
    CString toolBarName(int index) const;

private:
    template <class Function>
    Function* symbol(const char* name) const;

    std::string path_;
    HINSTANCE library_ = nullptr;
    int templateCount_ = 0;
    int toolBarCount_ = 0;
};

} // namespace kota
