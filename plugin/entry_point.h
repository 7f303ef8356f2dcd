#pragma once

#include <new>

// Does the work of an entry point, which has no other way to report a failed allocation than its null or zero
// result.
template <class Work>
auto orZero(const Work& work) -> decltype(work()) {
    try {
        return work();
    } catch (const std::bad_alloc&) {
        return decltype(work())();
    }
}
