#include "platform/kvs/reader.h"

#include "platform/kvs/lexicon.h"

#include <algorithm>
#include <array>
#include <charconv>
#include <iterator>
#include <limits>
#include <utility>

namespace kota::kvs {

namespace {

constexpr bool isBlank(char c) {
    return c == ' ' || c == '\t' || c == '\r';
}

constexpr auto nameCharacters = [] {
    std::array<bool, 256> table{};
    for (int c = 0; c < 256; ++c)
        table[c] = isNameCharacter(static_cast<char>(c));
    return table;
}();

constexpr int hexDigit(char c) {
    if (isDigit(c))
        return c - '0';
    if (c >= 'a' && c <= 'f')
        return c - 'a' + 10;
    if (c >= 'A' && c <= 'F')
        return c - 'A' + 10;
    return -1;
}

constexpr const char* aValue = "a value (a number, true, false, nan, inf, -inf or a string in double quotes)";

// One pass over the text, front to back. A NUL stands behind its end, so that one character may always be
// looked at.
class Reader {
public:
    explicit Reader(Tree& tree)
        : tree_(tree), begin_(tree.text()), end_(begin_ + tree.textLength()), at_(begin_) {}

    void read();

private:
    void skipBlanks();
    void skipSpace();
    bool atEnd() const { return at_ == end_; }
    bool atLineEnd() const { return *at_ == '\n' || *at_ == '#' || atEnd(); }

    std::string_view word();
    std::string_view name(const char* expected);
    std::string_view quoted();
    char escape();

    void readTarget();
    void readMember();
    void open(std::string_view name);
    void readKeyword(std::string_view name);
    Cell value();
    Cell number();
    Cell wordValue();
    void endOfValue();

    [[noreturn]] void fail(const std::string& expected) { fail(expected, at_); }
    [[noreturn]] void fail(const std::string& expected, const char* where) const;
    std::string found(const char* where) const;

