#include "platform/foundation/plug_in.h"

#include "platform/foundation/frames.h"
#include "platform/framework/template.h"

#include <stdexcept>

namespace kota {

namespace {

void checkVersion(const std::string& path, HINSTANCE library) {
    const auto version = reinterpret_cast<int (*)()>(symbolOf(library, "_ZN4kota16plugInAbiVersionEv"));
    if (!version)
        throw std::runtime_error(path + " is not a plug-in of this program");
    if (const int built = version(); built != abiVersion)
        throw std::runtime_error(path + " was built for version " + std::to_string(built) +
                                 " of the platform; this is version " + std::to_string(abiVersion));
}

} // namespace

PlugIn::PlugIn(const std::string& path) : path_(path) {
    const char* problem = nullptr;
    library_ = loadLibrary(path.c_str(), &problem);
    if (!library_)
        throw std::runtime_error(problem);
    checkVersion(path_, library_);
    for (const char* name :
         {"KhGetNumDocTemplates", "KhGetDocTemplatePtr", "KhGetNumToolbars", "KhCreateToolbar",
          "KhInitToolbar", "KhGetBitmapId", "KhGetEditorString", "KhGetToolbarString"})
        if (!symbolOf(library_, name))
            throw std::runtime_error(path_ + " does not export " + name);
    templateCount_ = symbol<int()>("KhGetNumDocTemplates")();
    toolBarCount_ = symbol<int()>("KhGetNumToolbars")();
}

template <class Function>
Function* PlugIn::symbol(const char* name) const {
    return reinterpret_cast<Function*>(symbolOf(library_, name));
}

CString PlugIn::editorName() const {
    CString name;
    symbol<int(CString*)>("KhGetEditorString")(&name);
    return name;
}

UINT PlugIn::bitmapId() const {
    return symbol<unsigned()>("KhGetBitmapId")();
}

std::vector<std::unique_ptr<CDocTemplate>> PlugIn::makeTemplates() const {
    std::vector<std::unique_ptr<CDocTemplate>> templates;
    for (int index = 0; index < templateCount_; ++index)
        if (CMultiDocTemplate* const made = symbol<CMultiDocTemplate*(int)>("KhGetDocTemplatePtr")(index))
            templates.emplace_back(made);
    return templates;
}

std::unique_ptr<CKhToolBarEx> PlugIn::makeToolBar(CKhMDIFrameWnd& frame, UINT style, UINT id,
                                                  int index) const {
    using Create = CKhToolBarEx*(CKhMDIFrameWnd*, unsigned, unsigned, int);
    return std::unique_ptr<CKhToolBarEx>(symbol<Create>("KhCreateToolbar")(&frame, style, id, index));
}

CString PlugIn::toolBarName(int index) const {
    CString name;
    symbol<int(CString*, int)>("KhGetToolbarString")(&name, index);
    return name;
}

} // namespace kota
