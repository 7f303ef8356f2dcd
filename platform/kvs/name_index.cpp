#include "platform/kvs/name_index.h"

#include <functional>

namespace kota::kvs {

NameIndex::Group NameIndex::count(Family family, std::string_view name) {
    // Most elements bear the name of the one before.
    if (last_ == none || !names_[last_].is(family, name)) {
        if (names_.size() * 2 >= slots_.size())
            grow();
        Group& slot = slots_[slotOf(family, name)];
        if (slot == none) {
            slot = static_cast<Group>(names_.size());
            names_.push_back({name.data(), static_cast<std::uint32_t>(name.size()), family});
            ends_.push_back(0);
        }
        last_ = slot;
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
    if (slots_.empty())
        return {};
    const Group group = slots_[slotOf(family, name)];
    if (group == none)
        return {};
    // Each group ends where the next begins.
    const std::uint32_t begin = group == 0 ? 0 : ends_[group - 1];
    return std::span(places_).subspan(begin, ends_[group] - begin);
}

std::size_t NameIndex::slotOf(Family family, std::string_view name) const {
    const std::size_t mask = slots_.size() - 1;
    std::size_t slot = (std::hash<std::string_view>()(name) + family * 0x9E3779B97F4A7C15u) & mask;
    while (slots_[slot] != none && !names_[slots_[slot]].is(family, name))
        slot = (slot + 1) & mask;
    return slot;
}

void NameIndex::grow() {
    slots_.assign(slots_.empty() ? 64 : slots_.size() * 4, none);
    for (Group group = 0; group < names_.size(); ++group)
        slots_[slotOf(names_[group].family, {names_[group].text, names_[group].length})] = group;
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
