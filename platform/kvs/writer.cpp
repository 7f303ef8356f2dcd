#include "platform/kvs/writer.h"

#include "platform/kvs/lexicon.h"

#include <algorithm>
#include <charconv>
#include <cmath>

namespace kota::kvs {

namespace {

constexpr std::size_t pieceSize = std::size_t{1} << 20;
constexpr std::size_t longestNumber = 32;
constexpr int indent = 2;

} // namespace

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
    char* start = room(longestNumber);
    keep(std::to_chars(start, start + longestNumber, value).ptr);
}

void Writer::addDouble(double value) {
    if (!beginParameter())
        return;
    if (std::isnan(value)) {
        append("nan");
        return;
    }
    char* start = room(longestNumber);
    char* end = std::to_chars(start, start + longestNumber, value).ptr;
    const bool looksLikeInt = std::all_of(start, end, [](char c) { return isDigit(c) || c == '-'; });
    if (looksLikeInt) {
        *end++ = '.';
        *end++ = '0';
    }
    keep(end);
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
    text_.clear();
    for (const Piece& piece : pieces_)
        text_.emplace_back(piece.bytes.get(), piece.used);
    return text_;
}

char* Writer::room(std::size_t length) {
    if (pieces_.empty() || pieces_.back().size - pieces_.back().used < length) {
        const std::size_t size = std::max(length, pieceSize);
        pieces_.push_back({std::make_unique_for_overwrite<char[]>(size), size, 0});
    }
    return pieces_.back().bytes.get() + pieces_.back().used;
}

void Writer::keep(char* end) {
    pieces_.back().used = static_cast<std::size_t>(end - pieces_.back().bytes.get());
}

void Writer::append(std::string_view text) {
    keep(std::ranges::copy(text, room(text.size())).out);
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
    const auto blanks = static_cast<std::size_t>(depth_ * indent);
    keep(std::fill_n(room(blanks), blanks, ' '));
}

bool Writer::beginParameter() {
    if (keyword_ == Keyword::None) {
        misplaced("parameter", "");
        return false;
    }
    append(keyword_ == Keyword::Empty ? " " : ", ");
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
        const int length = utf8Length(text.substr(at));
        const char c = text[at];
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
