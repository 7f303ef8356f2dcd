#pragma once

#include "platform/framework/extension.h"
#include "platform/framework/template.h"

#include <gtest/gtest.h>

#include <memory>
#include <stdexcept>
#include <string>

namespace kota::test {

// The plug-in's library, as a shell loads it.
inline HINSTANCE plugIn() {
    static const HINSTANCE library = loadLibrary(KOTA_PLUG_IN);
    return library;
}

// What a library, that of the plug-in unless another is named, exports by a name.
template <class Function>
Function& exported(const char* name, HINSTANCE library = plugIn()) {
    void* const symbol = symbolOf(library, name);
    if (!symbol)
        throw std::runtime_error(std::string("not exported: ") + name);
    return *reinterpret_cast<Function*>(symbol);
}

inline std::unique_ptr<CMultiDocTemplate> makeTemplate() {
    return std::unique_ptr<CMultiDocTemplate>(exported<CMultiDocTemplate*(int)>("KhGetDocTemplatePtr")(0));
}

// The module that the plug-in's template finds its resources in.
inline const Module& plugInModule() {
    static const Module& module = makeTemplate()->Module();
    return module;
}

} // namespace kota::test
