#pragma once

#include <optional>
#include <string_view>

// Choice lists: entries that are each ended by a line feed or a carriage return and a line feed, which the
// last one may lack.
namespace kota::grid {

// Takes the first entry off `list`. None when the list is at its end.
std::optional<std::string_view> takeEntry(std::string_view& list);

// The entry at a place from 0.
std::optional<std::string_view> entryAt(std::string_view list, int index);

// The place of the entry that `text` means: the one that is equal, or else the only one that is so but for
// the case of the letters A to Z. -1 when there is none.
int entryMeantBy(std::string_view text, std::string_view list);

// The place of the first entry for which `is` holds, -1 when it holds for none.
template <class Predicate>
int findEntry(std::string_view list, Predicate is) {
    int place = 0;
    for (auto entry = takeEntry(list); entry; entry = takeEntry(list), ++place)
        if (is(*entry))
            return place;
    return -1;
}

} // namespace kota::grid
