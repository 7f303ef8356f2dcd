#include "tests/platform/kvs/kvs_files.h"

#include <gmock/gmock.h>

// What the reader takes as a file.
namespace {

using namespace kvs_test;

class Form : public FileLibrary {};

TEST_F(Form, ATargetHoldsSectionsAndASectionHoldsSectionsAndKeywords) {
    const Loaded loaded(R"(
        target KOTA0_AD {
          section Outer {
            first = 1
            section Inner {
              second = 2
            }
            third = 3
          }
        })");

    void* const outer = kvsSectionByNameNum(loaded.target("KOTA0_AD"), "Outer", 1);
    void* const inner = kvsSectionByNameNum(outer, "Inner", 1);
    EXPECT_EQ(kvsGetInt(kvsParamByNum(kvsKeywordByNameNum(outer, "first", 1), 1)), 1);
    EXPECT_EQ(kvsGetInt(kvsParamByNum(kvsKeywordByNameNum(inner, "second", 1), 1)), 2);
    EXPECT_EQ(kvsGetInt(kvsParamByNum(kvsKeywordByNameNum(outer, "third", 1), 1)), 3);
    EXPECT_EQ(kvsKeywordByNameNum(outer, "second", 1), nullptr);
    EXPECT_EQ(kvsKeywordByNameNum(inner, "first", 1), nullptr);
}

TEST_F(Form, AFileMayHoldNothing) {
    for (const char* text : {"", "\n\n", "   ", "# nothing\n# at all", "\xEF\xBB\xBF", "\r\n"}) {
        const Loaded loaded(text);
        EXPECT_FALSE(loaded.failed()) << loaded.error().text;
        EXPECT_EQ(loaded.target(), nullptr);
    }
}

TEST_F(Form, TargetAndSectionMayBeEmpty) {
    const Loaded loaded("target T{section S{}}target U{}");

    EXPECT_FALSE(loaded.failed());
    EXPECT_NE(kvsSectionByNameNum(loaded.target("T"), "S", 1), nullptr);
    EXPECT_NE(loaded.target("U"), nullptr);
}

TEST_F(Form, CommentsRunToTheEndOfTheLineWhereverTheyStand) {
    const LoadedSection loaded("# alone }\n"
                               "a = 1 # behind a value\n"
                               "b = # behind nothing\n"
                               "c = 1, # behind a comma, \"\n"
                               "# between { the lines\n"
                               "    2\n"
                               "section Inner # behind a name\n"
                               "# before the brace\n"
                               "{ # behind the brace\n"
                               "} # behind the end");

    EXPECT_EQ(loaded.parameterCount("a"), 1);
    EXPECT_EQ(loaded.parameterCount("b"), 0);
    EXPECT_EQ(loaded.parameterCount("c"), 2);
    EXPECT_NE(kvsSectionByNameNum(loaded.section(), "Inner", 1), nullptr);
}

TEST_F(Form, AHashInAStringIsNoComment) {
    const LoadedValue loaded("\"a # b\" # c");

    EXPECT_EQ(stringOf(loaded.get()), "a # b");
}

TEST_F(Form, ALineThatEndsInACommaGoesOnInTheNext) {
    const LoadedSection loaded("list = 1,\n"
                               "\n"
                               "       2,   \t\r\n"
                               "       # and\n"
                               "       3\n"
                               "next = 4");

    EXPECT_EQ(loaded.parameterCount("list"), 3);
    EXPECT_EQ(kvsGetInt(loaded.parameter("list", 3)), 3);
    EXPECT_EQ(kvsGetInt(loaded.parameter("next")), 4);
}

TEST_F(Form, AKeywordMayHaveNoValue) {
    const LoadedSection loaded("a =\nb=\nc = 1");

    EXPECT_NE(loaded.keyword("a"), nullptr);
    EXPECT_EQ(loaded.parameterCount("a"), 0);
    EXPECT_NE(loaded.keyword("b"), nullptr);
    EXPECT_EQ(loaded.parameterCount("c"), 1);
}

TEST_F(Form, BlanksAndTabsAreWhereOneLikesOrNowhere) {
    const LoadedSection loaded("\t a\t=\t1 \t,\t2\t\nb=1,2\n  \t  \n");

    EXPECT_EQ(loaded.parameterCount("a"), 2);
    EXPECT_EQ(loaded.parameterCount("b"), 2);
}

TEST_F(Form, LinesMayEndInCarriageReturnAndLineFeed) {
    const Loaded loaded("target T {\r\nsection S {\r\na = 1,\r\n2\r\nb = \"x\"\r\nc =\r\n# d\r\n}\r\n}\r\n");

    EXPECT_FALSE(loaded.failed()) << loaded.error().text;
    void* const section = kvsSectionByNameNum(loaded.target(), "S", 1);
    EXPECT_EQ(kvsGetInt(kvsParamByNum(kvsKeywordByNameNum(section, "a", 1), 2)), 2);
    EXPECT_EQ(stringOf(kvsParamByNum(kvsKeywordByNameNum(section, "b", 1), 1)), "x");
    EXPECT_EQ(kvsParamByNum(kvsKeywordByNameNum(section, "c", 1), 1), nullptr);
}

TEST_F(Form, AByteOrderMarkMayStandInFront) {
    const Loaded loaded("\xEF\xBB\xBFtarget T {\n}\n");

    EXPECT_FALSE(loaded.failed());
    EXPECT_NE(loaded.target(), nullptr);
}

TEST_F(Form, TheLastLineNeedsNoEnd) {
    EXPECT_FALSE(Loaded("target T {\n}").failed());
    EXPECT_FALSE(Loaded("target T {\n} # the end").failed());
}

TEST_F(Form, ANameIsALetterOrUnderscoreAndLettersDigitsUnderscoresPointsAndHyphens) {
    const LoadedSection loaded("a = 1\nZ9 = 2\n_ = 3\na.b-c_9 = 4\n_.- = 5");

    EXPECT_EQ(kvsGetInt(loaded.parameter("a")), 1);
    EXPECT_EQ(kvsGetInt(loaded.parameter("Z9")), 2);
    EXPECT_EQ(kvsGetInt(loaded.parameter("_")), 3);
    EXPECT_EQ(kvsGetInt(loaded.parameter("a.b-c_9")), 4);
    EXPECT_EQ(kvsGetInt(loaded.parameter("_.-")), 5);
    for (const char* name : {"9", "9a", "-a", ".a", "a b", "a/b", "\xC3\xA5", "a:", ""})
        EXPECT_TRUE(Loaded("target T {\nsection S {\n" + std::string(name) + " = 1\n}\n}").failed()) << name;
}

TEST_F(Form, AnyOtherNameStandsInQuotes) {
    const Loaded loaded(R"(target "a target" { section "" { "9" = 1
                        "\xC3\xA5\t\"" = 2
                        "\x41" = 3 } })");

    void* const section = kvsSectionByNameNum(loaded.target("a target"), "", 1);
    EXPECT_EQ(kvsGetInt(kvsParamByNum(kvsKeywordByNameNum(section, "9", 1), 1)), 1);
    EXPECT_EQ(kvsGetInt(kvsParamByNum(kvsKeywordByNameNum(section, "\xC3\xA5\t\"", 1), 1)), 2);
    EXPECT_EQ(kvsGetInt(kvsParamByNum(kvsKeywordByNameNum(section, "A", 1), 1)), 3);
}

