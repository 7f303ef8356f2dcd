#pragma once

#include "tests/random/action.h"

#include <functional>

namespace kota::random_user {

// Whether a script still shows the fault.
using Fails = std::function<bool(const Script&)>;

// A short script that fails, made from one that does: no action can be dropped from it, and no argument be
// made simpler, that it would not cease to fail. With a `fails` that is asked `mostTries` times before that
// point, the shortest one so far.
Script shrunk(Script script, const Fails& fails, int mostTries = 3000);

// What an action may become to be simpler, the simplest first. Nothing leads back to the action.
std::vector<Action> simplerThan(const Action& action);

} // namespace kota::random_user
