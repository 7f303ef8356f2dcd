#pragma once

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

    // Counts one more element of `name` in `family` and gives its group. The name's bytes must stay.
    Group count(Family family, std::string_view name);
    // Enters an element, as whatever number the caller knows it by, into its group.
    void place(Group group, std::uint32_t element);

    // The elements of a name in the order in which they were placed; empty when there are none.
    std::span<const std::uint32_t> elements(Family family, std::string_view name) const;

private:
    struct Name {
        const char* text;
        std::uint32_t length;
        Family family;
        bool is(Family otherFamily, std::string_view other) const {
            return family == otherFamily && std::string_view(text, length) == other;
        }
    };

    // The place of a name in `slots_`, or the empty one where it belongs.
    std::size_t slotOf(Family family, std::string_view name) const;
    void grow();
    void startPlacing();

    std::vector<Name> names_;           // by group
    std::vector<std::uint32_t> slots_;  // hash table of groups, a power of two long
    std::vector<std::uint32_t> ends_;   // by group: how many elements; then where its next or last one goes
    std::vector<std::uint32_t> places_; // all elements, group after group
    Group last_ = none;
    bool placing_ = false;
};

} // namespace kota::kvs
