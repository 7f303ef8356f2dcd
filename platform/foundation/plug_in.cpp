#include "platform/foundation/plug_in.h"

#include "platform/foundation/frames.h"
#include "platform/framework/platform_texts.h"
#include "platform/framework/template.h"

#include <stdexcept>

namespace kota {

namespace {

template <class... Arguments>
[[noreturn]] void refuse(PlatformText reason, const Arguments... arguments) {
    throw std::runtime_error(static_cast<const char*>(platformText(reason, arguments...)));
}

void checkVersion(const std::string& path, HINSTANCE library) {
    const auto version = reinterpret_cast<int (*)()>(symbolOf(library, "_ZN4kota16plugInAbiVersionEv"));
    if (!version)
        refuse(PlatformText::NotAPlugIn, path.c_str());
    if (const int built = version(); built != abiVersion)
        refuse(PlatformText::BuiltForOther, path.c_str(), built, abiVersion);
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
            refuse(PlatformText::DoesNotExport, path_.c_str(), name);
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
