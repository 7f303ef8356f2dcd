#pragma once

#include <array>
#include <charconv>
#include <string_view>

// Numbers as the texts of cells: the shortest that reads back to the same number.
namespace kota::grid {

using NumberText = std::array<char, 32>;

// The text lives as long as `buffer`.
template <class Number>
std::string_view print(Number number, NumberText& buffer) {
    const auto result = std::to_chars(buffer.data(), buffer.data() + buffer.size(), number);
    return {buffer.data(), static_cast<std::size_t>(result.ptr - buffer.data())};
}

} // namespace kota::grid
