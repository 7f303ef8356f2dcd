#pragma once

#include <algorithm>
#include <cstdint>
#include <cstring>
#include <string_view>

namespace kota::kvs {

// A hash of a short text: of its length and its first and last eight bytes.
inline std::uint32_t quickHash(std::string_view text) {
    std::uint64_t head = 0;
    std::uint64_t tail = 0;
    const std::size_t length = std::min(text.size(), sizeof head);
    std::memcpy(&head, text.data(), length);
    std::memcpy(&tail, text.data() + (text.size() - length), length);
    const std::uint64_t mixed = (head * 0x9E3779B97F4A7C15u) ^ (tail + text.size()) * 0xC2B2AE3D27D4EB4Fu;
    return static_cast<std::uint32_t>((mixed ^ mixed >> 29) * 0xBF58476D1CE4E5B9u >> 32);
}

} // namespace kota::kvs
