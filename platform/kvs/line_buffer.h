#pragma once

#include <cstddef>
#include <functional>
#include <memory>

namespace kota::kvs {

// Gives the next bytes of a text: at most `room` of them, to `to`. How many there were; 0 at the end.
using ByteSource = std::function<std::size_t(char* to, std::size_t room)>;

// A text of which always one whole line is in memory, and never much more.
class LineBuffer {
public:
    explicit LineBuffer(ByteSource source);

    // Makes sure that the line that begins at `at` is in memory with its line feed, or with the end of the
    // text. Gives where the line begins now; whatever stood before it is gone. `at` is end() or before it;
    // the first line begins at end().
    const char* loadLine(const char* at);
    // The end of what is in memory: a NUL stands there. The end of the text, if no line feed stands before.
    const char* end() const { return end_; }

private:
    bool readMore();

    ByteSource source_;
    std::unique_ptr<char[]> buffer_;
    std::size_t size_;
    char* end_;
    bool exhausted_ = false;
};

} // namespace kota::kvs
