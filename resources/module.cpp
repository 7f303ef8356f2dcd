#include "resources/module.h"

#include "resources/dialogs.h"
#include "resources/strings.h"

const kota::Module& kota0AdModule() {
    static const kota::Module module("Kota0_ad", {.strings = englishStrings(), .dialogs = englishDialogs()});
    return module;
}
