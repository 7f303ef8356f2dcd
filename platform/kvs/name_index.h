#pragma once

#include "platform/kvs/lexicon.h"

#include <cstdint>
#include <span>
#include <string_view>
#include <vector>

namespace kota::kvs {

// Finds the n-th element of a name at the same cost for every n.
//
// The elements of one name in one family (the keywords, or the sections, of one section) are a group. Used
// in three steps: `count` every element once, in file order; `place` every element once, in the same order;
// then ask.
class NameIndex {
public:
    using Group = std::uint32_t;
    using Family = std::uint32_t;
    static constexpr Group none = 0xFFFFFFFF;

    // Counts one more element of `name` in `family` and gives its group.
    Group count(Family family, std::string_view name);
    // Enters an element, as whatever number the caller knows it by, into its group.
    void place(Group group, std::uint32_t element);

    // The elements of a name in the order in which they were placed; empty when there are none.
    std::span<const std::uint32_t> elements(Family family, std::string_view name) const;

private:
    struct Name {
        std::uint32_t begin; // in `text_`
        std::uint32_t length;
        Family family;
    };

    std::string_view textOf(const Name& name) const { return {text_.data() + name.begin, name.length}; }
    bool is(Group group, Family family, std::string_view name) const {
        return names_[group].family == family && sameName(textOf(names_[group]), name);
    }
    Group find(Family family, std::string_view name) const;
    // The place of a name in `slots_`, or the empty one where it belongs.
    std::size_t slotOf(Family family, std::string_view name) const;
    void grow();
    void startPlacing();

    std::vector<char> text_;            // of all names, one behind the other
    std::vector<Name> names_;           // by group
    std::vector<std::uint32_t> slots_;  // hash table of groups, a power of two long
    std::vector<std::uint32_t> ends_;   // by group: how many elements; then where its next or last one goes
    std::vector<std::uint32_t> places_; // all elements, group after group
    mutable Group last_ = none;         // the one asked for last: the next is often the same
    bool placing_ = false;
};

} // namespace kota::kvs
