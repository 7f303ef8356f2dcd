#include "editing/base/number_form.h"

namespace {

// Takes the digits at the front and gives whether there were any.
bool takeDigits(std::string_view& rest) {
    const std::size_t digits = rest.find_first_not_of("0123456789");
    const std::size_t length = digits == std::string_view::npos ? rest.size() : digits;
    rest.remove_prefix(length);
    return length > 0;
}

bool takeOneOf(std::string_view& rest, std::string_view characters) {
    if (rest.empty() || characters.find(rest.front()) == std::string_view::npos)
        return false;
    rest.remove_prefix(1);
    return true;
}

} // namespace

bool isNumberText(std::string_view text) {
    takeOneOf(text, "+-");
    const bool whole = takeDigits(text);
    const bool point = takeOneOf(text, ".");
    if (point ? !takeDigits(text) : !whole)
        return false;
    if (takeOneOf(text, "Ee")) {
        takeOneOf(text, "+-");
        if (!takeDigits(text))
            return false;
    }
    return text.empty();
}
