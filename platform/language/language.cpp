#include "platform/language/language.h"

#include "platform/framework/platform_texts.h"
#include "platform/framework/screen.h"

#include <dlfcn.h>

#include <algorithm>
#include <cstdlib>
#include <filesystem>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

namespace {

constexpr int english = 1033;
constexpr int japanese = 1041;

int& chosenLanguage() {
    static int language = 0; // 0 for none
    return language;
}

int languageOfEnvironment() {
    for (const char* name : {"LC_ALL", "LC_MESSAGES", "LANG"})
        if (const char* const locale = std::getenv(name); locale && *locale != '\0')
            return std::string_view(locale).starts_with("ja") ? japanese : english;
    return english;
}

// Where the platform's own library stands.
std::filesystem::path platformFolder() {
    Dl_info here{};
    return dladdr(reinterpret_cast<void*>(&KhLangGetLanguage), &here) != 0
               ? std::filesystem::path(here.dli_fname).parent_path()
               : std::filesystem::path();
}

std::vector<std::filesystem::path>& folders() {
    static std::vector<std::filesystem::path> all{platformFolder()};
    return all;
}

} // namespace

int KhLangGetLanguage() {
    return chosenLanguage() != 0 ? chosenLanguage() : languageOfEnvironment();
}

void kota::setLanguage(int language) {
    chosenLanguage() = language;
}
void kota::addLanguageFolder(const char* folder) {
    if (std::ranges::find(folders(), folder) == folders().end())
        folders().emplace_back(folder);
}

void kota::loadPlatformTexts() {
    AFX_EXTENSION_MODULE& record = platformRecord();
    FreeLibrary(std::exchange(record.resources, nullptr));
    KhLangLoadResDll("kota_platform", &record.resources, 0);
}

HINSTANCE KhLangLoadResDll(const char* base, HINSTANCE* resources, int /*flags*/) {
    const std::string name = std::string("lib") + base + "_" + std::to_string(KhLangGetLanguage()) + ".so";
    for (const std::filesystem::path& folder : folders()) {
        std::error_code missing;
        if (!std::filesystem::exists(folder / name, missing))
            continue;
        if (const HINSTANCE library = kota::loadLibrary((folder / name).c_str())) {
            *resources = library;
            return library;
        }
    }
    return nullptr;
}

BOOL SystemParametersInfo(UINT action, NONCLIENTMETRICS& metrics) {
    if (action != SPI_GETNONCLIENTMETRICS)
        return FALSE;
    metrics = NONCLIENTMETRICS();
    return TRUE;
}

void KhLangGetUserFont(const NONCLIENTMETRICS& metrics, LOGFONT* font) {
    *font = metrics.message;
    const kota::Screen* const screen = kota::attachedScreen();
    if (const CString face = screen ? screen->fontFor(KhLangGetLanguage()) : CString(); !face.IsEmpty())
        font->face = face;
}
