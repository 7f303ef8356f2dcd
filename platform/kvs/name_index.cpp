#include "platform/kvs/name_index.h"

#include <functional>

namespace kota::kvs {

NameIndex::Group NameIndex::count(Family family, std::string_view name) {
    if (find(family, name) == none) {
        if (names_.size() * 2 >= slots_.size())
            grow();
        last_ = static_cast<Group>(names_.size());
        slots_[slotOf(family, name)] = last_;
        names_.push_back(
            {static_cast<std::uint32_t>(text_.size()), static_cast<std::uint32_t>(name.size()), family});
        text_.insert(text_.end(), name.begin(), name.end());
        ends_.push_back(0);
    }
    ++ends_[last_];
    return last_;
}

void NameIndex::place(Group group, std::uint32_t element) {
    if (!placing_)
        startPlacing();
    places_[ends_[group]++] = element;
}

std::span<const std::uint32_t> NameIndex::elements(Family family, std::string_view name) const {
    const Group group = find(family, name);
    if (group == none)
        return {};
    // Each group ends where the next begins.
    const std::uint32_t begin = group == 0 ? 0 : ends_[group - 1];
    return std::span(places_).subspan(begin, ends_[group] - begin);
}

NameIndex::Group NameIndex::find(Family family, std::string_view name) const {
    if (last_ != none && is(last_, family, name))
        return last_;
    if (slots_.empty())
        return none;
    const Group found = slots_[slotOf(family, name)];
    if (found != none)
        last_ = found;
    return found;
}

std::size_t NameIndex::slotOf(Family family, std::string_view name) const {
    const std::size_t mask = slots_.size() - 1;
    std::size_t slot = (std::hash<std::string_view>()(name) + family * 0x9E3779B97F4A7C15u) & mask;
    while (slots_[slot] != none && !is(slots_[slot], family, name))
        slot = (slot + 1) & mask;
    return slot;
}

void NameIndex::grow() {
    slots_.assign(slots_.empty() ? 64 : slots_.size() * 4, none);
    for (Group group = 0; group < names_.size(); ++group)
        slots_[slotOf(names_[group].family, textOf(names_[group]))] = group;
}

void NameIndex::startPlacing() {
    std::uint32_t begin = 0;
    for (std::uint32_t& end : ends_) {
        const std::uint32_t counted = end;
        end = begin;
        begin += counted;
    }
    places_.resize(begin);
    placing_ = true;
}

} // namespace kota::kvs
