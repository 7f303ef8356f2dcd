#include "platform/foundation/plug_in.h"

#include "platform/foundation/frames.h"
#include "platform/framework/template.h"

#include <stdexcept>

namespace kota {

PlugIn::PlugIn(const std::string& path) : path_(path) {
    const char* problem = nullptr;
    library_ = loadLibrary(path.c_str(), &problem);
    if (!library_)
        throw std::runtime_error(problem);
    for (const char* name :
         {"KhGetNumDocTemplates", "KhGetDocTemplatePtr", "KhGetNumToolbars", "KhCreateToolbar",
          "KhInitToolbar", "KhGetBitmapId", "KhGetEditorString", "KhGetToolbarString"})
        if (!symbolOf(library_, name))
            throw std::runtime_error(path_ + " does not export " + name);
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
    const int count = symbol<int()>("KhGetNumDocTemplates")();
    std::vector<std::unique_ptr<CDocTemplate>> templates;
    for (int index = 0; index < count; ++index)
        if (CMultiDocTemplate* const made = symbol<CMultiDocTemplate*(int)>("KhGetDocTemplatePtr")(index))
            templates.emplace_back(made);
    return templates;
}

int PlugIn::toolBarCount() const {
    return symbol<int()>("KhGetNumToolbars")();
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
