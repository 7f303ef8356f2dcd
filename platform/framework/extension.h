#pragma once

#include "platform/framework/export.h"
#include "platform/framework/types.h"

namespace kota {
class Library;
struct Resources;
} // namespace kota

// A library that is loaded.
using HINSTANCE = kota::Library*;

// What the framework keeps of an extension library, one constant-initialised record for each. Its module
// (kota::Module) finds the language library's resources through it.
struct AFX_EXTENSION_MODULE {
    HINSTANCE library = nullptr;   // the extension library itself
    HINSTANCE resources = nullptr; // the library of its texts; null for none
    bool initialised = false;
};

// Fills in a record when its library is attached. 0 when that was done before.
KOTA_API BOOL AfxInitExtensionModule(AFX_EXTENSION_MODULE& record, HINSTANCE library);
// Gives back what LoadLibrary or KhLangLoadResDll gave. Null and a handle given back before are 0.
KOTA_API BOOL FreeLibrary(HINSTANCE library);

// The framework's entry of an extension library, made with `new` when the library is attached; the framework
// keeps it. For as long as it lives, its library counts among the known ones.
class KOTA_API CDynLinkLibrary {
public:
    explicit CDynLinkLibrary(AFX_EXTENSION_MODULE& record, BOOL isSystem = FALSE);
    ~CDynLinkLibrary();
    CDynLinkLibrary(const CDynLinkLibrary&) = delete;
    CDynLinkLibrary& operator=(const CDynLinkLibrary&) = delete;

    // Whether the record's library counts among the known ones.
    static bool Knows(const AFX_EXTENSION_MODULE& record);

private:
    AFX_EXTENSION_MODULE& record_;
};

namespace kota {

// Loads a library by its file. Null when that failed; then `problem`, unless null, points to the reason,
// until the next call.
KOTA_API HINSTANCE loadLibrary(const char* path, const char** problem = nullptr);
// The address of what a library exports by that name; null when it does not.
KOTA_API void* symbolOf(HINSTANCE library, const char* name);
// The tables that a language library exports as `KotaResources`, a function without arguments; null for
// null and for a library that has none.
KOTA_API const Resources* resourcesOf(HINSTANCE library);

} // namespace kota