    Tree& tree_;
    const char* const begin_;
    const char* const end_;
    const char* at_;
    std::array<Tree::SectionId, deepestNesting + 1> open_{Tree::file};
    int depth_ = 0;
};

void Reader::read() {
    if (std::string_view(begin_, end_).starts_with(byteOrderMark))
        at_ += byteOrderMark.size();
    for (skipSpace(); !atEnd(); skipSpace()) {
        if (*at_ == '}' && depth_ > 0) {
            --depth_;
            ++at_;
        } else if (depth_ == 0) {
            readTarget();
        } else {
            readMember();
        }
    }
    if (depth_ > 0)
        fail("'}'");
}

void Reader::readTarget() {
    const char* start = at_;
    if (word() != targetWord)
        fail("'target'", start);
    skipSpace();
    open(name("the target's name"));
}

// A section or, below a target's own level, a keyword. A word that '=' follows is always a keyword's name.
void Reader::readMember() {
    const char* start = at_;
    const bool inTarget = depth_ == 1;
    const bool plain = *at_ != '"';
    const std::string_view first = name(inTarget ? "'section' or '}'" : "'section', a keyword's name or '}'");
    skipBlanks();
    if (plain && first == sectionWord && *at_ != '=') {
        skipSpace();
        open(name("the section's name"));
    } else if (inTarget) {
        fail("'section' or '}'", start);
    } else {
        readKeyword(first);
    }
}

void Reader::open(std::string_view name) {
    skipSpace();
    if (*at_ != '{')
        fail("'{'");
    if (depth_ == deepestNesting)
        fail("at most " + std::to_string(deepestNesting) + " braces in each other");
    ++at_;
    open_[depth_ + 1] = tree_.addSection(open_[depth_], name);
    ++depth_;
}

void Reader::readKeyword(std::string_view name) {
    if (*at_ != '=')
        fail("'='");
    ++at_;
    tree_.addKeyword(open_[depth_], name);
    skipBlanks();
    if (atLineEnd() || *at_ == '}')
        return;
    for (;;) {
        tree_.addParameter(value());
        skipBlanks();
        if (*at_ != ',')
            break;
        ++at_;
        skipSpace();
    }
    if (!atLineEnd() && *at_ != '}')
        fail("',' or the end of the line");
}

Cell Reader::value() {
    if (*at_ == '"') {
        const char* start = at_;
        const std::string_view text = quoted();
        if (text.size() > Cell::longestString)
            fail("a string of at most " + std::to_string(Cell::longestString) + " bytes", start);
        return Cell::ofString(text);
    }
    if (isNameStart(*at_))
        return wordValue();
    return number();
}

Cell Reader::wordValue() {
    const char* start = at_;
    const std::string_view text = word();
    if (text == "true" || text == "false")
        return Cell::ofBool(text == "true");
    if (text == "nan")
        return Cell::ofDouble(std::numeric_limits<double>::quiet_NaN());
    if (text == "inf")
        return Cell::ofDouble(std::numeric_limits<double>::infinity());
    fail(aValue, start);
}

// A number without point and exponent is an int.
Cell Reader::number() {
    const char* start = at_;
    const bool negative = *at_ == '-';
    if (negative)
        ++at_;
    if (negative && isNameStart(*at_)) {
        if (word() == "inf")
            return Cell::ofDouble(-std::numeric_limits<double>::infinity());
        fail(aValue, start);
    }
    if (!isDigit(*at_) && *at_ != '.')
        fail(aValue, start);

    std::int64_t magnitude = 0;
    for (; isDigit(*at_) && magnitude <= std::numeric_limits<std::int32_t>::max(); ++at_)
        magnitude = magnitude * 10 + (*at_ - '0');
    const std::int64_t integer = negative ? -magnitude : magnitude;
    const bool endsHere = !isDigit(*at_) && *at_ != '.' && *at_ != 'e' && *at_ != 'E';
    if (endsHere && std::in_range<std::int32_t>(integer)) {
        endOfValue();
        return Cell::ofInt(static_cast<std::int32_t>(integer));
    }

    double value = 0;
    const auto [stop, error] = std::from_chars(start, end_, value);
    if (error == std::errc::invalid_argument)
        fail(aValue, start);
    if (std::all_of(start, stop, [](char c) { return c == '-' || isDigit(c); }))
        fail("a whole number from -2147483648 to 2147483647, or a number with a point", start);
    if (error == std::errc::result_out_of_range)
        fail("a number within the range of a double, or inf", start);
    at_ = stop;
    endOfValue();
    return Cell::ofDouble(value);
}

// What a number must be followed by, so that "1x" is not read as 1 and something else.
void Reader::endOfValue() {
    if (!isBlank(*at_) && *at_ != ',' && *at_ != '}' && !atLineEnd())
        fail("',' or the end of the line");
}

void Reader::skipBlanks() {
    while (isBlank(*at_))
        ++at_;
}

void Reader::skipSpace() {
    for (;;) {
        skipBlanks();
        if (*at_ == '#')
            at_ = std::find(at_, end_, '\n');
        else if (*at_ == '\n')
            ++at_;
        else
            return;
    }
}

std::string_view Reader::word() {
    const char* start = at_;
    if (isNameStart(*at_))
        do
            ++at_;
        while (nameCharacters[static_cast<unsigned char>(*at_)]);
    return {start, at_};
}

std::string_view Reader::name(const char* expected) {
    if (*at_ == '"')
        return quoted();
    const std::string_view plain = word();
    if (plain.empty())
        fail(expected);
    return plain;
}

// The string that begins here, without its quotes. It ends on the line on which it begins.
std::string_view Reader::quoted() {
    const char* start = ++at_;
    while (*at_ != '"' && *at_ != '\\' && *at_ != '\n' && !atEnd())
        ++at_;
    if (*at_ == '"')
        return {start, at_++};
    const std::string_view plain(start, at_);
    char* decoded = tree_.roomForDecoded();
    char* to = std::ranges::copy(plain, decoded).out;
    while (*at_ != '"') {
        if (*at_ == '\n' || atEnd())
            fail("'\"' to close the string");
        *to++ = *at_ == '\\' ? escape() : *at_++;
    }
    ++at_;
    tree_.keepDecoded(to);
    return {decoded, to};
}

char Reader::escape() {
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
    fail(R"(one of \" \\ \n \r \t and \x with two hexadecimal digits)", start);
}

void Reader::fail(const std::string& expected, const char* where) const {
    const char* lineStart =
        std::find(std::reverse_iterator(where), std::reverse_iterator(begin_), '\n').base();
    const auto line = 1 + std::count(begin_, lineStart, '\n');
    if (lineStart == begin_ && std::string_view(begin_, end_).starts_with(byteOrderMark))
        lineStart += byteOrderMark.size();
    int column = 1;
    for (const char* c = lineStart; c < where; c += std::max(1, utf8Length({c, where})))
        ++column;
    throw SyntaxError(static_cast<int>(line), column, "expected " + expected + ", found " + found(where));
}

// What stands at a place: a whole word or number, or else one character.
std::string Reader::found(const char* where) const {
    if (where == end_)
        return "the end of the file";
    if (*where == '\n')
        return "the end of the line";
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

} // namespace

void readText(Tree& tree) {
    Reader(tree).read();
    tree.finish();
}

} // namespace kota::kvs
