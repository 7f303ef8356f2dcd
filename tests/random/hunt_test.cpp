#include "tests/random/hunt.h"

#include "platform/framework/property_sheet.h"
#include "tests/random/generator.h"
#include "tests/random/invariants.h"

#include <gmock/gmock.h>

#include <cstdlib>
#include <sstream>
#include <tuple>

using namespace kota::random_user;
using testing::HasSubstr;
using testing::StartsWith;

namespace {

// Plays a script, and after each action looks for something that is no fault at all.
using Look = std::function<void(Stage& stage)>;

class AHunt : public testing::Test {
protected:
    // What a process leaves that crashes goes with the test.
    AHunt() { setenv("TMPDIR", folder.path().c_str(), 1); }
    ~AHunt() override { unsetenv("TMPDIR"); }

    Game gameWith(Look look) {
        return {.make = [this](std::uint64_t n) { return makeScript(seedOf(3, n), 40, surroundings); },
                .play = [this, look = std::move(look)](const Script& script,
                                                       Counts& taken) { return play(script, taken, look); }};
    }
    HuntResult result(const Game& game, std::uint64_t count = 60) { return hunt(game, count, log); }

    const kota::test::TempFolder folder;
    const Surroundings surroundings = lookAround();
    std::ostringstream log;

private:
    std::optional<std::string> play(const Script& script, Counts& taken, const Look& look) {
        try {
            Stage stage;
            Player player(stage, surroundings);
            for (const Action& action : script) {
                if (player.step(action))
                    ++taken[static_cast<std::size_t>(action.verb)];
                look(stage);
            }
            return std::nullopt;
        } catch (const Broken& broken) {
            return broken.what();
        }
    }
};

bool showsTwoLines(Stage& stage) {
    const CGXGridCore* const grid = stage.grid();
    return grid && stage.page()->GetCaption() == "Decay" && grid->GetRowCount() >= 2;
}

TEST_F(AHunt, FindsAndShrinksWhatIsBroken) {
    const Game game = gameWith([](Stage& stage) {
        if (showsTwoLines(stage))
            throw Broken("a grid has one line: it has more");
    });

    const HuntResult hunted = result(game);

    ASSERT_TRUE(hunted.found) << log.str();
    EXPECT_THAT(hunted.found->words, StartsWith("a grid has one line"));
    // To the tab, and a line for it: a file with two is as short as a key.
    EXPECT_EQ(hunted.found->script.size(), 2U) << print(hunted.found->script);
    EXPECT_THAT(print(hunted.found->script), HasSubstr("tab \"Decay\""));
    EXPECT_THAT(playApart(game, hunted.found->script).value_or(""), HasSubstr("a grid has one line"));
}

TEST_F(AHunt, FindsAndShrinksACrash) {
    const Game game = gameWith([](Stage& stage) {
        if (showsTwoLines(stage))
            std::abort();
    });

    const HuntResult hunted = result(game);

    ASSERT_TRUE(hunted.found) << log.str();
    EXPECT_THAT(hunted.found->words, HasSubstr("ended by signal 6"));
    EXPECT_EQ(hunted.found->script.size(), 2U) << print(hunted.found->script);
}

TEST_F(AHunt, TellsHowManyActionsWereTaken) {
    const HuntResult hunted = result(gameWith([](Stage&) {}), 10);

    ASSERT_FALSE(hunted.found) << hunted.found->words << print(hunted.found->script);
    EXPECT_EQ(hunted.played, 10U);
    EXPECT_GT(hunted.taken[static_cast<std::size_t>(Verb::Tab)], 0);
}

TEST_F(AHunt, SeesWhatTheEditorOffers) {
    EXPECT_THAT(surroundings.tabs, testing::IsSupersetOf({"Components", "Dispersion", "Decay"}));
    EXPECT_EQ(surroundings.tabs.size() + surroundings.emptyTabs.size(), 9U);
    EXPECT_GE(surroundings.listOfGrid.size(), 3U);
}

#if defined(__SANITIZE_ADDRESS__)
TEST_F(AHunt, FindsAndShrinksLostMemory) {
    const Game game = gameWith([](Stage& stage) {
        if (showsTwoLines(stage))
            std::ignore = new int(7);
    });

    const HuntResult hunted = result(game);

    ASSERT_TRUE(hunted.found) << log.str();
    EXPECT_THAT(hunted.found->words, HasSubstr("LeakSanitizer"));
    EXPECT_EQ(hunted.found->script.size(), 2U) << print(hunted.found->script);
}
#endif

} // namespace
