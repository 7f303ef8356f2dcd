#pragma once

#include "platform/framework/export.h"
#include "platform/framework/extension.h"
#include "platform/framework/text.h"
#include "platform/framework/types.h"

// A font as a screen picks it.
struct LOGFONT {
    CString face;   // empty: the screen's own
    int points = 0; // 0: the screen's own
};

// The fonts of what surrounds a window's contents.
struct NONCLIENTMETRICS {
    LOGFONT message;
};

inline constexpr UINT SPI_GETNONCLIENTMETRICS = 41;

// Fills in what `action` asks for, the one above alone: the screen's own fonts. 0 for any other.
KOTA_API BOOL SystemParametersInfo(UINT action, NONCLIENTMETRICS& metrics);

// The language of the user's texts: 1033 English, 1041 Japanese. That of the environment, unless the shell
// set another one before the libraries were loaded; languages that there are no texts for count as English.
KOTA_API int KhLangGetLanguage();
namespace kota {
// Sets the language of the libraries that are loaded from now on; 0 for that of the environment.
KOTA_API void setLanguage(int language);
// A further folder where language libraries are looked for, behind that of the platform itself. Once is
// enough.
KOTA_API void addLanguageFolder(const char* folder);
// Has the platform speak the user's language from now on. The shell calls it once it has set the language.
KOTA_API void loadPlatformTexts();
} // namespace kota

// Loads the language library of an extension library, libBASE_LANGUAGE.so, and stores its handle in
// `resources`. The same handle is the result, for FreeLibrary; null, and `resources` as it was, when there is
// none. `flags` is 0.
KOTA_API HINSTANCE KhLangLoadResDll(const char* base, HINSTANCE* resources, int flags);

// The font for texts of the user's language: the message font of `metrics`, or in its place one that the
// screen has for that language.
KOTA_API void KhLangGetUserFont(const NONCLIENTMETRICS& metrics, LOGFONT* font);
