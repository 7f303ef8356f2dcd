#include "platform/grid/choice_list.h"

#include <algorithm>

namespace kota::grid {

namespace {

char lower(char letter) {
    return letter >= 'A' && letter <= 'Z' ? static_cast<char>(letter - 'A' + 'a') : letter;
}

bool equalButForCase(std::string_view left, std::string_view right) {
    return std::ranges::equal(left, right, {}, lower, lower);
}

} // namespace

std::optional<std::string_view> takeEntry(std::string_view& list) {
    if (list.empty())
        return std::nullopt;
    const std::size_t end = std::min(list.find('\n'), list.size());
    std::string_view entry = list.substr(0, end);
    if (end < list.size() && entry.ends_with('\r'))
        entry.remove_suffix(1);
    list.remove_prefix(std::min(end + 1, list.size()));
    return entry;
}

std::optional<std::string_view> entryAt(std::string_view list, int index) {
    for (auto entry = takeEntry(list); entry; entry = takeEntry(list))
        if (index-- == 0)
            return entry;
    return std::nullopt;
}

int entryMeantBy(std::string_view text, std::string_view list) {
    const int exact = findEntry(list, [text](std::string_view entry) { return entry == text; });
    if (exact >= 0)
        return exact;
    int count = 0;
    int place = -1;
    findEntry(list, [&, at = 0](std::string_view entry) mutable {
        if (equalButForCase(entry, text)) {
            ++count;
            place = at;
        }
        ++at;
        return false;
    });
    return count == 1 ? place : -1;
}

} // namespace kota::grid
