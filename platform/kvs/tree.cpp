#include "platform/kvs/tree.h"

#include "platform/kvs/lexicon.h"
#include "platform/kvs/quick_hash.h"

#include <algorithm>
#include <bit>

namespace kota::kvs {

namespace {

// How many strings are remembered for sharing: few for a small file.
std::size_t recentCount(std::size_t textLength) {
    return std::clamp(std::bit_ceil(textLength / 64), std::size_t{64}, std::size_t{1} << 16);
}

// The n-th of the elements of a name, from 1, or null.
template <class Item>
const Item* nth(const std::vector<Item>& items, const Occurrences::Elements& elements, int number) {
    const auto place = static_cast<std::size_t>(number) - 1;
    return number >= 1 && place < elements.size() ? &items[elements[place]] : nullptr;
}

} // namespace

Tree::Tree(std::size_t textLength) : recentStrings_(recentCount(textLength)) {
    // Room for all that the text can hold, so that nothing is ever moved: no element is shorter than two
    // bytes. Memory that is never touched costs nothing.
    constexpr std::size_t most = std::size_t{1} << 28;
    cells_.reserve(std::min(textLength / 2 + 1, most));
    sections_.push_back(Section(this, nameId("")));
}

Tree::SectionId Tree::addSection(SectionId parent, std::string_view name) {
    const auto id = static_cast<SectionId>(sections_.size());
    sections_.push_back(Section(this, nameId(name)));
    Section& around = sections_[parent];
    (around.firstChild_ == Section::none ? around.firstChild_ : sections_[around.lastChild_].nextSibling_) =
        id;
    around.lastChild_ = id;
    lastParent_ = file;
    return id;
}

void Tree::addKeyword(SectionId parent, std::string_view name) {
    endKeyword();
    lastKeyword_ = cells_.size();
    cells_.push_back(Cell::keyword(nameId(name)));
    if (parent != lastParent_) {
        lastParent_ = parent;
        const auto run = static_cast<std::uint32_t>(runs_.size());
        runs_.push_back({static_cast<std::uint32_t>(lastKeyword_), 0, Section::none});
        Section& around = sections_[parent];
        (around.firstRun_ == Section::none ? around.firstRun_ : runs_[around.lastRun_].next) = run;
        around.lastRun_ = run;
    }
    ++runs_.back().count;
}

void Tree::endKeyword() {
    if (!cells_.empty())
        cells_[lastKeyword_].setParameterCount(static_cast<std::uint32_t>(cells_.size() - lastKeyword_ - 1));
}

// River names and the like come again and again: a string that stood a little earlier is shared.
void Tree::addString(std::string_view value) {
    const std::uint32_t hash = quickHash(value);
    RecentString& recent = recentStrings_[hash % recentStrings_.size()];
    if (!recent.string || recent.hash != hash || !sameName(recent.string->View(), value))
        recent = {hash, &strings_.emplace_back(value)};
    addParameter(Cell::ofString(*recent.string));
}

// A name often is that of the element before.
std::uint32_t Tree::nameId(std::string_view name) {
    if (names_.empty() || !sameName(nameOf(static_cast<std::uint32_t>(names_.size() - 1)), name)) {
        names_.push_back(
            {static_cast<std::uint32_t>(nameText_.size()), static_cast<std::uint32_t>(name.size())});
        nameText_.insert(nameText_.end(), name.begin(), name.end());
    }
    return static_cast<std::uint32_t>(names_.size() - 1);
}

std::string_view Tree::nameOf(std::uint32_t id) const {
    return {nameText_.data() + names_[id].begin, names_[id].length};
}

Tree::SectionId Tree::idOf(const Section* section) const {
    return static_cast<SectionId>(section - sections_.data());
}

template <class Visit>
void Tree::forEachChild(SectionId parent, const Visit& visit) const {
    for (SectionId id = sections_[parent].firstChild_; id != Section::none; id = sections_[id].nextSibling_)
        visit(nameOf(sections_[id].name_), id);
}

template <class Visit>
void Tree::forEachKeyword(SectionId parent, const Visit& visit) const {
    for (std::uint32_t run = sections_[parent].firstRun_; run != Section::none; run = runs_[run].next) {
        std::uint32_t head = runs_[run].firstCell;
        for (std::uint32_t i = 0; i < runs_[run].count; ++i) {
            visit(nameOf(cells_[head].name()), head);
            head += 1 + cells_[head].parameterCount();
        }
    }
}

const Section* Section::section(std::string_view name, int number) const {
    const Tree::SectionId id = tree_->idOf(this);
    const auto walk = [&](const Occurrences::Visitor& visit) { tree_->forEachChild(id, visit); };
    return nth(tree_->sections_, tree_->children_.of(id, name, walk), number);
}

const Cell* Section::keyword(std::string_view name, int number) const {
    const Tree::SectionId id = tree_->idOf(this);
    const auto walk = [&](const Occurrences::Visitor& visit) { tree_->forEachKeyword(id, visit); };
    return nth(tree_->cells_, tree_->keywords_.of(id, name, walk), number);
}

} // namespace kota::kvs
