#include "tests/platform/kvs/kvs_files.h"

// The n-th of a name.
namespace {

using namespace kvs_test;

class Numbering : public FileLibrary {};

int valueOf(void* keyword) {
    return kvsGetInt(kvsParamByNum(keyword, 1));
}

TEST_F(Numbering, CountsEachNameOfInterleavedKeywordsFromOne) {
    const LoadedSection loaded("a = 1\nb = 2\na = 3\nc = 4\na = 5\nb = 6");

    EXPECT_EQ(valueOf(loaded.keyword("a", 1)), 1);
    EXPECT_EQ(valueOf(loaded.keyword("a", 2)), 3);
    EXPECT_EQ(valueOf(loaded.keyword("a", 3)), 5);
    EXPECT_EQ(valueOf(loaded.keyword("b", 1)), 2);
    EXPECT_EQ(valueOf(loaded.keyword("b", 2)), 6);
    EXPECT_EQ(valueOf(loaded.keyword("c", 1)), 4);
}

TEST_F(Numbering, HasNothingOutsideOneToTheCount) {
    const LoadedSection loaded("a = 1\na = 2\nb = 3");

    for (const int number : {-2147483647 - 1, -1, 0, 3, 2147483647})
        EXPECT_EQ(loaded.keyword("a", number), nullptr) << number;
    EXPECT_EQ(loaded.keyword("b", 2), nullptr);
    EXPECT_EQ(loaded.keyword("c", 1), nullptr);
}

TEST_F(Numbering, CountsKeywordsAndSectionsApart) {
    const LoadedSection loaded("x = 1\n"
                               "section x {\n y = 2\n}\n"
                               "x = 3\n"
                               "section x {\n y = 4\n}\n");

    EXPECT_EQ(valueOf(loaded.keyword("x", 2)), 3);
    EXPECT_EQ(loaded.keyword("x", 3), nullptr);
    void* const second = kvsSectionByNameNum(loaded.section(), "x", 2);
    EXPECT_EQ(valueOf(kvsKeywordByNameNum(second, "y", 1)), 4);
    EXPECT_EQ(kvsSectionByNameNum(loaded.section(), "x", 3), nullptr);
}

TEST_F(Numbering, KeepsTheSameNameInTwoSectionsApart) {
    const LoadedSection loaded("a = 1\n"
                               "section s {\n a = 2\n section s {\n a = 3\n }\n a = 4\n}\n"
                               "a = 5\n"
                               "section s {\n a = 6\n}\n");

    void* const first = kvsSectionByNameNum(loaded.section(), "s", 1);
    void* const inner = kvsSectionByNameNum(first, "s", 1);
    void* const second = kvsSectionByNameNum(loaded.section(), "s", 2);
    EXPECT_EQ(valueOf(loaded.keyword("a", 2)), 5);
    EXPECT_EQ(loaded.keyword("a", 3), nullptr);
    EXPECT_EQ(valueOf(kvsKeywordByNameNum(first, "a", 2)), 4);
    EXPECT_EQ(kvsKeywordByNameNum(first, "a", 3), nullptr);
    EXPECT_EQ(valueOf(kvsKeywordByNameNum(inner, "a", 1)), 3);
    EXPECT_EQ(kvsKeywordByNameNum(inner, "a", 2), nullptr);
    EXPECT_EQ(valueOf(kvsKeywordByNameNum(second, "a", 1)), 6);
    EXPECT_EQ(kvsSectionByNameNum(first, "s", 2), nullptr);
}

TEST_F(Numbering, FindsBothOfTwoTargetsOfAName) {
    const Loaded loaded("target T {\nsection A {\n}\n}\ntarget U {\n}\ntarget T {\nsection B {\n}\n}\n");

    EXPECT_NE(kvsSectionByNameNum(loaded.target("T", 1), "A", 1), nullptr);
    EXPECT_NE(kvsSectionByNameNum(loaded.target("T", 2), "B", 1), nullptr);
    EXPECT_EQ(kvsSectionByNameNum(loaded.target("T", 2), "A", 1), nullptr);
    EXPECT_EQ(loaded.target("T", 3), nullptr);
    EXPECT_NE(loaded.target("U"), nullptr);
}

TEST_F(Numbering, HasNoTargetOfAnotherName) {
    const Loaded loaded("target T {\n}\n");

    for (const char* name : {"t", "T1", "", "TT"})
        EXPECT_EQ(loaded.target(name), nullptr) << name;
}

TEST_F(Numbering, GivesTheSameHandleEachTime) {
    const LoadedSection loaded("a = 1\na = 2");

    EXPECT_EQ(loaded.keyword("a", 2), loaded.keyword("a", 2));
    EXPECT_NE(loaded.keyword("a", 1), loaded.keyword("a", 2));
}

// Ten thousand names, each five times, in five rounds.
TEST_F(Numbering, IsRightForManyNamesWithManyOccurrences) {
    constexpr int names = 10'000;
    constexpr int rounds = 5;
    std::string members;
    for (int round = 1; round <= rounds; ++round)
        for (int name = 0; name < names; ++name)
            members += "k" + std::to_string(name) + " = " + std::to_string(name * 10 + round) + "\n";
    const LoadedSection loaded(members);

    for (int name = 0; name < names; ++name) {
        const std::string text = "k" + std::to_string(name);
        for (int round = 1; round <= rounds; ++round)
            ASSERT_EQ(valueOf(loaded.keyword(text.c_str(), round)), name * 10 + round) << text;
        ASSERT_EQ(loaded.keyword(text.c_str(), rounds + 1), nullptr) << text;
    }
}

TEST_F(Numbering, IsRightForManySectionsOfOneName) {
    constexpr int sections = 20'000;
    std::string members;
    for (int i = 1; i <= sections; ++i)
        members += "section s {\n a = " + std::to_string(i) + "\n a = " + std::to_string(-i) + "\n}\n";
    const LoadedSection loaded(members);

    for (int i = 1; i <= sections; ++i) {
        void* const section = kvsSectionByNameNum(loaded.section(), "s", i);
        ASSERT_EQ(valueOf(kvsKeywordByNameNum(section, "a", 1)), i);
        ASSERT_EQ(valueOf(kvsKeywordByNameNum(section, "a", 2)), -i);
        ASSERT_EQ(kvsKeywordByNameNum(section, "a", 3), nullptr);
    }
}

} // namespace
