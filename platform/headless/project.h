#pragma once

#include "exchange/packages/packages.h"

#include <deque>
#include <optional>
#include <string>
#include <vector>

namespace kota::headless {

// A place of a river, as a shell offers it.
struct Location {
    std::string riverName;
    double chainage = 0.0; // m
    double chainage2 = 0.0;
    std::int32_t dataType = 0;
};

// The project that a headless shell has open.
struct Project {
    std::intptr_t handle = 0; // 0: none is open
    std::vector<std::string> rivers;
    // The answers to the next requests for a location; none left: no location is offered.
    std::deque<Location> offers;
};

} // namespace kota::headless
