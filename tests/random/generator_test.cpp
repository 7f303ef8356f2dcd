#include "tests/random/generator.h"

#include <gtest/gtest.h>

#include <array>

using namespace kota::random_user;

namespace {

const Surroundings surroundings{.tabs = {"Decay"}, .emptyTabs = {"Later"}, .listOfGrid = {}};

TEST(TheGenerator, WritesTheSameScriptForASeed) {
    EXPECT_EQ(makeScript(5, 30, surroundings), makeScript(5, 30, surroundings));
    EXPECT_NE(makeScript(5, 30, surroundings), makeScript(6, 30, surroundings));
    EXPECT_NE(seedOf(1, 2), seedOf(2, 1));
}

TEST(TheGenerator, UsesEveryVerb) {
    std::array<int, verbCount> used = {};
    for (std::uint64_t seed = 0; seed < 200; ++seed)
        for (const Action& action : makeScript(seed, 30, surroundings))
            ++used[static_cast<std::size_t>(action.verb)];
    for (std::size_t i = 0; i < used.size(); ++i)
        EXPECT_GT(used[i], 0) << formOf(static_cast<Verb>(i)).name;
}

// An editor whose every page is empty, as long as it is.
TEST(TheGenerator, NeedsNoTabs) {
    const Surroundings empty{};
    EXPECT_GE(makeScript(5, 30, empty).size(), 30U);
}

} // namespace
