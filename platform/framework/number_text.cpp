#include "platform/framework/number_text.h"

#include <algorithm>
#include <climits>
#include <cmath>
#include <cstddef>
#include <cstdint>
#include <limits>
#include <optional>
#include <string>
#include <system_error>

namespace kota {

namespace {

constexpr std::string_view digits = "0123456789";
constexpr std::string_view hexDigits = "0123456789abcdefABCDEF";

// Takes white space and a sign off the front of `text`. Whether the sign is a minus.
bool takeSign(std::string_view& text) {
    text.remove_prefix(std::min(text.find_first_not_of(" \t\n\v\f\r"), text.size()));
    const bool negative = text.starts_with('-');
    if (negative || text.starts_with('+'))
        text.remove_prefix(1);
    return negative;
}

// Takes the 0x of a hexadecimal number off the front of `text`, if there is one.
bool takeHexMark(std::string_view& text) {
    if (!text.starts_with("0x") && !text.starts_with("0X"))
        return false;
    const std::size_t first = text.substr(2).starts_with('.') ? 3 : 2;
    if (text.size() <= first || hexDigits.find(text[first]) == std::string_view::npos)
        return false;
    text.remove_prefix(2);
    return true;
}

// Infinity or 0: the double of a number of which only its distance from a double's range is known.
double outOfRange(std::string_view number, bool hex) {
    const std::size_t mark = std::min(number.find_first_of(hex ? "pP" : "eE"), number.size());
    const std::string_view mantissa = number.substr(0, mark);
    const auto point = static_cast<double>(std::min(mantissa.find('.'), mantissa.size()));
    const auto firstDigit = static_cast<double>(mantissa.find_first_not_of("0."));
    const double exponent = mark < number.size() ? textToDouble(number.substr(mark + 1)) : 0.0;
    const double size = (point - firstDigit) * (hex ? 4 : 1) + exponent;
    return size > 0 ? std::numeric_limits<double>::infinity() : 0.0;
}

// The number without a sign at the start of `text`, if there is one.
std::optional<double> unsignedToDouble(std::string_view text) {
    const bool hex = takeHexMark(text);
    if (text.starts_with('-'))
        return std::nullopt;
    double value = 0.0;
    const auto format = hex ? std::chars_format::hex : std::chars_format::general;
    const auto [end, error] = std::from_chars(text.data(), text.data() + text.size(), value, format);
    if (error == std::errc::invalid_argument)
        return std::nullopt;
    if (error == std::errc::result_out_of_range)
        return outOfRange({text.data(), static_cast<std::size_t>(end - text.data())}, hex);
    return value;
}

// Takes all that stands before the next conversion off the front of `format`, and gives it as it is printed.
std::string takeText(std::string_view& format) {
    std::string text;
    while (!format.empty()) {
        if (format.starts_with("%%"))
            format.remove_prefix(1);
        else if (format.starts_with('%'))
            break;
        text += format.front();
        format.remove_prefix(1);
    }
    return text;
}

constexpr std::array<std::uint32_t, 7> powersOfTen = {1, 10, 100, 1'000, 10'000, 100'000, 1'000'000};

// `magnitude` times `scale`, rounded to the nearest whole number, to the even one of two: exactly so, since
// the error of the product is part of the decision. For a magnitude below 1e12.
std::uint64_t scaledAndRounded(double magnitude, std::uint32_t scale) {
    const auto whole = static_cast<std::uint64_t>(magnitude);
    const double fraction = magnitude - static_cast<double>(whole);
    const double product = fraction * scale;
    const double error = std::fma(fraction, scale, -product);
    const auto down = static_cast<std::uint64_t>(product);
    const double beyondHalf = product - static_cast<double>(down) - 0.5;
    const std::uint64_t scaled = whole * scale + down;
    if (beyondHalf != 0)
        return scaled + (beyondHalf > 0);
    if (error != 0)
        return scaled + (error > 0);
    return scaled + scaled % 2;
}

// As std::to_chars in fixed notation, but for the sign, and several times as fast. Null for a number or a
// precision that is too large for this.
char* printFixed(char* to, char* end, double magnitude, int precision) {
    constexpr double tooLarge = 1e12;
    if (!(magnitude < tooLarge) || precision >= static_cast<int>(powersOfTen.size()))
        return nullptr;
    const std::uint32_t scale = powersOfTen[static_cast<std::size_t>(precision)];
    const std::uint64_t scaled = scaledAndRounded(magnitude, scale);
    to = std::to_chars(to, end, scaled / scale).ptr;
    if (precision == 0)
        return to;
    *to = '.';
    auto decimals = static_cast<std::uint32_t>(scaled % scale);
    for (int i = precision; i > 0; --i, decimals /= 10)
        to[i] = static_cast<char>('0' + decimals % 10);
    return to + precision + 1;
}

// `magnitude` is not negative and may be an infinity or nan.
char* printMagnitude(char* to, char* end, double magnitude, std::chars_format notation, int precision) {
    if (std::isnan(magnitude))
        return std::copy_n("nan", 3, to);
    if (std::isinf(magnitude))
        return std::copy_n("inf", 3, to);
    if (notation == std::chars_format::fixed)
        if (char* const printed = printFixed(to, end, magnitude, precision))
            return printed;
    return std::to_chars(to, end, magnitude, notation, precision).ptr;
}

void raiseLetters(char* from, const char* end) {
    for (; from != end; ++from)
        if (*from >= 'a' && *from <= 'z')
            *from = static_cast<char>(*from - 'a' + 'A');
}

std::optional<std::chars_format> notationOf(char letter) {
    switch (letter) {
    case 'f':
    case 'F':
        return std::chars_format::fixed;
    case 'e':
    case 'E':
        return std::chars_format::scientific;
    case 'g':
    case 'G':
        return std::chars_format::general;
    default:
        return std::nullopt;
    }
}

} // namespace

double textToDouble(std::string_view text) {
    const bool negative = takeSign(text);
    const std::optional<double> magnitude = unsignedToDouble(text);
    return magnitude ? std::copysign(*magnitude, negative ? -1.0 : 1.0) : 0.0;
}

int textToInt(std::string_view text) {
    const bool negative = takeSign(text);
    const std::string_view number = text.substr(0, text.find_first_not_of(digits));
    std::int64_t value = 0;
    const auto [end, error] = std::from_chars(number.data(), number.data() + number.size(), value);
    if (error == std::errc::result_out_of_range)
        return negative ? INT_MIN : INT_MAX;
    return static_cast<int>(std::clamp<std::int64_t>(negative ? -value : value, INT_MIN, INT_MAX));
}

NumberFormat::NumberFormat(std::string_view format) {
    if (!Parse(format))
        Parse("%f");
}

bool NumberFormat::Parse(std::string_view format) {
    constexpr std::size_t tooLong = 200;
    before_ = std::string_view(takeText(format));
    if (!ParseConversion(format))
        return false;
    after_ = std::string_view(takeText(format));
    const std::size_t length = before_.View().size() + after_.View().size();
    return format.empty() && length + static_cast<std::size_t>(precision_) < tooLong;
}

// Takes one conversion off the front of `format`.
bool NumberFormat::ParseConversion(std::string_view& format) {
    if (!format.starts_with('%'))
        return false;
    format.remove_prefix(std::min(format.find_first_not_of('-', 1), format.size()));
    precision_ = 6;
    if (format.starts_with('.')) {
        format.remove_prefix(1);
        const std::string_view number = format.substr(0, format.find_first_not_of(digits));
        precision_ = textToInt(number);
        format.remove_prefix(number.size());
    }
    if (format.starts_with('l'))
        format.remove_prefix(1);
    const std::optional<std::chars_format> notation = notationOf(format.empty() ? '\0' : format.front());
    if (!notation)
        return false;
    notation_ = *notation;
    upperCase_ = format.front() < 'a';
    format.remove_prefix(1);
    return true;
}

CString NumberFormat::operator()(double value) const {
    NumberBuffer buffer;
    return CString(print(value, buffer));
}

std::string_view NumberFormat::print(double value, NumberBuffer& buffer) const {
    char* const begin = buffer.data();
    char* to = std::copy_n(before_.View().data(), before_.GetLength(), begin);
    if (std::signbit(value))
        *to++ = '-';
    char* const end = printMagnitude(to, begin + buffer.size(), std::fabs(value), notation_, precision_);
    if (upperCase_)
        raiseLetters(to, end);
    to = std::copy_n(after_.View().data(), after_.GetLength(), end);
    return {begin, static_cast<std::size_t>(to - begin)};
}

} // namespace kota
