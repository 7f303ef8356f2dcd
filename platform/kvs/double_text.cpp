#include "platform/kvs/double_text.h"

#include <algorithm>
#include <charconv>
#include <cmath>
#include <cstdint>

namespace kota::kvs {

namespace {

// Writes a number of few digits, as people type them, several times as fast as std::to_chars does; null when
// the number is none of these, or shorter with an exponent. A whole number of at most 15 digits divided by a
// power of ten is that decimal's nearest double, and no other decimal's of as few digits.
char* writeShort(char* to, double value) {
    constexpr int decimals = 5;
    constexpr std::uint64_t scale = 100'000;
    constexpr double mostScaled = 1e15;
    const double magnitude = std::fabs(value);
    const double scaled = magnitude * scale;
    if (!(scaled < mostScaled))
        return nullptr;
    const auto digits = static_cast<std::uint64_t>(scaled + 0.5);
    if (static_cast<double>(digits) / scale != magnitude)
        return nullptr;
    const std::uint64_t whole = digits / scale;
    std::uint64_t fraction = digits % scale;
    const bool manyZerosBehind = fraction == 0 && whole % 100'000 == 0;
    const bool manyZerosInFront = whole == 0 && (fraction < 10 || (fraction < 100 && fraction % 10 == 0));
    if (manyZerosBehind || manyZerosInFront)
        return nullptr;

    if (value < 0)
        *to++ = '-';
    to = std::to_chars(to, to + longestDouble, whole).ptr;
    *to++ = '.';
    for (int i = decimals - 1; i >= 0; --i, fraction /= 10)
        to[i] = static_cast<char>('0' + fraction % 10);
    const char* const firstDecimal = to;
    to += decimals;
    while (to[-1] == '0' && to - 1 > firstDecimal)
        --to;
    return to;
}

} // namespace

char* writeDouble(char* to, double value) {
    if (char* end = writeShort(to, value))
        return end;
    if (std::isnan(value))
        return std::copy_n("nan", 3, to);
    char* end = std::to_chars(to, to + longestDouble, value).ptr;
    const bool looksLikeInt = std::all_of(to, end, [](char c) { return c == '-' || (c >= '0' && c <= '9'); });
    return looksLikeInt ? std::copy_n(".0", 2, end) : end;
}

} // namespace kota::kvs
