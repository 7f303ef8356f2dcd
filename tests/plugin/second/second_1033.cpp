#include "platform/framework/resources.h"
#include "tests/plugin/second/ids.h"

namespace {

// The name of the tool bar and the document's names are left to the module.
constexpr kota::StringResource strings[] = {
    {Second::EditorName, "Translated name"},
    {Second::Command, "Translated prompt.\nTranslated tip"},
};

constexpr kota::MenuItemTemplate items[] = {{Second::Command, "&Translated command"}};
constexpr kota::MenuPopupTemplate popups[] = {{"&File", items}, {"&Translated", items}};
constexpr kota::MenuTemplate menus[] = {{.id = Second::Document, .popups = popups}};

constexpr kota::Resources resources{.strings = strings, .menus = menus};

} // namespace

extern "C" KOTA_EXPORT const kota::Resources* KotaResources();

const kota::Resources* KotaResources() {
    return &resources;
}
