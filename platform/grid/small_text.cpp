#include "platform/grid/small_text.h"

namespace kota::grid {

// A text on the heap: its length, then its bytes.
void SmallText::putOnHeap(std::string_view text) {
    const std::size_t length = text.size();
    char* const block = new char[sizeof length + length];
    std::memcpy(block, &length, sizeof length);
    std::memcpy(block + sizeof length, text.data(), length);
    std::memcpy(bytes_.data(), &block, sizeof block);
    bytes_[capacity] = onHeap;
}

std::string_view SmallText::viewOfHeap() const {
    const char* const block = heapBlock();
    std::size_t length = 0;
    std::memcpy(&length, block, sizeof length);
    return {block + sizeof length, length};
}

char* SmallText::heapBlock() const {
    char* block = nullptr;
    std::memcpy(&block, bytes_.data(), sizeof block);
    return block;
}

void SmallText::release() {
    delete[] heapBlock();
}

} // namespace kota::grid
