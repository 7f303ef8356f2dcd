#include "platform/framework/module.h"

#include <algorithm>

namespace kota {

namespace {

template <class Resource>
const Resource* findIn(std::span<const Resource> table, UINT id) {
    const auto found = std::ranges::find(table, id, &Resource::id);
    return found == table.end() ? nullptr : &*found;
}

} // namespace

Module::Module(const char* name, const Resources& resources, const AFX_EXTENSION_MODULE* record)
    : name_(name), resources_(resources), record_(record) {}

template <class Resource>
const Resource* Module::find(std::span<const Resource> Resources::*table, UINT id) const {
    const Resources* const translated = record_ ? resourcesOf(record_->resources) : nullptr;
    const Resource* const found = translated ? findIn(translated->*table, id) : nullptr;
    return found ? found : findIn(resources_.*table, id);
}

const char* Module::name() const {
    return name_;
}

CString Module::string(UINT id) const {
    const StringResource* const row = find(&Resources::strings, id);
    return row ? CString(row->text) : CString();
}

const DialogTemplate* Module::dialog(UINT id) const {
    return find(&Resources::dialogs, id);
}
const MenuTemplate* Module::menu(UINT id) const {
    return find(&Resources::menus, id);
}
const ToolBarTemplate* Module::toolBar(UINT id) const {
    return find(&Resources::toolBars, id);
}
const BitmapResource* Module::bitmap(UINT id) const {
    return find(&Resources::bitmaps, id);
}
const BitmapResource* Module::icon(UINT id) const {
    return find(&Resources::icons, id);
}

} // namespace kota
