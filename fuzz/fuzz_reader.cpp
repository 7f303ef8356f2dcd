#include "platform/kvs/lexicon.h"
#include "platform/kvs/reader.h"
#include "platform/kvs/tree.h"
#include "platform/kvs/writer.h"

#include <algorithm>
#include <bit>
#include <cmath>
#include <cstdint>
#include <cstdlib>
#include <cstring>
#include <memory>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

// Any bytes: they load or they are told as a syntax error, everything in what was loaded can be asked for,
// and every value that was found comes back from a file that is written with it.

namespace {

using kota::kvs::Cell;
using kota::kvs::Section;
using kota::kvs::Tree;

constexpr std::size_t mostNames = 48;
constexpr std::size_t wholeText = SIZE_MAX;

void require(bool condition) {
    if (!condition)
        std::abort();
}

// Reads a text that comes in pieces of at most `pieceSize` bytes.
std::unique_ptr<Tree> treeOf(std::string_view text, std::size_t pieceSize) {
    auto tree = std::make_unique<Tree>(text.size());
    kota::kvs::readText(
        [&](char* to, std::size_t room) {
            const std::string_view piece = text.substr(0, std::min(room, pieceSize));
            text.remove_prefix(piece.size());
            std::ranges::copy(piece, to);
            return piece.size();
        },
        *tree);
    return tree;
}

// What may be a name in the text: its plain words, and what stands between two quotes.
std::vector<std::string> namesIn(std::string_view text) {
    std::vector<std::string> names{""};
    const auto add = [&](std::string_view name) {
        if (names.size() < mostNames && std::ranges::find(names, name) == names.end())
            names.emplace_back(name);
    };
    for (std::size_t at = 0; at < text.size(); ++at) {
        std::size_t end = at + 1;
        if (kota::kvs::isNameStart(text[at])) {
            while (end < text.size() && kota::kvs::isNameCharacter(text[end]))
                ++end;
            add(text.substr(at, end - at));
            at = end - 1;
        } else if (text[at] == '"') {
            add(text.substr(end, text.find('"', end) - end));
        }
    }
    return names;
}

// Asks a parameter for everything, and holds the getters to each other.
void ask(const Cell& parameter) {
    const bool isString = parameter.type() == Cell::Type::String;
    require(isString || parameter.asString().IsEmpty());
    require(!isString || (parameter.asInt() == 0 && parameter.asDouble() == 0 && !parameter.asBool()));
    if (parameter.type() == Cell::Type::Int)
        require(parameter.asDouble() == parameter.asInt());
    if (parameter.asBool())
        require(parameter.asInt() == 1 && parameter.asDouble() == 1);
}

class Walk {
public:
    explicit Walk(const std::vector<std::string>& names) : names_(names) {}

    void through(const Section& section) {
        for (const std::string& name : names_) {
            require(!section.section(name, 0) && !section.keyword(name, 0));
            int number = 1;
            while (const Cell* keyword = section.keyword(name, number)) {
                throughKeyword(*keyword);
                ++number;
            }
            require(!section.keyword(name, number + 1));
            for (number = 1; const Section* inner = section.section(name, number); ++number)
                through(*inner);
        }
    }

    const std::vector<Cell>& parameters() const { return parameters_; }

private:
    void throughKeyword(const Cell& keyword) {
        int place = 1;
        for (; const Cell* parameter = kota::kvs::parameter(&keyword, place); ++place) {
            ask(*parameter);
            parameters_.push_back(*parameter);
        }
        require(static_cast<std::uint32_t>(place - 1) == keyword.parameterCount());
    }

    const std::vector<std::string>& names_;
    std::vector<Cell> parameters_;
};

std::string textWith(const std::vector<Cell>& parameters) {
    kota::kvs::Writer writer;
    writer.addTarget("T");
    writer.addSection("S");
    writer.addKeyword("all");
    for (const Cell& parameter : parameters) {
        switch (parameter.type()) {
        case Cell::Type::Int:
            writer.addInt(parameter.asInt());
            break;
        case Cell::Type::Double:
            writer.addDouble(parameter.asDouble());
            break;
        case Cell::Type::Bool:
            writer.addBool(parameter.asBool());
            break;
        default:
            writer.addString(parameter.asString().View());
            break;
        }
    }
    std::string text;
    for (const std::string_view piece : writer.finish())
        text += piece;
    require(writer.misuse().empty());
    return text;
}

bool same(const Cell& left, const Cell& right) {
    if (left.type() != right.type() || left.asString() != right.asString())
        return false;
    const double a = left.asDouble();
    const double b = right.asDouble();
    return (std::isnan(a) && std::isnan(b)) ||
           std::bit_cast<std::uint64_t>(a) == std::bit_cast<std::uint64_t>(b);
}

bool same(const std::vector<Cell>& left, const std::vector<Cell>& right) {
    return std::ranges::equal(left, right, [](const Cell& a, const Cell& b) { return same(a, b); });
}

void comeBack(const std::vector<Cell>& parameters) {
    const auto tree = treeOf(textWith(parameters), wholeText);
    const std::vector<std::string> names{"T", "S", "all"};
    Walk walk(names);
    walk.through(*tree->fileSection());
    require(same(walk.parameters(), parameters));
}

bool isReadable(std::string_view message) {
    while (!message.empty()) {
        const int length = kota::kvs::utf8Length(message);
        if (length == 0 || kota::kvs::isControl(message.front()))
            return false;
        message.remove_prefix(static_cast<std::size_t>(length));
    }
    return true;
}

void checkError(const kota::kvs::SyntaxError& error, std::string_view text) {
    require(error.line >= 1 && error.line <= 1 + std::ranges::count(text, '\n'));
    require(error.column >= 1 && static_cast<std::size_t>(error.column) <= text.size() + 1);
    const std::string_view message = error.what();
    require(message.starts_with("expected ") && message.find(", found ") != std::string_view::npos);
    require(isReadable(message));
}

// What came of a text: its parameters, in the order of a walk by name and number, or its syntax error.
struct Outcome {
    std::unique_ptr<Tree> tree; // null after an error
    std::vector<Cell> parameters;
    std::string error;
};

Outcome outcomeOf(std::string_view text, const std::vector<std::string>& names, std::size_t pieceSize) {
    try {
        auto tree = treeOf(text, pieceSize);
        Walk walk(names);
        walk.through(*tree->fileSection());
        return {std::move(tree), walk.parameters(), ""};
    } catch (const kota::kvs::SyntaxError& error) {
        checkError(error, text);
        return {nullptr, {}, std::to_string(error.line) + ":" + std::to_string(error.column) + error.what()};
    }
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    const std::string_view text(reinterpret_cast<const char*>(data), size);
    const auto names = namesIn(text);
    const Outcome outcome = outcomeOf(text, names, wholeText);
    const Outcome inPieces = outcomeOf(text, names, 1);
    require(outcome.error == inPieces.error && same(outcome.parameters, inPieces.parameters));
    if (outcome.tree)
        comeBack(outcome.parameters);
    return 0;
}
