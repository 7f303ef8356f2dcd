#include "platform/framework/platform_texts.h"
#include "resources/ids.h"
#include "tests/support/translation.h"

using namespace kota::test;

namespace {

// That two trees are the same but for their captions, and that these are translated.
void expectSameTree(std::span<const kota::DialogItem> items, std::span<const kota::DialogItem> originals) {
    static const std::vector<std::string> same = {"", "<", "=", ">", "OK"};
    ASSERT_EQ(items.size(), originals.size());
    for (std::size_t i = 0; i < items.size(); ++i) {
        const std::string original = originals[i].caption;
        SCOPED_TRACE(original);
        EXPECT_EQ(items[i].kind, originals[i].kind);
        EXPECT_EQ(items[i].id, originals[i].id);
        EXPECT_EQ(items[i].startsGroup, originals[i].startsGroup);
        if (std::ranges::find(same, original) != same.end())
            EXPECT_EQ(items[i].caption, original);
        else
            EXPECT_TRUE(isTranslated(items[i].caption)) << items[i].caption;
        expectSameTree(items[i].items, originals[i].items);
    }
}

TEST(JapaneseTexts, StandForEachStringOfTheEditor) {
    const LoadedTexts english(KOTA_AD_1033);
    const LoadedTexts japanese(KOTA_AD_1041);

    expectTranslated(*japanese, *english,
                     {StringId::SheetCaption, StringId::ApplicationTitle, StringId::ProbeRiver});
}

TEST(JapaneseTexts, LeaveTheTemplatesOwnPartsAsTheyAre) {
    const LoadedTexts english(KOTA_AD_1033);
    const LoadedTexts japanese(KOTA_AD_1041);
    const auto parts = [](const LoadedTexts& texts) {
        const std::string text = stringsOf(*texts).at(StringId::DocTemplate);
        std::vector<std::string> all(1);
        for (const char c : text)
            if (c == '\n')
                all.emplace_back();
            else
                all.back() += c;
        return all;
    };
    const auto original = parts(english);
    const auto translated = parts(japanese);

    ASSERT_EQ(original.size(), 7U);
    ASSERT_EQ(translated.size(), 7U);
    for (const std::size_t part : {0U, 1U, 4U, 5U, 6U})
        EXPECT_EQ(translated[part], original[part]);
    for (const std::size_t part : {2U, 3U})
        EXPECT_TRUE(isTranslated(translated[part])) << translated[part];
    EXPECT_THAT(translated[3], testing::EndsWith("(*.ad31)"));
}

TEST(JapaneseTexts, KeepTheNumberOfAListsEntries) {
    const LoadedTexts japanese(KOTA_AD_1041);

    const auto texts = stringsOf(*japanese);

    EXPECT_EQ(std::ranges::count(texts.at(StringId::ConcentrationUnits), '\n'), 10);
    EXPECT_EQ(std::ranges::count(texts.at(StringId::ComponentKinds), '\n'), 2);
    EXPECT_THAT(texts.at(StringId::UndefinedChoice), testing::EndsWith("\r\n"));
    EXPECT_THAT(texts.at(StringId::ToolbarName), testing::StartsWith(" "));
}

TEST(JapaneseTexts, StandInEachDialog) {
    const LoadedTexts english(KOTA_AD_1033);
    const LoadedTexts japanese(KOTA_AD_1041);

    ASSERT_EQ(japanese->dialogs.size(), english->dialogs.size());
    for (std::size_t i = 0; i < english->dialogs.size(); ++i) {
        const kota::DialogTemplate& original = english->dialogs[i];
        const kota::DialogTemplate& translated = japanese->dialogs[i];
        EXPECT_EQ(translated.id, original.id);
        EXPECT_EQ(isTranslated(translated.caption), original.id != DialogId::Form) << original.caption;
        expectSameTree(translated.items, original.items);
    }
}

TEST(JapaneseTexts, StandInTheMenu) {
    const LoadedTexts english(KOTA_AD_1033);
    const LoadedTexts japanese(KOTA_AD_1041);

    expectMenusTranslated(*japanese, *english);
}

TEST(JapaneseTexts, StandForEachTextOfThePlatform) {
    const LoadedTexts japanese(KOTA_PLATFORM_1041);

    std::vector<kota::StringResource> english;
    std::vector<CString> texts; // which the rows point to
    texts.reserve(static_cast<std::size_t>(kota::PlatformText::Count));
    for (UINT id = 1; id < static_cast<UINT>(kota::PlatformText::Count); ++id) {
        texts.push_back(kota::platformModule().string(id));
        english.push_back({id, texts.back()});
    }
    expectTranslated(*japanese, {.strings = english});
}

} // namespace
