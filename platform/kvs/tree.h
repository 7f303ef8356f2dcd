#pragma once

#include "platform/kvs/cell.h"
#include "platform/kvs/occurrences.h"

#include <cstdint>
#include <deque>
#include <string_view>
#include <vector>

namespace kota::kvs {

class Tree;

// A section, a target, or the file itself, whose sections are the targets.
class Section {
public:
    // The n-th section, or keyword's head, of a name in this section, from 1; null when there is none.
    const Section* section(std::string_view name, int number) const;
    const Cell* keyword(std::string_view name, int number) const;

private:
    friend class Tree;
    static constexpr std::uint32_t none = 0xFFFFFFFF;

    Section(const Tree* tree, std::uint32_t name) : tree_(tree), name_(name) {}

    const Tree* tree_;
    std::uint32_t name_;
    std::uint32_t firstChild_ = none; // ids of sections
    std::uint32_t lastChild_ = none;
    std::uint32_t nextSibling_ = none;
    std::uint32_t firstRun_ = none; // indices of runs of keywords
    std::uint32_t lastRun_ = none;
};

// A file as it was read: sections and keywords in file order, found by name and number. Built once, from the
// front to the back, then only read.
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
    void finish() { endKeyword(); }

    const Section* fileSection() const { return &sections_.front(); }

private:
    friend class Section;

    // Keywords of one section that stand one behind the other.
    struct Run {
        std::uint32_t firstCell;
        std::uint32_t count;
        std::uint32_t next; // of the same section
    };
    struct Name {
        std::uint32_t begin; // in `nameText_`
        std::uint32_t length;
    };
    struct RecentString {
        std::uint32_t hash = 0;
        const CString* string = nullptr;
    };

    void endKeyword();
    std::uint32_t nameId(std::string_view name);
    std::string_view nameOf(std::uint32_t id) const;
    SectionId idOf(const Section* section) const;
    template <class Visit>
    void forEachChild(SectionId parent, const Visit& visit) const;
    template <class Visit>
    void forEachKeyword(SectionId parent, const Visit& visit) const;

    std::vector<Section> sections_; // by id
    std::vector<Cell> cells_;       // a keyword's head, its parameters, the next one's head, ...
    std::size_t lastKeyword_ = 0;   // its head's place in `cells_`
    std::vector<Run> runs_;
    SectionId lastParent_ = file; // of the keyword added last; the file itself has none
    std::vector<Name> names_;
    std::vector<char> nameText_;
    std::deque<CString> strings_;
    std::vector<RecentString> recentStrings_; // a hash table in which the newer string ousts the older
    mutable Occurrences children_;            // those that were asked for
    mutable Occurrences keywords_;
};

// The n-th parameter of a keyword, from 1; null when there is none.
inline const Cell* parameter(const Cell* keyword, int place) {
    const bool exists =
        keyword && place >= 1 && static_cast<std::uint32_t>(place) <= keyword->parameterCount();
    return exists ? keyword + place : nullptr;
}

} // namespace kota::kvs
