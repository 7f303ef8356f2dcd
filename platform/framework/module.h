#pragma once

#include "platform/framework/export.h"
#include "platform/framework/extension.h"
#include "platform/framework/resources.h"
#include "platform/framework/text.h"

namespace kota {

// The identity of a library and the way to its resources. Each library has one module, a constant of its
// own; run-time classes carry its address, and a resource id is looked up in the module that it came from,
// so that two libraries with the same ids or class names do not meet. What the language library of the
// module's record holds goes before the module's own tables.
class KOTA_API Module {
public:
    // `name`, the tables of `resources` and `record` must outlive the module.
    Module(const char* name, const Resources& resources, const AFX_EXTENSION_MODULE* record = nullptr);
    Module(const Module&) = delete;
    Module& operator=(const Module&) = delete;

    const char* name() const;
    // The text of a string id, empty when the module has none.
    CString string(UINT id) const;
    // The resource of a number; null when the module has none.
    const DialogTemplate* dialog(UINT id) const;
    const MenuTemplate* menu(UINT id) const;
    const ToolBarTemplate* toolBar(UINT id) const;
    const BitmapResource* bitmap(UINT id) const;
    const BitmapResource* icon(UINT id) const;
    // All tables of keys that the module has.
    std::span<const AcceleratorTable> accelerators() const { return resources_.accelerators; }

private:
    template <class Resource>
    const Resource* find(std::span<const Resource> Resources::*table, UINT id) const;

    const char* name_;
    Resources resources_;
    const AFX_EXTENSION_MODULE* record_;
};

// The platform's own module.
KOTA_API const Module& platformModule();

} // namespace kota
