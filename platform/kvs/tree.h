#pragma once

#include "platform/kvs/cell.h"
#include "platform/kvs/name_index.h"

#include <array>
#include <cstdint>
#include <deque>
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
// the front to the back, then only read.
class Tree {
public:
    using SectionId = std::uint32_t;
    static constexpr SectionId file = 0;

    // `textLength` is how long the file is, which tells how much room there must be at the most.
    explicit Tree(std::size_t textLength);
    Tree(const Tree&) = delete;
    Tree& operator=(const Tree&) = delete;

    // Building. Parameters go to the keyword added last.
    SectionId addSection(SectionId parent, std::string_view name);
    void addKeyword(SectionId parent, std::string_view name);
    void addParameter(Cell parameter) { cells_.push_back(parameter); }
    void addString(std::string_view value);
    // Everything was added: from here on elements can be found.
    void finish();

    const Section* fileSection() const { return &sections_.front(); }

private:
    friend class Section;

    void endKeyword();

    std::vector<Section> sections_;
    std::vector<Cell> cells_;
    std::size_t lastKeyword_ = 0; // its head's place in `cells_`
    NameIndex index_;
    std::deque<CString> strings_;
    std::array<const CString*, 64> recentStrings_{}; // the last one of each kind, by length and letters
};

// The n-th parameter of a keyword, from 1; null when there is none.
inline const Cell* parameter(const Cell* keyword, int place) {
    const bool exists =
        keyword && place >= 1 && static_cast<std::uint32_t>(place) <= keyword->parameterCount();
    return exists ? keyword + place : nullptr;
}

} // namespace kota::kvs
