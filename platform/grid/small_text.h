#pragma once

#include <array>
#include <cstddef>
#include <cstring>
#include <string_view>

namespace kota::grid {

// The text of a cell in 16 bytes: up to 15 bytes stand in it, a longer text on the heap. Never set is not
// the same as set to "".
class SmallText {
public:
    SmallText() noexcept = default;
    explicit SmallText(std::string_view text) {
        if (text.size() > capacity) {
            putOnHeap(text);
            return;
        }
        text.copy(bytes_.data(), text.size()); // which may be none, from nowhere
        bytes_[capacity] = static_cast<char>(text.size());
    }
    SmallText(SmallText&& other) noexcept : bytes_(other.bytes_) { other.forget(); }
    SmallText& operator=(SmallText&& other) noexcept {
        if (this == &other)
            return *this;
        if (tag() == onHeap)
            release();
        bytes_ = other.bytes_;
        other.forget();
        return *this;
    }
    SmallText(const SmallText&) = delete;
    SmallText& operator=(const SmallText&) = delete;
    ~SmallText() {
        if (tag() == onHeap)
            release();
    }

    bool isSet() const { return tag() != neverSet; }
    // Empty when never set. Valid until the text is changed or moved.
    std::string_view view() const {
        if (tag() == onHeap)
            return viewOfHeap();
        return {bytes_.data(), isSet() ? static_cast<std::size_t>(tag()) : 0};
    }

private:
    static constexpr std::size_t capacity = 15;
    static constexpr char onHeap = 16;
    static constexpr char neverSet = 17;

    // The last byte: the length of a short text, or one of the two above.
    char tag() const { return bytes_[capacity]; }
    void forget() { bytes_[capacity] = neverSet; }
    char* heapBlock() const;
    void putOnHeap(std::string_view text);
    std::string_view viewOfHeap() const;
    void release();

    alignas(std::size_t) std::array<char, capacity + 1> bytes_{0, 0, 0, 0, 0, 0, 0, 0,
                                                               0, 0, 0, 0, 0, 0, 0, neverSet};
};

static_assert(sizeof(SmallText) == 16);

} // namespace kota::grid
