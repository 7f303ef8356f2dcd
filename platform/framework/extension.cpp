#include "platform/framework/extension.h"

#include "platform/framework/resources.h"

#include <dlfcn.h>

#include <algorithm>
#include <memory>
#include <string>
#include <utility>
#include <vector>

namespace kota {

class Library {
public:
    explicit Library(void* handle) : handle_(handle) {
        if (const auto tables = reinterpret_cast<const Resources* (*)()>(symbol("KotaResources")))
            resources_ = tables();
    }
    ~Library() { dlclose(handle_); }
    Library(const Library&) = delete;
    Library& operator=(const Library&) = delete;

    void* symbol(const char* name) const { return dlsym(handle_, name); }
    const Resources* resources() const { return resources_; }

private:
    void* handle_;
    const Resources* resources_ = nullptr;
};

namespace {

std::vector<std::unique_ptr<Library>>& loadedLibraries() {
    static std::vector<std::unique_ptr<Library>> libraries;
    return libraries;
}

} // namespace

HINSTANCE loadLibrary(const char* path, const char** problem) {
    static std::string reason;
    void* const handle = dlopen(path, RTLD_NOW | RTLD_LOCAL);
    if (!handle) {
        reason = dlerror();
        if (problem)
            *problem = reason.c_str();
        return nullptr;
    }
    return loadedLibraries().emplace_back(std::make_unique<Library>(handle)).get();
}

void* symbolOf(HINSTANCE library, const char* name) {
    return library ? library->symbol(name) : nullptr;
}

const Resources* resourcesOf(HINSTANCE library) {
    return library ? library->resources() : nullptr;
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
    auto& loaded = kota::loadedLibraries();
    const auto found = std::ranges::find(loaded, library, &std::unique_ptr<kota::Library>::get);
    if (found == loaded.end())
        return FALSE;
    // What is unloaded may free a library itself.
    const std::unique_ptr<kota::Library> freed = std::move(*found);
    loaded.erase(found);
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
