#pragma once

#include <cstdlib>

namespace kota::test {

// Included by a source with property tests: they draw the same cases in every run, unless the environment's
// RC_PARAMS asks for others (as "seed=5" or "max_success=10000").
inline const int sameCases = setenv("RC_PARAMS", "seed=20240311", 0);

} // namespace kota::test
