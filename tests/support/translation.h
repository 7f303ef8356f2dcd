#pragma once

#include "platform/framework/module.h"

#include <gmock/gmock.h>

#include <algorithm>
#include <cctype>
#include <map>
#include <regex>
#include <string>
#include <vector>

namespace kota::test {

// The tables of a language library, which is held for as long as the object lives.
class LoadedTexts {
public:
    explicit LoadedTexts(const char* path) : library_(loadLibrary(path)) {}
    ~LoadedTexts() { FreeLibrary(library_); }
    LoadedTexts(const LoadedTexts&) = delete;
    LoadedTexts& operator=(const LoadedTexts&) = delete;

    const Resources* operator->() const { return resourcesOf(library_); }
    const Resources& operator*() const { return *resourcesOf(library_); }

private:
    HINSTANCE library_;
};

// What of a text is the same in every language: its placeholders in their order, how many lines it has, and
// the access key and the shortcut of a menu's entry.
inline std::vector<std::string> frameOf(const std::string& text) {
    static const std::regex parts("%(?:[0-9]|z?[dsu])|\n|\t.*|&[A-Za-z]", std::regex::optimize);
    std::vector<std::string> frame;
    for (std::sregex_iterator at(text.begin(), text.end(), parts); at != std::sregex_iterator(); ++at)
        frame.push_back(at->str());
    for (std::string& part : frame) // an access key has no case
        if (part[0] == '&')
            part[1] = static_cast<char>(std::toupper(static_cast<unsigned char>(part[1])));
    return frame;
}

// Whether any letter stands in it that is not English.
inline bool isTranslated(const std::string& text) {
    return std::ranges::any_of(text, [](char c) { return static_cast<unsigned char>(c) >= 0x80; });
}

inline std::map<UINT, std::string> stringsOf(const Resources& resources) {
    std::map<UINT, std::string> all;
    for (const StringResource& row : resources.strings)
        all.emplace(row.id, row.text);
    return all;
}

// That the same ids stand in both tables, each once, with the same frame, and that all texts but those of
// `same` are translated.
inline void expectTranslated(const Resources& translated, const Resources& english,
                             const std::vector<UINT>& same = {}) {
    const auto originals = stringsOf(english);
    const auto texts = stringsOf(translated);
    EXPECT_EQ(originals.size(), english.strings.size()) << "no id stands twice";
    EXPECT_EQ(texts.size(), translated.strings.size()) << "no id stands twice";
    EXPECT_EQ(texts.size(), originals.size());
    for (const auto& [id, original] : originals) {
        SCOPED_TRACE(original);
        const auto found = texts.find(id);
        if (found == texts.end()) {
            ADD_FAILURE() << "there is no translation of " << id;
            continue;
        }
        EXPECT_EQ(frameOf(found->second), frameOf(original)) << found->second;
        if (std::ranges::find(same, id) != same.end())
            EXPECT_EQ(found->second, original);
        else
            EXPECT_TRUE(isTranslated(found->second)) << found->second;
    }
}

// The same for the menus, entry by entry.
inline void expectMenusTranslated(const Resources& translated, const Resources& english) {
    ASSERT_EQ(translated.menus.size(), english.menus.size());
    for (std::size_t menu = 0; menu < english.menus.size(); ++menu) {
        EXPECT_EQ(translated.menus[menu].id, english.menus[menu].id);
        ASSERT_EQ(translated.menus[menu].popups.size(), english.menus[menu].popups.size());
        for (std::size_t place = 0; place < english.menus[menu].popups.size(); ++place) {
            const MenuPopupTemplate& popup = translated.menus[menu].popups[place];
            const MenuPopupTemplate& original = english.menus[menu].popups[place];
            EXPECT_TRUE(isTranslated(popup.text)) << popup.text;
            ASSERT_EQ(popup.items.size(), original.items.size()) << original.text;
            for (std::size_t i = 0; i < popup.items.size(); ++i) {
                EXPECT_EQ(popup.items[i].id, original.items[i].id);
                EXPECT_EQ(popup.items[i].greyed, original.items[i].greyed);
                const std::string text = popup.items[i].text;
                EXPECT_EQ(frameOf(text), frameOf(original.items[i].text)) << text;
                EXPECT_EQ(isTranslated(text), !std::string(original.items[i].text).empty()) << text;
            }
        }
    }
}

} // namespace kota::test
