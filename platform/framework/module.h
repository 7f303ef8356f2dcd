#pragma once

#include "platform/framework/dialog_template.h"
#include "platform/framework/export.h"
#include "platform/framework/text.h"
#include "platform/framework/types.h"

#include <span>

namespace kota {

// One row of a string table.
struct StringResource {
    UINT id;
    const char* text;
};

// What a module brings along, as tables that must outlive it.
struct Resources {
    std::span<const StringResource> strings = {};
    std::span<const DialogTemplate> dialogs = {};
};

// The identity of a library and the way to its resources. Each library has one module, a constant of its
// own; run-time classes carry its address, and a resource id is looked up in the module that it came from,
// so that two libraries with the same ids or class names do not meet.
class KOTA_API Module {
public:
    // `name` must outlive the module.
    Module(const char* name, const Resources& resources);
    Module(const Module&) = delete;
    Module& operator=(const Module&) = delete;

    const char* name() const;
    // The text of a string id, empty when the module has none.
    CString string(UINT id) const;
    // The dialog of a number, null when the module has none.
    const DialogTemplate* dialog(UINT id) const;

private:
    const char* name_;
    Resources resources_;
};

// The platform's own module.
KOTA_API const Module& platformModule();

} // namespace kota
