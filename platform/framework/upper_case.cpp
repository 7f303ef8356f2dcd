#include "platform/framework/upper_case.h"

#include <algorithm>
#include <iterator>
#include <string>

namespace kota {

namespace {

// Letters first to last, each `step` apart, whose capitals stand `offset` away.
struct LetterRange {
    char32_t first;
    char32_t last;
    int step;
    int offset;
};

// From the Unicode character database (UnicodeData.txt, simple upper-case mappings).
constexpr LetterRange ranges[] = {
    {U'a', U'z', 1, -32},     {0x00B5, 0x00B5, 1, 743}, {0x00E0, 0x00F6, 1, -32},  {0x00F8, 0x00FE, 1, -32},
    {0x00FF, 0x00FF, 1, 121}, {0x0101, 0x012F, 2, -1},  {0x0131, 0x0131, 1, -232}, {0x0133, 0x0137, 2, -1},
    {0x013A, 0x0148, 2, -1},  {0x014B, 0x0177, 2, -1},  {0x017A, 0x017E, 2, -1},   {0x017F, 0x017F, 1, -300},
    {0x01CE, 0x01DC, 2, -1},  {0x01F5, 0x01F5, 1, -1},  {0x01F9, 0x021F, 2, -1},   {0x0223, 0x0233, 2, -1},
    {0x03AC, 0x03AC, 1, -38}, {0x03AD, 0x03AF, 1, -37}, {0x03B1, 0x03C1, 1, -32},  {0x03C2, 0x03C2, 1, -31},
    {0x03C3, 0x03CB, 1, -32}, {0x03CC, 0x03CC, 1, -64}, {0x03CD, 0x03CE, 1, -63},  {0x0430, 0x044F, 1, -32},
    {0x0450, 0x045F, 1, -80}, {0x0461, 0x0481, 2, -1},  {0x048B, 0x04BF, 2, -1},   {0x04C2, 0x04CE, 2, -1},
    {0x04CF, 0x04CF, 1, -15}, {0x04D1, 0x052F, 2, -1},  {0x1E01, 0x1E95, 2, -1},   {0x1EA1, 0x1EFF, 2, -1},
};

char32_t capitalOf(char32_t letter) {
    const auto* const range = std::ranges::find_if(ranges, [&](const LetterRange& candidate) {
        return letter >= candidate.first && letter <= candidate.last &&
               (static_cast<int>(letter - candidate.first) % candidate.step) == 0;
    });
    return range == std::end(ranges) ? letter
                                     : static_cast<char32_t>(static_cast<int>(letter) + range->offset);
}

bool isContinuation(char byte) {
    return (static_cast<unsigned char>(byte) & 0xC0U) == 0x80U;
}

// The length of the character at `at`: all the letters above take one to three bytes. 1 for what is no UTF-8.
std::size_t lengthAt(std::string_view text, std::size_t at) {
    const auto lead = static_cast<unsigned char>(text[at]);
    const std::size_t length = lead >= 0xE0 && lead < 0xF0 ? 3 : lead >= 0xC2 && lead < 0xE0 ? 2 : 1;
    const auto tail = text.substr(at).substr(0, length).substr(1);
    return tail.size() + 1 == length && std::ranges::all_of(tail, isContinuation) ? length : 1;
}

void appendUtf8(std::string& out, char32_t character) {
    const auto bits = [&](int shift) { return static_cast<char>(0x80 | ((character >> shift) & 0x3F)); };
    if (character < 0x80) {
        out += static_cast<char>(character);
    } else if (character < 0x800) {
        out += static_cast<char>(0xC0 | (character >> 6));
        out += bits(0);
    } else {
        out += static_cast<char>(0xE0 | (character >> 12));
        out += bits(6);
        out += bits(0);
    }
}

char32_t decode(std::string_view bytes) {
    char32_t character = static_cast<unsigned char>(bytes[0]);
    if (bytes.size() > 1)
        character &= bytes.size() == 2 ? 0x1F : 0x0F;
    for (const char byte : bytes.substr(1))
        character = (character << 6) | (static_cast<unsigned char>(byte) & 0x3F);
    return character;
}

} // namespace

CString upperCase(const CString& text) {
    const std::string_view bytes = text.View();
    std::string result;
    result.reserve(bytes.size());
    for (std::size_t at = 0; at < bytes.size();) {
        const std::size_t length = lengthAt(bytes, at);
        const std::string_view character = bytes.substr(at, length);
        if (length == 1 && static_cast<unsigned char>(character[0]) >= 0x80)
            result += character;
        else
            appendUtf8(result, capitalOf(decode(character)));
        at += length;
    }
    return CString(std::string_view(result));
}

} // namespace kota