TEST_F(Form, NamesDifferByCase) {
    const LoadedSection loaded("Data = 1");

    EXPECT_NE(loaded.keyword("Data"), nullptr);
    EXPECT_EQ(loaded.keyword("DATA"), nullptr);
    EXPECT_EQ(loaded.keyword("Dat"), nullptr);
    EXPECT_EQ(loaded.keyword("Data1"), nullptr);
}

TEST_F(Form, TargetAndSectionAreKeywordsWhenAnEqualsSignFollows) {
    const LoadedSection loaded("target = 1\nsection = 2\nsection=3\n\"section\" = 4");

    EXPECT_EQ(kvsGetInt(loaded.parameter("target")), 1);
    EXPECT_EQ(kvsGetInt(kvsParamByNum(loaded.keyword("section", 1), 1)), 2);
    EXPECT_EQ(kvsGetInt(kvsParamByNum(loaded.keyword("section", 2), 1)), 3);
    EXPECT_EQ(kvsGetInt(kvsParamByNum(loaded.keyword("section", 3), 1)), 4);
}

TEST_F(Form, TargetAndSectionAreNamesOfTargetsAndSectionsToo) {
    const Loaded loaded("target target { section section { section target { } } }");

    void* const section = kvsSectionByNameNum(loaded.target("target"), "section", 1);
    EXPECT_NE(kvsSectionByNameNum(section, "target", 1), nullptr);
}

std::string nested(int braces) {
    std::string text = "target T {\n";
    for (int brace = 1; brace < braces; ++brace)
        text += "section s {\n";
    for (int brace = 0; brace < braces; ++brace)
        text += "}\n";
    return text;
}

TEST_F(Form, SixtyFourBracesMayStandInEachOther) {
    const Loaded loaded(nested(64));

    EXPECT_FALSE(loaded.failed());
    void* section = loaded.target();
    for (int depth = 2; depth <= 64; ++depth)
        section = kvsSectionByNameNum(section, "s", 1);
    EXPECT_NE(section, nullptr);
    EXPECT_EQ(kvsSectionByNameNum(section, "s", 1), nullptr);
}

TEST_F(Form, SixtyFiveBracesMayNot) {
    const Loaded loaded(nested(65));

    EXPECT_TRUE(loaded.failed());
    EXPECT_EQ(loaded.message(), ":65:11: expected at most 64 braces in each other, found '{'");
    EXPECT_EQ(loaded.target(), nullptr);
}

TEST_F(Form, ManySectionsBesideEachOtherAreNotDeep) {
    std::string text = "target T {\n";
    for (int i = 0; i < 200; ++i)
        text += "section s {\n}\n";

    EXPECT_FALSE(Loaded(text + "}\n").failed());
}

} // namespace
