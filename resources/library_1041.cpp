#include "resources/texts.h"

// What the language library shows of itself; see kota::resourcesOf.
extern "C" KOTA_EXPORT const kota::Resources* KotaResources() {
    static const kota::Resources texts{
        .strings = japaneseStrings(), .dialogs = japaneseDialogs(), .menus = japaneseMenus()};
    return &texts;
}
