#pragma once

#include <cstddef>
#include <memory>
#include <string>
#include <string_view>
#include <vector>

namespace kota::kvs {

// Builds the text of a file, element by element, in memory.
//
// A call that the form has no place for (a section outside a target, a parameter without a keyword, a brace
// too deep) adds nothing and is told by misuse().
class Writer {
public:
    // Closes what is open and begins a target.
    void addTarget(std::string_view name);
    void addSection(std::string_view name);
    // Closes the section, or the target, that was opened last.
    void endSection();
    // Begins a keyword in the open section; parameters added next belong to it.
    void addKeyword(std::string_view name);
    void addInt(int value);
    void addDouble(double value);
    void addBool(bool value);
    void addString(std::string_view value);

    // Closes whatever is still open and gives the whole text in pieces, which stay the writer's.
    const std::vector<std::string_view>& finish();
    // What the first misplaced call was; empty when there was none.
    const std::string& misuse() const { return misuse_; }

private:
    // `length` bytes to write into, at the end of the text; what was written is kept by naming its end.
    char* room(std::size_t length) {
        if (static_cast<std::size_t>(limit_ - at_) < length)
            addPiece(length);
        return at_;
    }
    void keep(char* end) { at_ = end; }
    void addPiece(std::size_t length);
    void endPiece();

    void append(std::string_view text);
    void beginLine();
    void endLine();
    bool beginParameter();
    void open(std::string_view word, std::string_view name);
    void appendName(std::string_view name);
    void appendQuoted(std::string_view text);
    void misplaced(std::string_view element, std::string_view name);

    std::vector<std::unique_ptr<char[]>> pieces_; // of memory; the last one is written up to `at_`
    std::vector<std::string_view> text_;          // what was written into each
    char* at_ = nullptr;
    char* limit_ = nullptr;
    std::string misuse_;
    int depth_ = 0;
    bool lineOpen_ = false;
    enum class Keyword { None, Empty, Filled } keyword_ = Keyword::None; // the one that takes parameters
};

} // namespace kota::kvs
