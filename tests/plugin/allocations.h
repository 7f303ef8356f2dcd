#pragma once

namespace kota::test {

// What the program, with all its libraries, has taken by `new` so far, and what of it is not given back.
int allocationsMade();
int allocationsHeld();

// Has `new` fail in the whole program, `times` times in a row behind some that are spared. No later than when
// the object goes, all is as before.
class FailingAllocations {
public:
    explicit FailingAllocations(int spared, int times = 1);
    ~FailingAllocations();
    FailingAllocations(const FailingAllocations&) = delete;
    FailingAllocations& operator=(const FailingAllocations&) = delete;

    // Whether all of them failed by now.
    bool done() const;
};

} // namespace kota::test
