#pragma once

#include "tests/random/surroundings.h"

#include <cstdint>

namespace kota::random_user {

// The script of a seed: the same one on every machine, as long as the editor offers the same tabs. About
// `steps` actions, in phrases such as "type something and leave the cell".
Script makeScript(std::uint64_t seed, int steps, const Surroundings& surroundings);

// The seed of the n-th script of a run.
std::uint64_t seedOf(std::uint64_t seed, std::uint64_t n);

} // namespace kota::random_user
