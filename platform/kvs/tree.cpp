#include "platform/kvs/tree.h"

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

Tree::Tree(std::unique_ptr<char[]> text, std::size_t length) : text_(std::move(text)), length_(length) {
    // Room for all that the text can hold, so that nothing is ever moved: each '=' begins a keyword with one
    // parameter, each ',' brings one more, and no two elements fit into fewer than four bytes. Memory that is
    // never touched costs nothing.
    const char* begin = text_.get();
    const auto count = [&](char c) {
        return static_cast<std::size_t>(std::count(begin, begin + length_, c));
    };
    cells_.reserve(std::min(2 * count('=') + count(','), length_ / 2 + 1));
    sections_.emplace_back(this, NameIndex::none);
}

char* Tree::roomForDecoded() {
    if (!decoded_) {
        decoded_ = std::make_unique_for_overwrite<char[]>(length_);
        decodedEnd_ = decoded_.get();
    }
    return decodedEnd_;
}

Tree::SectionId Tree::addSection(SectionId parent, std::string_view name) {
    const auto id = static_cast<SectionId>(sections_.size());
    sections_.emplace_back(this, index_.count(sectionsOf(parent), name));
    return id;
}

void Tree::addKeyword(SectionId parent, std::string_view name) {
    lastKeyword_ = cells_.size();
    cells_.push_back(Cell::keyword(index_.count(keywordsOf(parent), name)));
}

void Tree::addParameter(Cell parameter) {
    cells_.push_back(parameter);
    cells_[lastKeyword_].countParameter();
}

void Tree::finish() {
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

const Cell* parameter(const Cell* keyword, int place) {
    const bool exists =
        keyword && place >= 1 && static_cast<std::uint32_t>(place) <= keyword->parameterCount();
    return exists ? keyword + place : nullptr;
}

} // namespace kota::kvs
