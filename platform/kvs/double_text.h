#pragma once

namespace kota::kvs {

// How long the text of a double is at the most.
inline constexpr int longestDouble = 32;

// Writes the shortest text that reads back to the same bits, always with a point or an exponent: "227000.0",
// "1e-05", "nan", "-inf". As std::to_chars, but for the ".0". Gives the text's end; `to` has room for
// longestDouble bytes.
char* writeDouble(char* to, double value);

} // namespace kota::kvs
