#include "platform/kvs/writer.h"

#include "platform/kvs/double_text.h"
#include "platform/kvs/lexicon.h"

#include <algorithm>
#include <charconv>
#include <cstring>

namespace kota::kvs {

namespace {

constexpr std::size_t pieceSize = std::size_t{1} << 20;
constexpr std::size_t longestInt = 11;
constexpr int indent = 2;

constexpr bool isPlainInString(char c) {
    return c >= ' ' && c <= '~' && c != '"' && c != '\\';
}

} // namespace

inline void Writer::append(std::string_view text) {
    char* to = room(text.size());
    std::memcpy(to, text.data(), text.size());
    keep(to + text.size());
}

void Writer::addTarget(std::string_view name) {
    while (depth_ > 0)
        endSection();
    open(targetWord, name);
}

void Writer::addSection(std::string_view name) {
    if (depth_ == 0 || depth_ == deepestNesting)
        misplaced("section", name);
    else
        open(sectionWord, name);
}

void Writer::endSection() {
    if (depth_ == 0)
        return;
    --depth_;
    beginLine();
    append("}");
}

void Writer::addKeyword(std::string_view name) {
    if (depth_ < 2) {
        misplaced("keyword", name);
        return;
    }
    beginLine();
    appendName(name);
    append(" =");
    keyword_ = Keyword::Empty;
}

void Writer::addInt(int value) {
    if (!beginParameter())
        return;
    char* start = room(longestInt);
    keep(std::to_chars(start, start + longestInt, value).ptr);
}

void Writer::addDouble(double value) {
    if (!beginParameter())
        return;
    keep(writeDouble(room(longestDouble), value));
}

void Writer::addBool(bool value) {
    if (!beginParameter())
        return;
    append(value ? "true" : "false");
}

void Writer::addString(std::string_view value) {
    if (!beginParameter())
        return;
    appendQuoted(value);
}

const std::vector<std::string_view>& Writer::finish() {
    while (depth_ > 0)
        endSection();
    endLine();
    endPiece();
    return text_;
}

void Writer::addPiece(std::size_t length) {
    endPiece();
    const std::size_t size = std::max(length, pieceSize);
    pieces_.push_back(std::make_unique_for_overwrite<char[]>(size));
    at_ = pieces_.back().get();
    limit_ = at_ + size;
    text_.emplace_back(at_, 0);
}

// Brings the view of the last piece up to date.
void Writer::endPiece() {
    if (!pieces_.empty())
        text_.back() = {pieces_.back().get(), at_};
}

void Writer::endLine() {
    if (lineOpen_)
        append("\n");
    lineOpen_ = false;
    keyword_ = Keyword::None;
}

void Writer::beginLine() {
    endLine();
    lineOpen_ = true;
    const auto blanks = static_cast<std::size_t>(depth_) * indent;
    keep(std::fill_n(room(blanks), blanks, ' '));
}

bool Writer::beginParameter() {
    if (keyword_ == Keyword::None) {
        misplaced("parameter", "");
        return false;
    }
    char* to = room(2);
    if (keyword_ == Keyword::Filled)
        *to++ = ',';
    *to++ = ' ';
    keep(to);
    keyword_ = Keyword::Filled;
    return true;
}

void Writer::open(std::string_view word, std::string_view name) {
    beginLine();
    append(word);
    append(" ");
    appendName(name);
    append(" {");
    ++depth_;
}

void Writer::appendName(std::string_view name) {
    if (isPlainName(name))
        append(name);
    else
        appendQuoted(name);
}

// Controls, and bytes that are no UTF-8, go as escapes, so that the file is always readable text.
void Writer::appendQuoted(std::string_view text) {
    constexpr std::size_t longestEscape = 4;
    char* to = room(text.size() * longestEscape + 2);
    *to++ = '"';
    const auto put = [&](std::string_view bytes) { to = std::ranges::copy(bytes, to).out; };
    for (std::size_t at = 0; at < text.size();) {
        const char c = text[at];
        if (isPlainInString(c)) {
            *to++ = c;
            ++at;
            continue;
        }
        const int length = utf8Length(text.substr(at));
        if (c == '"' || c == '\\')
            put(std::string{'\\', c});
        else if (c == '\n')
            put("\\n");
        else if (c == '\r')
            put("\\r");
        else if (c == '\t')
            put("\\t");
        else if (length == 0 || isControl(c))
            put(hexEscape(c));
        else
            put(text.substr(at, length));
        at += std::max(1, length);
    }
    *to++ = '"';
    keep(to);
}

void Writer::misplaced(std::string_view element, std::string_view name) {
    keyword_ = Keyword::None;
    if (!misuse_.empty())
        return;
    misuse_ = "the ";
    misuse_ += element;
    if (!name.empty())
        misuse_.append(" '").append(name).append("'");
    misuse_ += " has no place where it was added";
}

} // namespace kota::kvs
