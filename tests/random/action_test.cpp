#include "tests/random/generator.h"

#include <gmock/gmock.h>

#include <stdexcept>

using namespace kota::random_user;
using testing::HasSubstr;
using testing::IsEmpty;

namespace {

std::string wordsOfFailure(std::string_view line) {
    try {
        parseAction(line);
    } catch (const std::invalid_argument& failure) {
        return failure.what();
    }
    return {};
}

TEST(AnAction, IsOneLineThatAPersonCanWrite) {
    const Action edit{.verb = Verb::Edit, .numbers = {2, 4}, .texts = {"1e3"}};
    const Action search{.verb = Verb::Search, .numbers = {1, 2}, .texts = {"PLATTE", "12", "ok"}};
    const Action when{.verb = Verb::When, .texts = {"503"}, .inner = {edit}};

    EXPECT_EQ(print(edit), "edit 2 4 \"1e3\"");
    EXPECT_EQ(print(search), "search \"PLATTE\" \"12\" 1 2 ok");
    EXPECT_EQ(print(when), "when 503 edit 2 4 \"1e3\"");
    EXPECT_EQ(parseAction("  edit  2 4\t\"1e3\" "), edit);
    EXPECT_EQ(parseAction(print(search)), search);
    EXPECT_EQ(parseAction(print(when)), when);
}

TEST(AnAction, KeepsEveryByteOfItsTexts) {
    const Action clipboard{.verb = Verb::Clipboard, .texts = {"a\tb\r\n\"\\\x01\x7f\xff å"}};

    EXPECT_EQ(print(clipboard), "clipboard \"a\\tb\\r\\n\\\"\\\\\\x01\\x7F\xff å\"");
    EXPECT_EQ(parseAction(print(clipboard)), clipboard);
}

TEST(AnAction, SaysWhatIsWrongWithIt) {
    EXPECT_THAT(wordsOfFailure("dance"), HasSubstr("no such action at: dance"));
    EXPECT_THAT(wordsOfFailure("cell 1"), HasSubstr("a word is missing"));
    EXPECT_THAT(wordsOfFailure("cell 1 x"), HasSubstr("no number at: x"));
    EXPECT_THAT(wordsOfFailure("cell 1 2 3"), HasSubstr("the action has ended at: 3"));
    EXPECT_THAT(wordsOfFailure("type a"), HasSubstr("a text in quotes is missing"));
    EXPECT_THAT(wordsOfFailure("type \"a"), HasSubstr("a text has no end"));
    EXPECT_THAT(wordsOfFailure("type \"\\x1\""), HasSubstr("two digits are missing"));
}

TEST(AScript, IsReadAsItWasPrinted) {
    const Surroundings surroundings{.tabs = {"Decay"}, .emptyTabs = {"Later"}, .listOfGrid = {}};
    for (std::uint64_t seed = 0; seed < 200; ++seed) {
        const Script script = makeScript(seed, 30, surroundings);
        EXPECT_EQ(parseScript(print(script)), script) << print(script);
    }
}

TEST(AScript, MayHaveCommentsAndEmptyLines) {
    EXPECT_THAT(parseScript(""), IsEmpty());
    EXPECT_EQ(parseScript("# how it began\n\nnew\n  # and ended\r\nsave"),
              (Script{{.verb = Verb::New}, {.verb = Verb::Save}}));
}

} // namespace
