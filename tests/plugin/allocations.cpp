#include "tests/plugin/allocations.h"

#include <cstdlib>
#include <new>

namespace {

int made = 0;
int held = 0;
int toSpare = 0;
int toFail = 0;

bool failsNow() {
    if (toFail == 0 || toSpare-- > 0)
        return false;
    toSpare = 0;
    --toFail;
    return true;
}

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

kota::test::FailingAllocations::FailingAllocations(int spared, int times) {
    toSpare = spared;
    toFail = times;
}
kota::test::FailingAllocations::~FailingAllocations() {
    toFail = 0;
}
bool kota::test::FailingAllocations::done() const {
    return toFail == 0;
}

void* operator new(std::size_t size) {
    void* const memory = failsNow() ? nullptr : std::malloc(size == 0 ? 1 : size);
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
