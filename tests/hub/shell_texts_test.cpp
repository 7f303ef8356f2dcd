#include "hub/project/project_texts.h"
#include "hub/shell/texts.h"
#include "tests/support/translation.h"

using namespace kota::test;

namespace {

TEST(TheShellsJapaneseTexts, StandForEachString) {
    const LoadedTexts japanese(KOTA_HUB_1041);

    expectTranslated(*japanese, kota::hub::englishTexts());
}

TEST(TheShellsJapaneseTexts, StandForEachStringOfAProject) {
    const LoadedTexts japanese(KOTA_PROJECT_1041);

    using kota::hub::ProjectText;
    std::vector<UINT> same;
    for (const ProjectText text : {ProjectText::Within, ProjectText::Place, ProjectText::Metres})
        same.push_back(idOf(text));
    expectTranslated(*japanese, kota::hub::englishProjectTexts(), same);
}

TEST(TheShellsJapaneseTexts, StandInTheMenu) {
    const LoadedTexts japanese(KOTA_HUB_1041);

    expectMenusTranslated(*japanese, kota::hub::englishTexts());
}

} // namespace
