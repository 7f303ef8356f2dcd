#include "platform/grid/table_text.h"

#include <algorithm>

namespace kota::grid {

namespace {

std::string printCell(const std::string& cell) {
    if (cell.find_first_of("\t\r\n\"") == std::string::npos)
        return cell;
    std::string quoted = "\"";
    for (const char letter : cell)
        quoted += letter == '"' ? std::string("\"\"") : std::string(1, letter);
    return quoted + '"';
}

// The place of the quote that closes the one at the start, past the doubled ones; npos when there is none.
std::size_t closingQuote(std::string_view text) {
    std::size_t at = text.find('"', 1);
    while (at != std::string_view::npos && at + 1 < text.size() && text[at + 1] == '"')
        at = text.find('"', at + 2);
    return at;
}

// Takes a cell off the text, up to what parts it from the next.
std::string takeCell(std::string_view& text) {
    constexpr std::string_view ends = "\t\r\n";
    const std::size_t close = text.starts_with('"') ? closingQuote(text) : std::string_view::npos;
    const bool isQuoted = close != std::string_view::npos &&
                          (close + 1 == text.size() || ends.find(text[close + 1]) != std::string_view::npos);
    const std::size_t end = isQuoted ? close + 1 : std::min(text.find_first_of(ends), text.size());
    std::string cell(text.substr(isQuoted ? 1 : 0, isQuoted ? close - 1 : end));
    if (isQuoted)
        for (std::size_t at = cell.find('"'); at != std::string::npos; at = cell.find('"', at + 1))
            cell.erase(at, 1);
    text.remove_prefix(end);
    return cell;
}

// Takes a line end off the text, if it starts with one.
void takeLineEnd(std::string_view& text) {
    const bool isAny = text.starts_with('\n') || text.starts_with('\r');
    text.remove_prefix(text.starts_with("\r\n") ? 2 : isAny ? 1 : 0);
}

} // namespace

std::string printTable(const std::vector<TableLine>& lines) {
    std::string text;
    for (const TableLine& line : lines) {
        for (std::size_t i = 0; i < line.size(); ++i)
            text += (i > 0 ? "\t" : "") + printCell(line[i]);
        text += '\n';
    }
    return text;
}

std::vector<TableLine> readTable(std::string_view text) {
    std::vector<TableLine> lines;
    while (!text.empty()) {
        TableLine& line = lines.emplace_back();
        line.push_back(takeCell(text));
        while (text.starts_with('\t')) {
            text.remove_prefix(1);
            line.push_back(takeCell(text));
        }
        takeLineEnd(text);
    }
    return lines;
}

} // namespace kota::grid
