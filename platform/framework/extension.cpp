#include "platform/framework/extension.h"

#include "platform/framework/resources.h"

#include <dlfcn.h>

#include <algorithm>
#include <string>
#include <utility>
#include <vector>

namespace kota {

namespace {

// One load of a library.
struct Load {
    HINSTANCE library;
    const Resources* resources;
};

// There to the very end: libraries free others in their own last moments.
std::vector<Load>& loads() {
    static auto& all = *new std::vector<Load>;
    return all;
}

} // namespace

HINSTANCE loadLibrary(const char* path, const char** problem) {
    static std::string reason;
    const auto library = static_cast<HINSTANCE>(dlopen(path, RTLD_NOW | RTLD_LOCAL));
    if (!library) {
        reason = dlerror();
        if (problem)
            *problem = reason.c_str();
        return nullptr;
    }
    const auto tables = reinterpret_cast<const Resources* (*)()>(symbolOf(library, "KotaResources"));
    loads().push_back({library, tables ? tables() : nullptr});
    return library;
}

HINSTANCE libraryAt(const void* address) {
    Dl_info found{};
    void* const library =
        dladdr(address, &found) != 0 ? dlopen(found.dli_fname, RTLD_NOW | RTLD_NOLOAD) : nullptr;
    if (library)
        dlclose(library); // whoever loaded it holds it
    return static_cast<HINSTANCE>(library);
}

void* symbolOf(HINSTANCE library, const char* name) {
    void* const symbol = library ? dlsym(library, name) : nullptr;
    return symbol && libraryAt(symbol) == library ? symbol : nullptr; // it may be that of a library it needs
}

const Resources* resourcesOf(HINSTANCE library) {
    const auto found = std::ranges::find(loads(), library, &Load::library);
    return found == loads().end() ? nullptr : found->resources;
}

} // namespace kota

namespace {

// The entries, which their libraries do not delete.
struct KnownLibraries {
    std::vector<CDynLinkLibrary*> entries;

    ~KnownLibraries() {
        for (const CDynLinkLibrary* entry : std::exchange(entries, {}))
            delete entry;
    }
};

std::vector<CDynLinkLibrary*>& knownLibraries() {
    static KnownLibraries known;
    return known.entries;
}

} // namespace

BOOL AfxInitExtensionModule(AFX_EXTENSION_MODULE& record, HINSTANCE library) {
    if (std::exchange(record.initialised, true))
        return FALSE;
    record.library = library;
    return TRUE;
}

BOOL FreeLibrary(HINSTANCE library) {
    auto& loads = kota::loads();
    const auto found = std::ranges::find(loads, library, &kota::Load::library);
    if (found == loads.end())
        return FALSE;
    loads.erase(found); // first: what is unloaded may free a library itself
    dlclose(library);
    return TRUE;
}

CDynLinkLibrary::CDynLinkLibrary(AFX_EXTENSION_MODULE& record, BOOL /*isSystem*/) : record_(record) {
    knownLibraries().push_back(this);
}

CDynLinkLibrary::~CDynLinkLibrary() {
    std::erase(knownLibraries(), this);
}

bool CDynLinkLibrary::Knows(const AFX_EXTENSION_MODULE& record) {
    return std::ranges::any_of(knownLibraries(),
                               [&](const CDynLinkLibrary* known) { return &known->record_ == &record; });
}
