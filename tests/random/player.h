#pragma once

#include "tests/random/surroundings.h"

#include <optional>

namespace kota::random_user {

// Plays actions on a stage. What an action needs and the stage does not have (a window, a grid, a document
// that may be opened) makes it do nothing.
class Player {
public:
    Player(Stage& stage, const Surroundings& surroundings);
    ~Player();
    Player(const Player&) = delete;
    Player& operator=(const Player&) = delete;

    // Plays one action and looks at the system. Gives whether the action was taken; Broken when the system
    // does not hold what it should.
    bool step(const Action& action);
    // After the last one: what is saved, reopened and saved again is the same, and nothing is left when all
    // is closed.
    void finish();

private:
    bool play(const Action& action);
    void callBack(const std::string& moment);

    Stage& stage_;
    const Surroundings& surroundings_;
};

// Plays a whole script on a stage of its own. Gives what is broken, with the action at which it was seen.
// `taken` counts, verb by verb, the actions that were taken.
using Counts = std::array<int, verbCount>;
std::optional<std::string> playScript(const Script& script, const Surroundings& surroundings, Counts& taken);

} // namespace kota::random_user
