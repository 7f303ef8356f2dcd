#pragma once

#include "platform/framework/export.h"
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

// The font that shows texts of the user's language: the message font of `metrics`.
KOTA_API void KhLangGetUserFont(const NONCLIENTMETRICS& metrics, LOGFONT* font);
