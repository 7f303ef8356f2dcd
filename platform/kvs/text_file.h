#pragma once

#include <cstddef>
#include <cstdio>
#include <memory>
#include <span>
#include <string>
#include <string_view>

namespace kota::kvs {

// A regular file that is read from the front to the back.
class InputFile {
public:
    // Gives why the file cannot be read, or an empty text.
    std::string open(const char* path);
    std::size_t size() const { return size_; }
    // The next bytes, at most `room` of them. How many; 0 at the end, and when reading fails.
    std::size_t read(char* to, std::size_t room);
    // Why reading failed, or an empty text.
    std::string error() const;

private:
    struct Close {
        void operator()(std::FILE* file) const { std::fclose(file); }
    };

    std::string path_;
    std::unique_ptr<std::FILE, Close> file_;
    std::size_t size_ = 0;
    int error_ = 0;
};

// Appends `pieces` to the file at `path`, which is made when there is none. All or nothing: a file that was
// there keeps what it held when the writing fails, and a file that was empty or not there is at no moment
// seen with a part of the text. Gives why it failed, or an empty text.
std::string appendText(const char* path, std::span<const std::string_view> pieces);

} // namespace kota::kvs
