#pragma once

#include "platform/language/language.h"
#include "tests/plugin/plug_in.h"

#include <filesystem>

namespace kota::test {

// Has language libraries looked for where that of the second plug-in stands.
inline void findSecondLanguage() {
    static const bool done = [] {
        addLanguageFolder(std::filesystem::path(KOTA_SECOND_LANGUAGE).parent_path().c_str());
        return true;
    }();
    static_cast<void>(done);
}

// The user's language, that of the environment again when the object goes.
class LanguageChoice {
public:
    explicit LanguageChoice(int language) { setLanguage(language); }
    ~LanguageChoice() { setLanguage(0); }
    LanguageChoice(const LanguageChoice&) = delete;
    LanguageChoice& operator=(const LanguageChoice&) = delete;
};

// The second plug-in's library, with its language library.
inline HINSTANCE secondPlugIn() {
    findSecondLanguage();
    static const HINSTANCE library = [] {
        const LanguageChoice english(1033);
        return loadLibrary(KOTA_SECOND);
    }();
    return library;
}

} // namespace kota::test
