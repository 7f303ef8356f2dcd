#include "platform/framework/module.h"

#include <algorithm>

namespace kota {

Module::Module(const char* name, const Resources& resources) : name_(name), resources_(resources) {}

const char* Module::name() const {
    return name_;
}

CString Module::string(UINT id) const {
    const auto row = std::ranges::find(resources_.strings, id, &StringResource::id);
    return row == resources_.strings.end() ? CString() : CString(row->text);
}

const DialogTemplate* Module::dialog(UINT id) const {
    const auto found = std::ranges::find(resources_.dialogs, id, &DialogTemplate::id);
    return found == resources_.dialogs.end() ? nullptr : &*found;
}

const Module& platformModule() {
    static const Module module("kota_platform", Resources{});
    return module;
}

} // namespace kota
