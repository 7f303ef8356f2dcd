#include "platform/framework/module.h"

#include <algorithm>

namespace kota {

Module::Module(const char* name, std::span<const StringResource> strings) : name_(name), strings_(strings) {}

const char* Module::name() const {
    return name_;
}

CString Module::string(UINT id) const {
    const auto row = std::ranges::find(strings_, id, &StringResource::id);
    return row == strings_.end() ? CString() : CString(row->text);
}

const Module& platformModule() {
    static const Module module("kota_platform", {});
    return module;
}

} // namespace kota
