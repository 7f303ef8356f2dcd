#include "tests/random/shrinker.h"

#include "tests/random/generator.h"

#include <gtest/gtest.h>

#include <algorithm>

using namespace kota::random_user;

namespace {

const Surroundings surroundings{.tabs = {"Decay"}, .emptyTabs = {"Later"}, .listOfGrid = {}};

// A fault of a little model: it counts the lines of a grid, and forgets one where three are deleted after a 7
// was typed.
bool forgetsALine(const Script& script) {
    bool isTyped = false;
    int deleted = 0;
    for (const Action& action : script) {
        isTyped = isTyped || (action.verb == Verb::Type && action.texts[0].find('7') != std::string::npos);
        deleted += isTyped && action.verb == Verb::Line && action.numbers[0] >= 3;
    }
    return deleted >= 3;
}

TEST(TheShrinker, LeavesWhatShowsTheFaultAndNothingElse) {
    const Script shortest = parseScript("type \"7\"\nline 3\nline 3\nline 3\n");
    int faults = 0;
    for (std::uint64_t seed = 0; seed < 1000; ++seed) {
        const Script script = makeScript(seed, 150, surroundings);
        if (!forgetsALine(script))
            continue;
        ++faults;
        EXPECT_EQ(print(shrunk(script, forgetsALine)), print(shortest));
    }
    EXPECT_GT(faults, 10);
}

TEST(TheShrinker, TakesAnActionOutOfTheShellsHands) {
    const auto saves = [](const Script& script) {
        return std::ranges::any_of(script, [](const Action& action) {
            return action.verb == Verb::Save ||
                   (action.verb == Verb::When && action.inner.front().verb == Verb::Save);
        });
    };
    EXPECT_EQ(print(shrunk(parseScript("when 503 save\nnew\n"), saves)), "save\n");
}

TEST(TheShrinker, KeepsAScriptOfWhichNothingCanGo) {
    const Script script = parseScript("new\nsave\n");
    EXPECT_EQ(shrunk(script, [&](const Script& candidate) { return candidate == script; }), script);
}

TEST(TheShrinker, StopsWhenItHasTriedOftenEnough) {
    int tries = 0;
    const Script script = makeScript(1, 50, surroundings);
    shrunk(
        script,
        [&](const Script&) {
            ++tries;
            return false;
        },
        10);
    EXPECT_EQ(tries, 10);
}

TEST(TheShrinker, ComesToAnEndWithAnyAction) {
    for (std::uint64_t seed = 0; seed < 20; ++seed)
        for (const Action& action : makeScript(seed, 30, surroundings)) {
            const Verb verb = action.verb;
            const Script simplest = shrunk({action}, [&](const Script& script) {
                return script.size() == 1 && script.front().verb == verb;
            });
            ASSERT_EQ(simplest.size(), 1U) << print(action);
            for (const Action& simpler : simplerThan(simplest.front()))
                EXPECT_NE(simpler.verb, verb) << print(simplest) << print(simpler);
        }
}

} // namespace
