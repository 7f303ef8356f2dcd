#pragma once

#include "platform/kvs/cell.h"
#include "platform/kvs/name_index.h"

#include <cstdint>
#include <memory>
#include <string_view>
#include <vector>

namespace kota::kvs {

class Tree;

// A section, a target, or the file itself, whose sections are the targets.
class Section {
public:
    Section(const Tree* tree, NameIndex::Group group) : tree_(tree), group_(group) {}

    NameIndex::Group group() const { return group_; }
    // The n-th section, or keyword's head, of a name in this section, from 1; null when there is none.
    const Section* section(std::string_view name, int number) const;
    const Cell* keyword(std::string_view name, int number) const;

private:
    const Tree* tree_;
    NameIndex::Group group_;
};

// A file as it was read: sections and keywords in file order, found by name and number. Built once, from
// the front to the back, then only read. It owns the text in which its names and strings stand.
class Tree {
public:
    using SectionId = std::uint32_t;
    static constexpr SectionId file = 0;

    // `text` is the whole file, `length` bytes and one more.
    Tree(std::unique_ptr<char[]> text, std::size_t length);
    Tree(const Tree&) = delete;
    Tree& operator=(const Tree&) = delete;

    const char* text() const { return text_.get(); }
    std::size_t textLength() const { return length_; }

    // Building. Names and strings are not copied: they stand in the text or, where they had to be decoded, in
    // room beside it. A string decoded into that room is kept by naming its end.
    char* roomForDecoded();
    void keepDecoded(char* end) { decodedEnd_ = end; }
    SectionId addSection(SectionId parent, std::string_view name);
    void addKeyword(SectionId parent, std::string_view name);
    // Adds a parameter to the keyword added last.
    void addParameter(Cell parameter);
    // Everything was added: from here on elements can be found.
    void finish();

    const Section* fileSection() const { return &sections_.front(); }

private:
    friend class Section;

    std::unique_ptr<char[]> text_;
    std::size_t length_;
    std::unique_ptr<char[]> decoded_; // as long as the text, made at the first need
    char* decodedEnd_ = nullptr;
    std::vector<Section> sections_;
    std::vector<Cell> cells_;
    std::size_t lastKeyword_ = 0;
    NameIndex index_;
};

// The n-th parameter of a keyword, from 1; null when there is none.
const Cell* parameter(const Cell* keyword, int place);

} // namespace kota::kvs
