#pragma once

#include <functional>

namespace bench {

struct Measured {
    double seconds = 0;
    double peakMegabytes = 0;  // of resident memory, the process as a whole
    double grownMegabytes = 0; // by how much the resident memory grew from before the work to after it
};

// Measures a piece of work in a process of its own, so that each run starts with the same fresh heap.
// `prepare` is run first, and its memory counts, but not its time; it gives the work. What the work makes is
// not freed within the time: it goes with the process.
Measured runCold(const std::function<std::function<void()>()>& prepare);

} // namespace bench
