#include "tests/plugin/attach/watched_records.h"

#include <dlfcn.h>

#include <utility>

namespace {

AFX_EXTENSION_MODULE* last = nullptr;
void (*actBefore)() = nullptr;

} // namespace

AFX_EXTENSION_MODULE* kota::test::lastInitialised() {
    return last;
}
void kota::test::forgetInitialised() {
    last = nullptr;
}

void kota::test::beforeInitialising(void (*act)()) {
    actBefore = act;
}

// Stands before the platform's, for all libraries that are loaded later: notes the record and hands it on.
BOOL AfxInitExtensionModule(AFX_EXTENSION_MODULE& record, HINSTANCE library) {
    using Platforms = BOOL(AFX_EXTENSION_MODULE&, HINSTANCE);
    void* const platforms =
        dlsym(RTLD_NEXT, "_Z22AfxInitExtensionModuleR20AFX_EXTENSION_MODULEPN4kota7LibraryE");
    last = &record;
    if (const auto act = std::exchange(actBefore, nullptr))
        act();
    return platforms ? reinterpret_cast<Platforms*>(platforms)(record, library) : FALSE;
}
