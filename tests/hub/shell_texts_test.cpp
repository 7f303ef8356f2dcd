#include "hub/shell/texts.h"
#include "tests/support/translation.h"

using namespace kota::test;

namespace {

TEST(TheShellsJapaneseTexts, StandForEachString) {
    const LoadedTexts japanese(KOTA_HUB_1041);

    expectTranslated(*japanese, kota::hub::englishTexts());
}

TEST(TheShellsJapaneseTexts, StandInTheMenu) {
    const LoadedTexts japanese(KOTA_HUB_1041);

    expectMenusTranslated(*japanese, kota::hub::englishTexts());
}

} // namespace
