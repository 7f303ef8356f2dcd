#pragma once

#include "platform/framework/platform_texts.h"
#include "platform/kvs/cell.h"
#include "platform/kvs/line_buffer.h"

#include <stdexcept>
#include <string>
#include <string_view>

namespace kota::kvs {

// The text breaks the form: where, counted from 1, and what was expected and what stands there.
struct SyntaxError : std::runtime_error {
    SyntaxError(int atLine, int atColumn, const std::string& message)
        : std::runtime_error(message), line(atLine), column(atColumn) {}

    int line;
    int column; // in characters
};

// Takes a text apart: words, numbers and strings, and the space between them. One pass, front to back, with
// one line in memory: no word, number or string goes over a line's end. What does not stand where it is
// expected throws SyntaxError.
class Scanner {
public:
    explicit Scanner(const ByteSource& source);

    // The character that stands here; a NUL at the end of the text.
    char peek() const { return *at_; }
    bool atEnd() const { return at_ == end_; }
    bool atLineEnd() const { return *at_ == '\n' || *at_ == '#' || atEnd(); }
    bool atWord() const;
    // Goes over the character that stands here, which is not the end.
    void skip() { ++at_; }
    void skipBlanks();
    // Goes over blanks, comments and line ends.
    void skipSpace();

    // The word that begins here, empty when none does. Good until the next line is read.
    std::string_view word();
    // The string that begins here, without its quotes. Good until the next string or line is read.
    std::string_view quoted();
    Cell number();
    // A word that is a value: true, false, nan or inf.
    Cell wordValue();

    // A place of the line in memory, for an error that is seen further on.
    const char* here() const { return at_; }
    // What had to stand here, or there.
    [[noreturn]] void fail(PlatformText expected) const { fail(expected, at_); }
    [[noreturn]] void fail(PlatformText expected, const char* where) const {
        fail(static_cast<const char*>(platformText(expected)), where);
    }
    [[noreturn]] void fail(const char* expected) const { fail(expected, at_); }
    [[noreturn]] void fail(const char* expected, const char* where) const;

private:
    void nextLine(const char* at);
    char escape();
    Cell longNumber(const char* start);
    void endOfNumber();
    std::string found(const char* where) const;

    LineBuffer buffer_;
    const char* at_ = nullptr;
    const char* end_ = nullptr;
    const char* lineStart_ = nullptr;
    int line_ = 0;
    std::string decoded_; // the last string that had escapes
};

} // namespace kota::kvs
