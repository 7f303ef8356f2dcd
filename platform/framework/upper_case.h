#pragma once

#include "platform/framework/text.h"

namespace kota {

// The text in upper case: Latin with its accents, Greek and Cyrillic letters, each by one letter; bytes that
// are not UTF-8 and all other characters stay as they are.
KOTA_API CString upperCase(const CString& text);

} // namespace kota
