#pragma once

#include <array>
#include <string>
#include <string_view>

// The letters of the text form, shared by its reader and its writer.
namespace kota::kvs {

inline constexpr std::string_view targetWord = "target";
inline constexpr std::string_view sectionWord = "section";
inline constexpr std::string_view byteOrderMark = "\xEF\xBB\xBF";

// Braces may stand this deep in each other, a target's included.
inline constexpr int deepestNesting = 64;

constexpr bool isNameStart(char c) {
    return (c >= 'A' && c <= 'Z') || (c >= 'a' && c <= 'z') || c == '_';
}
constexpr bool isDigit(char c) {
    return c >= '0' && c <= '9';
}
constexpr bool isNameCharacter(char c) {
    return isNameStart(c) || isDigit(c) || c == '.' || c == '-';
}

inline constexpr auto nameCharacters = [] {
    std::array<bool, 256> table{};
    for (int c = 0; c < 256; ++c)
        table[c] = isNameCharacter(static_cast<char>(c));
    return table;
}();

// Whether a name may stand without quotes.
constexpr bool isPlainName(std::string_view name) {
    if (name.empty() || !isNameStart(name.front()))
        return false;
    for (const char c : name)
        if (!nameCharacters[static_cast<unsigned char>(c)])
            return false;
    return true;
}

// Whether two names are the same. They are short, and mostly the same: no call is worth it.
constexpr bool sameName(std::string_view left, std::string_view right) {
    if (left.size() != right.size())
        return false;
    for (std::size_t i = 0; i < left.size(); ++i)
        if (left[i] != right[i])
            return false;
    return true;
}

constexpr bool isControl(char c) {
    return (c >= 0 && c < ' ') || c == '\x7F';
}

// A byte as the escape that a string has for it: \xHH.
std::string hexEscape(char byte);

// The length of the UTF-8 character at the front of `text`, or 0 when none stands there: an incomplete or
// overlong sequence, a surrogate, a number beyond Unicode, or no text.
int utf8Length(std::string_view text);

} // namespace kota::kvs
