#pragma once

#include <memory>
#include <span>
#include <string>
#include <string_view>

namespace kota::kvs {

// A file's bytes, or why they could not be read.
struct LoadedText {
    std::unique_ptr<char[]> bytes; // `length` of them, and a NUL; null when `error` is not empty
    std::size_t length = 0;
    std::string error;
};

// Reads a regular file whole.
LoadedText loadText(const char* path);

// Appends `pieces` to the file at `path`, which is made when there is none. All or nothing: a file that was
// there keeps what it held when the writing fails, and a file that was empty or not there is at no moment
// seen with a part of the text. Gives why it failed, or an empty text.
std::string appendText(const char* path, std::span<const std::string_view> pieces);

} // namespace kota::kvs
