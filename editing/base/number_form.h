#pragma once

#include <string_view>

// Whether a text is a number as cells and edits take it: an optional sign; digits; optionally a point with at
// least one digit behind it; optionally "E" or "e", a sign or none, and digits. In front of the exponent
// there must be a digit. No blanks, and nothing else.
bool isNumberText(std::string_view text);
