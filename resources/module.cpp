#include "resources/module.h"

#include "resources/strings.h"

const kota::Module& kota0AdModule() {
    static const kota::Module module("Kota0_ad", {.strings = englishStrings()});
    return module;
}
