#pragma once

#include "tests/random/isolated.h"
#include "tests/random/player.h"

#include <cstdint>
#include <iosfwd>

namespace kota::random_user {

// What is hunted in: how the n-th script is made, and how one is played. `play` gives what is broken, or
// nothing, and counts the actions that were taken.
struct Game {
    std::function<Script(std::uint64_t n)> make;
    std::function<std::optional<std::string>(const Script& script, Counts& taken)> play;
};

// A fault, with the shortest script that shows it.
struct Found {
    std::uint64_t number = 0; // of the script that showed it first
    Script script;
    std::string words; // what is broken, or what the sanitizers said
};

struct HuntResult {
    std::optional<Found> found;
    std::uint64_t played = 0; // scripts
    Counts taken = {};        // by verb
};

// Plays the scripts from 0 to below `count` in processes of their own, up to the first fault, which is
// shrunk. Tells what it does.
HuntResult hunt(const Game& game, std::uint64_t count, std::ostream& log);

// Plays one script in a process of its own. Nothing when all is well.
std::optional<std::string> playApart(const Game& game, const Script& script);

// By what two faults are the same one: the name of what is broken, or the kind of the crash.
std::string kindOf(const Ending& ending);

} // namespace kota::random_user
