#include "platform/kvs/scanner.h"

#include "platform/kvs/lexicon.h"

#include <algorithm>
#include <array>
#include <charconv>
#include <limits>
#include <utility>

namespace kota::kvs {

namespace {

// What a character may be, in one look.
enum CharacterClass : unsigned char {
    Blank = 1,
    NameStart = 2,
    NameCharacter = 4,
    BehindValue = 8, // what a value must be followed by
    EndsPlain = 16,  // what ends a run of a string's characters that stand for themselves
};

constexpr auto characterClasses = [] {
    std::array<unsigned char, 256> classes{};
    const auto add = [&](std::string_view characters, int kind) {
        for (const char c : characters)
            classes[static_cast<unsigned char>(c)] |= static_cast<unsigned char>(kind);
    };
    for (int c = 0; c < 256; ++c) {
        const auto character = static_cast<char>(c);
        if (isNameCharacter(character))
            add({&character, 1}, isNameStart(character) ? NameStart | NameCharacter : NameCharacter);
    }
    add(" \t\r", Blank);
    add(std::string_view(" \t\r,}\n#\0", 8), BehindValue); // NUL: the end of the text, or an error
    add(std::string_view("\"\\\n\0", 4), EndsPlain);
    return classes;
}();

constexpr bool is(char c, CharacterClass kind) {
    return (characterClasses[static_cast<unsigned char>(c)] & kind) != 0;
}

constexpr int hexDigit(char c) {
    if (isDigit(c))
        return c - '0';
    if (c >= 'a' && c <= 'f')
        return c - 'a' + 10;
    if (c >= 'A' && c <= 'F')
        return c - 'A' + 10;
    return -1;
}

// Those that a double holds exactly.
constexpr std::array powersOfTen = {1e0,  1e1,  1e2,  1e3,  1e4,  1e5,  1e6,  1e7,  1e8,  1e9,  1e10, 1e11,
                                    1e12, 1e13, 1e14, 1e15, 1e16, 1e17, 1e18, 1e19, 1e20, 1e21, 1e22};

} // namespace

Scanner::Scanner(const ByteSource& source) : buffer_(source) {
    nextLine(buffer_.end());
    if (std::string_view(at_, end_).starts_with(byteOrderMark))
        lineStart_ = at_ += byteOrderMark.size();
}

bool Scanner::atWord() const {
    return is(*at_, NameStart);
}

void Scanner::nextLine(const char* at) {
    lineStart_ = at_ = buffer_.loadLine(at);
    end_ = buffer_.end();
    ++line_;
}

void Scanner::skipBlanks() {
    const char* at = at_;
    while (is(*at, Blank))
        ++at;
    at_ = at;
}

void Scanner::skipSpace() {
    for (;;) {
        skipBlanks();
        if (*at_ == '#')
            at_ = std::find(at_, end_, '\n');
        if (*at_ != '\n')
            return;
        nextLine(at_ + 1);
    }
}

std::string_view Scanner::word() {
    const char* at = at_;
    if (is(*at, NameStart))
        do
            ++at;
        while (is(*at, NameCharacter));
    return {std::exchange(at_, at), at};
}

std::string_view Scanner::quoted() {
    const char* const start = at_ + 1;
    const char* at = start;
    while (!is(*at, EndsPlain))
        ++at;
    at_ = at;
    if (*at == '"') {
        ++at_;
        return {start, at};
    }
    decoded_.assign(start, at);
    while (*at_ != '"') {
        if (*at_ == '\n' || atEnd())
            fail(PlatformText::ClosingQuote);
        decoded_ += *at_ == '\\' ? escape() : *at_++;
    }
    ++at_;
    return decoded_;
}

char Scanner::escape() {
    const char* start = at_++;
    const char letter = atEnd() ? '\0' : *at_++;
    switch (letter) {
    case '"':
    case '\\':
        return letter;
    case 'n':
        return '\n';
    case 'r':
        return '\r';
    case 't':
        return '\t';
    case 'x':
        if (const int high = hexDigit(*at_); high >= 0) {
            if (const int low = hexDigit(at_[1]); low >= 0) {
                at_ += 2;
                return static_cast<char>(high << 4 | low);
            }
        }
        break;
    default:
        break;
    }
    fail(PlatformText::KnownEscape, start);
}

Cell Scanner::wordValue() {
    const char* start = at_;
    const std::string_view text = word();
    if (text == "true" || text == "false")
        return Cell::ofBool(text == "true");
    if (text == "nan")
        return Cell::ofDouble(std::numeric_limits<double>::quiet_NaN());
    if (text == "inf")
        return Cell::ofDouble(std::numeric_limits<double>::infinity());
    fail(PlatformText::Value, start);
}

Cell Scanner::number() {
    const char* start = at_;
    const bool negative = *at_ == '-';
    if (negative)
        ++at_;
    if (negative && is(*at_, NameStart)) {
        if (word() == "inf")
            return Cell::ofDouble(-std::numeric_limits<double>::infinity());
        fail(PlatformText::Value, start);
    }
    if (!isDigit(*at_) && *at_ != '.')
        fail(PlatformText::Value, start);

    // The digits as one whole number, which is right for up to 19 of them and exact in a double up to 2^53.
    constexpr std::size_t mostDigits = 19;
    constexpr std::uint64_t mostExact = std::uint64_t{1} << 53;
    std::uint64_t digits = 0;
    const char* at = at_;
    while (*at == '0' && isDigit(at[1]))
        ++at;
    const auto readDigits = [&] {
        const char* const first = at;
        for (; isDigit(*at); ++at)
            digits = digits * 10 + (*at - '0');
        return static_cast<std::size_t>(at - first);
    };
    const std::size_t whole = readDigits();
    const bool hasPoint = *at == '.';
    if (hasPoint)
        ++at;
    const std::size_t decimals = hasPoint ? readDigits() : 0;
    const std::size_t count = whole + decimals;
    const bool exact = count > 0 && count <= mostDigits && digits <= mostExact;
    if (!exact || *at == 'e' || *at == 'E')
        return longNumber(start);

    at_ = at;
    endOfNumber();
    if (hasPoint) {
        // Both are exact, so their quotient is the double nearest to what is written.
        const double value = static_cast<double>(digits) / powersOfTen[decimals];
        return Cell::ofDouble(negative ? -value : value);
    }
    const std::int64_t integer =
        negative ? -static_cast<std::int64_t>(digits) : static_cast<std::int64_t>(digits);
    return std::in_range<std::int32_t>(integer) ? Cell::ofInt(static_cast<std::int32_t>(integer))
                                                : longNumber(start);
}

Cell Scanner::longNumber(const char* start) {
    double value = 0;
    const auto [stop, error] = std::from_chars(start, end_, value);
    if (error == std::errc::invalid_argument)
        fail(PlatformText::Value, start);
    if (*stop == 'e' || *stop == 'E')
        fail(PlatformText::ExponentDigits, start);
    if (std::all_of(start, stop, [](char c) { return c == '-' || isDigit(c); }))
        fail(PlatformText::WholeNumber, start);
    if (error == std::errc::result_out_of_range)
        fail(PlatformText::NumberInRange, start);
    at_ = stop;
    endOfNumber();
    return Cell::ofDouble(value);
}

void Scanner::endOfNumber() {
    if (!is(*at_, BehindValue) || (*at_ == '\0' && !atEnd()))
        fail(PlatformText::CommaOrEndOfLine);
}

void Scanner::fail(const char* expected, const char* where) const {
    int column = 1;
    for (const char* c = lineStart_; c < where; c += std::max(1, utf8Length({c, where})))
        ++column;
    const CString message = platformText(PlatformText::SyntaxError, expected, found(where).c_str());
    throw SyntaxError(line_, column, static_cast<const char*>(message));
}

std::string Scanner::found(const char* where) const {
    if (where == end_)
        return std::string(platformText(PlatformText::EndOfFile).View());
    if (*where == '\n')
        return std::string(platformText(PlatformText::EndOfLine).View());
    constexpr std::string_view apart = " \t\r\n,#{}=\"";
    constexpr std::ptrdiff_t longest = 32;
    const char* const stop = end_ - where > longest ? where + longest : end_;
    const char* last = std::find_first_of(where, stop, apart.begin(), apart.end());
    if (last == where)
        ++last;
    std::string shown = "'";
    for (const char* c = where; c < last;) {
        const int length = utf8Length({c, end_});
        if (length == 0 || isControl(*c))
            shown += hexEscape(*c++);
        else
            for (int i = 0; i < length; ++i)
                shown += *c++;
    }
    return shown + (last == stop && stop != end_ ? "...'" : "'");
}

} // namespace kota::kvs
