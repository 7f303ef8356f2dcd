#include "tests/plugin/attach/watched_records.h"

#include <dlfcn.h>

namespace {

AFX_EXTENSION_MODULE* last = nullptr;

} // namespace

AFX_EXTENSION_MODULE* kota::test::lastInitialised() {
    return last;
}
void kota::test::forgetInitialised() {
    last = nullptr;
}

// Stands before the platform's, for all libraries that are loaded later: notes the record and hands it on.
BOOL AfxInitExtensionModule(AFX_EXTENSION_MODULE& record, HINSTANCE library) {
    using Platforms = BOOL(AFX_EXTENSION_MODULE&, HINSTANCE);
    void* const platforms =
        dlsym(RTLD_NEXT, "_Z22AfxInitExtensionModuleR20AFX_EXTENSION_MODULEPN4kota7LibraryE");
    last = &record;
    return platforms ? reinterpret_cast<Platforms*>(platforms)(record, library) : FALSE;
}
