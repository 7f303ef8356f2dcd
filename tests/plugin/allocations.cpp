#include "tests/plugin/allocations.h"

#include <cstdlib>
#include <new>

namespace {

int made = 0;
int held = 0;

void giveBack(void* memory) {
    if (memory)
        --held;
    std::free(memory);
}

} // namespace

int kota::test::allocationsMade() {
    return made;
}
int kota::test::allocationsHeld() {
    return held;
}

void* operator new(std::size_t size) {
    void* const memory = std::malloc(size == 0 ? 1 : size);
    if (!memory)
        throw std::bad_alloc();
    ++made;
    ++held;
    return memory;
}
void operator delete(void* memory) noexcept {
    giveBack(memory);
}
void operator delete(void* memory, std::size_t) noexcept {
    giveBack(memory);
}
