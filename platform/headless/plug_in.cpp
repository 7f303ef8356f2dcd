#include "platform/headless/plug_in.h"

#include "platform/framework/template.h"

#include <dlfcn.h>
#include <stdexcept>

namespace kota::headless {

PlugIn::PlugIn(const std::string& path)
    : path_(path), library_(dlopen(path.empty() ? nullptr : path.c_str(), RTLD_NOW | RTLD_LOCAL)) {
    if (!library_)
        throw std::runtime_error(dlerror());
}

void* PlugIn::symbol(const char* name) const {
    void* const address = dlsym(library_, name);
    if (!address)
        throw std::runtime_error(path_ + " does not export " + name);
    return address;
}

std::vector<std::unique_ptr<CDocTemplate>> PlugIn::makeTemplates() const {
    const auto count = reinterpret_cast<int (*)()>(symbol("KhGetNumDocTemplates"));
    const auto make = reinterpret_cast<CMultiDocTemplate* (*)(int)>(symbol("KhGetDocTemplatePtr"));
    std::vector<std::unique_ptr<CDocTemplate>> templates;
    for (int index = 0; index < count(); ++index)
        if (CMultiDocTemplate* const made = make(index))
            templates.emplace_back(made);
    return templates;
}

} // namespace kota::headless
