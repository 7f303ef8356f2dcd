#pragma once

#include "tests/random/stage.h"

namespace kota::random_user {

// How each verb is played, but for those that ask more than the stage (When, Settle, UndoRedo). Each gives
// whether the action was taken.
using Play = bool (*)(Stage& stage, const Action& action);

// Null for a verb that is not played here. In grid_plays.cpp, window_plays.cpp and shell_plays.cpp.
Play gridPlayOf(Verb verb);
Play windowPlayOf(Verb verb);
Play shellPlayOf(Verb verb);

// A place from 1 to `count`, for any number: 1 is the first, `count` + 1 the first again. `count` is not 0.
int wrapped(int number, std::size_t count);

// Runs a command of the main window's menu, by its name in a script.
bool playCommand(Stage& stage, const std::string& name);
// Presses a key, as "Tab", "Ctrl+Shift+Z" or "F7".
bool pressKey(const std::string& name);

// What `playCommand` and `pressKey` know.
std::vector<std::string> commandNames();
std::vector<std::string> keyNames();

} // namespace kota::random_user
