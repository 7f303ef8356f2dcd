#pragma once

#include "platform/framework/window.h"

inline constexpr UINT MB_OK = 0;
inline constexpr UINT MB_YESNOCANCEL = 3;
inline constexpr UINT MB_YESNO = 4;

inline constexpr int IDOK = 1;
inline constexpr int IDCANCEL = 2;
inline constexpr int IDYES = 6;
inline constexpr int IDNO = 7;

// Shows a text in a modal box on the attached screen and gives the button pressed. A null `owner` is none,
// a null `caption` the screen's default. Where no screen is attached the text goes to the standard error
// stream and the result is 0.
KOTA_API int MessageBox(HWND owner, const char* text, const char* caption, UINT type);

namespace kota {
// How many boxes were shown so far.
KOTA_API unsigned boxesShown();
} // namespace kota

// The same, owned by the application's main window, with the default caption.
KOTA_API int AfxMessageBox(const char* text, UINT type = MB_OK);
