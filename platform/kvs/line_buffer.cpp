#include "platform/kvs/line_buffer.h"

#include <algorithm>
#include <cstring>
#include <utility>

namespace kota::kvs {

namespace {
constexpr std::size_t firstSize = std::size_t{1} << 18;
} // namespace

LineBuffer::LineBuffer(ByteSource source)
    : source_(std::move(source)), buffer_(firstSize), end_(buffer_.data()) {
    *end_ = '\0';
}

const char* LineBuffer::loadLine(const char* at) {
    auto length = static_cast<std::size_t>(end_ - at);
    if (std::memchr(at, '\n', length))
        return at;
    // Only the beginning of a line is there: it moves to the front, and what comes next is read behind it.
    std::memmove(buffer_.data(), at, length + 1);
    end_ = buffer_.data() + length;
    std::size_t searched = length;
    while (!exhausted_ && !std::memchr(buffer_.data() + searched, '\n', length - searched)) {
        searched = length;
        exhausted_ = !readMore();
        length = static_cast<std::size_t>(end_ - buffer_.data());
    }
    return buffer_.data();
}

bool LineBuffer::readMore() {
    const auto length = static_cast<std::size_t>(end_ - buffer_.data());
    if (length + 1 == buffer_.size())
        buffer_.resize(buffer_.size() * 2);
    const std::size_t read = source_(buffer_.data() + length, buffer_.size() - length - 1);
    end_ = buffer_.data() + length + read;
    *end_ = '\0';
    return read > 0;
}

} // namespace kota::kvs
