#include "resources/module.h"

#include "resources/bitmaps.h"
#include "resources/texts.h"
#include "resources/tool_bar.h"

constinit AFX_EXTENSION_MODULE kota0AdRecord;

const kota::Module& kota0AdModule() {
    static const kota::Module module("Kota0_ad",
                                     {.strings = englishStrings(),
                                      .dialogs = englishDialogs(),
                                      .menus = englishMenus(),
                                      .accelerators = acceleratorTables(),
                                      .toolBars = toolBars(),
                                      .bitmaps = bitmaps(),
                                      .icons = icons()},
                                     &kota0AdRecord);
    return module;
}
