#include "platform/kvs/tree.h"

#include "platform/kvs/lexicon.h"

#include <algorithm>

namespace kota::kvs {

namespace {

// A section's keywords and its sections are numbered apart: two families a section.
NameIndex::Family keywordsOf(Tree::SectionId section) {
    return section * 2;
}
NameIndex::Family sectionsOf(Tree::SectionId section) {
    return section * 2 + 1;
}

} // namespace

Tree::Tree(std::size_t textLength) {
    // Room for all that the text can hold, so that nothing is ever moved: no element is shorter than two
    // bytes. Memory that is never touched costs nothing.
    constexpr std::size_t most = std::size_t{1} << 28;
    cells_.reserve(std::min(textLength / 2 + 1, most));
    sections_.emplace_back(this, NameIndex::none);
}

Tree::SectionId Tree::addSection(SectionId parent, std::string_view name) {
    const auto id = static_cast<SectionId>(sections_.size());
    sections_.emplace_back(this, index_.count(sectionsOf(parent), name));
    return id;
}

void Tree::addKeyword(SectionId parent, std::string_view name) {
    endKeyword();
    lastKeyword_ = cells_.size();
    cells_.push_back(Cell::keyword(index_.count(keywordsOf(parent), name)));
}

void Tree::endKeyword() {
    if (!cells_.empty())
        cells_[lastKeyword_].setParameterCount(static_cast<std::uint32_t>(cells_.size() - lastKeyword_ - 1));
}

// River names and the like come again and again: a string that stood a little earlier is shared.
void Tree::addString(std::string_view value) {
    const auto letter = [&](std::size_t at) {
        return at < value.size() ? static_cast<unsigned char>(value[at]) : 0u;
    };
    const std::size_t kind = value.size() * 7 + letter(0) + letter(value.size() - 1);
    const CString*& recent = recentStrings_[kind % recentStrings_.size()];
    if (!recent || !sameName(recent->View(), value))
        recent = &strings_.emplace_back(value);
    addParameter(Cell::ofString(*recent));
}

void Tree::finish() {
    endKeyword();
    for (SectionId id = 1; id < sections_.size(); ++id)
        index_.place(sections_[id].group(), id);
    for (std::uint32_t head = 0; head < cells_.size(); head += 1 + cells_[head].parameterCount())
        index_.place(cells_[head].group(), head);
}

const Section* Section::section(std::string_view name, int number) const {
    const auto id = static_cast<Tree::SectionId>(this - tree_->sections_.data());
    const auto ids = tree_->index_.elements(sectionsOf(id), name);
    const auto place = static_cast<std::size_t>(number) - 1;
    return number >= 1 && place < ids.size() ? &tree_->sections_[ids[place]] : nullptr;
}

const Cell* Section::keyword(std::string_view name, int number) const {
    const auto id = static_cast<Tree::SectionId>(this - tree_->sections_.data());
    const auto heads = tree_->index_.elements(keywordsOf(id), name);
    const auto place = static_cast<std::size_t>(number) - 1;
    return number >= 1 && place < heads.size() ? &tree_->cells_[heads[place]] : nullptr;
}

} // namespace kota::kvs
