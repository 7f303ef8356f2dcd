#pragma once

namespace kota::test {

// What the program, with all its libraries, has taken by `new` so far, and what of it is not given back.
int allocationsMade();
int allocationsHeld();

} // namespace kota::test
