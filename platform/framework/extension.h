#pragma once

#include "platform/framework/export.h"
#include "platform/framework/types.h"

namespace kota {
class Library; // what it is, the system's loader alone knows
struct Resources;
} // namespace kota

// A library in the process: the same value to all who load it.
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
// Gives back what kota::loadLibrary or KhLangLoadResDll gave, once for each time. 0 for null and for a
// library that is not loaded, or was given back as often.
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

// The version of what shell and plug-ins have in common: the exports by which they meet, and the size, the
// layout and the virtual functions of the classes that pass between them. Any change of these raises it.
inline constexpr int abiVersion = 1;
// The version that a plug-in was built with. Each plug-in defines it, to give abiVersion; see PlugIn. A
// function, since variables of one name in two libraries would count as one.
KOTA_EXPORT int plugInAbiVersion();

// Loads a library by its file. Null when that failed; then `problem`, unless null, points to the reason,
// until the next call.
KOTA_API HINSTANCE loadLibrary(const char* path, const char** problem = nullptr);
// The library that an address lies in; null for none.
KOTA_API HINSTANCE libraryAt(const void* address);
// The address of what a library itself exports by that name; null when it does not.
KOTA_API void* symbolOf(HINSTANCE library, const char* name);
// The tables that a language library exports as `KotaResources`, a function without arguments; null for
// null and for a library that has none.
KOTA_API const Resources* resourcesOf(HINSTANCE library);

} // namespace kota
