#include "hub/shell/menu.h"

#include "hub/project/project_texts.h"
#include "hub/screen/text.h"
#include "platform/framework/messages.h"
#include "platform/language/language.h"

namespace kota::hub {

namespace {

constexpr Accelerator keys[] = {
    {.key = 'N', .command = ID_FILE_NEW, .control = true},
    {.key = 'O', .command = ID_FILE_OPEN, .control = true},
    {.key = 'Q', .command = ID_APP_EXIT, .control = true},
};
constexpr AcceleratorTable keyTable{.id = 1, .keys = keys};

constinit AFX_EXTENSION_MODULE record;

} // namespace

const Module& hubModule() {
    static const Module module("kota_hub", englishTexts(), &record);
    return module;
}

void loadLanguage() {
    loadPlatformTexts();
    loadProjectTexts();
    KhLangLoadResDll("kota_hub", &record.resources, 0);
}

const MenuTemplate& hubMenu() {
    return *hubModule().menu(englishTexts().menus.front().id);
}
const AcceleratorTable& hubKeys() {
    return keyTable;
}

QString hubText(HubText id) {
    return toQt(hubModule().string(idOf(id)));
}

} // namespace kota::hub
