#include "platform/kvs/line_buffer.h"

#include <algorithm>
#include <cstring>
#include <utility>

namespace kota::kvs {

namespace {
constexpr std::size_t firstSize = std::size_t{1} << 18;
} // namespace

LineBuffer::LineBuffer(ByteSource source)
    : source_(std::move(source)), buffer_(std::make_unique_for_overwrite<char[]>(firstSize)),
      size_(firstSize), end_(buffer_.get()) {
    *end_ = '\0';
}

const char* LineBuffer::loadLine(const char* at) {
    auto length = static_cast<std::size_t>(end_ - at);
    if (std::memchr(at, '\n', length))
        return at;
    // Only the beginning of a line is there: it moves to the front, and what comes next is read behind it.
    std::memmove(buffer_.get(), at, length + 1);
    end_ = buffer_.get() + length;
    std::size_t searched = length;
    while (!exhausted_ && !std::memchr(buffer_.get() + searched, '\n', length - searched)) {
        searched = length;
        exhausted_ = !readMore();
        length = static_cast<std::size_t>(end_ - buffer_.get());
    }
    return buffer_.get();
}

bool LineBuffer::readMore() {
    const auto length = static_cast<std::size_t>(end_ - buffer_.get());
    if (length + 1 == size_) {
        size_ *= 2;
        auto larger = std::make_unique_for_overwrite<char[]>(size_);
        std::copy_n(buffer_.get(), length, larger.get());
        buffer_ = std::move(larger);
    }
    const std::size_t read = source_(buffer_.get() + length, size_ - length - 1);
    end_ = buffer_.get() + length + read;
    *end_ = '\0';
    return read > 0;
}

} // namespace kota::kvs
