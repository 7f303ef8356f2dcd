#include "tests/platform/kvs/kvs_files.h"

// A keyword's parameters, read and written in one call by a format.
namespace {

using namespace kvs_test;

class ParameterLists : public FileLibrary {};

TEST_F(ParameterLists, AreReadByALetterForEachAddress) {
    const LoadedSection loaded("mixed = 1, 2.5, 3, 4");
    int first = 0, third = 0;
    double second = 0, fourth = 0;

    EXPECT_EQ(kvsGetListParam(loaded.section(), "mixed", 1, "idid", &first, &second, &third, &fourth), 4);

    EXPECT_EQ(first, 1);
    EXPECT_EQ(second, 2.5);
    EXPECT_EQ(third, 3);
    EXPECT_EQ(fourth, 4.0);
}

TEST_F(ParameterLists, AreReadFromTheKeywordOfThatNumber) {
    const LoadedSection loaded("a = 1\nb = 7\na = 2");
    int value = 0;

    EXPECT_EQ(kvsGetListParam(loaded.section(), "a", 2, "i", &value), 1);

    EXPECT_EQ(value, 2);
}

TEST_F(ParameterLists, GiveTheNaturalValueOfAnotherType) {
    const LoadedSection loaded(R"(a = 2.9, true, "x", 1e10)");
    int values[] = {9, 9, 9, 9};

    EXPECT_EQ(
        kvsGetListParam(loaded.section(), "a", 1, "iiii", &values[0], &values[1], &values[2], &values[3]), 4);

    EXPECT_EQ(values[0], 2);
    EXPECT_EQ(values[1], 1);
    EXPECT_EQ(values[2], 0);
    EXPECT_EQ(values[3], 0);
}

TEST_F(ParameterLists, LeaveAnAddressAsItWasWhereNoValueStands) {
    const LoadedSection loaded("two = 1, 2\nnone =");
    int values[] = {9, 9, 9};
    double number = 9;

    EXPECT_EQ(kvsGetListParam(loaded.section(), "two", 1, "iii", &values[0], &values[1], &values[2]), 2);
    EXPECT_EQ(values[0], 1);
    EXPECT_EQ(values[1], 2);
    EXPECT_EQ(values[2], 9);

    EXPECT_EQ(kvsGetListParam(loaded.section(), "none", 1, "d", &number), 0);
    EXPECT_EQ(kvsGetListParam(loaded.section(), "missing", 1, "d", &number), 0);
    EXPECT_EQ(kvsGetListParam(loaded.section(), "two", 2, "d", &number), 0);
    EXPECT_EQ(kvsGetListParam(nullptr, "two", 1, "d", &number), 0);
    EXPECT_EQ(number, 9);
}

TEST_F(ParameterLists, LeaveTheParametersBehindTheFormatAlone) {
    const LoadedSection loaded("a = 1, 2, 3");
    int first = 0;

    EXPECT_EQ(kvsGetListParam(loaded.section(), "a", 1, "i", &first), 1);

    EXPECT_EQ(first, 1);
}

TEST_F(ParameterLists, PassOverANullAddressAndOneThatDoesNotFitItsLetter) {
    const LoadedSection loaded("a = 1, 2, 3");
    int first = 9, third = 9;
    int* const none = nullptr;

    EXPECT_EQ(kvsGetListParam(loaded.section(), "a", 1, "dii", &first, none, &third), 1);

    EXPECT_EQ(first, 9);
    EXPECT_EQ(third, 3);
}

TEST_F(ParameterLists, AreWrittenAsOneKeyword) {
    const BuiltSection built;

    kvsPutListParam(built.file(), "Mass", "iii", 1, 0, -1);
    kvsPutListParam(built.file(), "G_exponent", "dd", 0.25, 100.0);
    kvsPutListParam(built.file(), "mixed", "id", 1, 1.0);

    EXPECT_EQ(built.lines(), "Mass = 1, 0, -1\n"
                             "G_exponent = 0.25, 100.0\n"
                             "mixed = 1, 1.0\n");
}

TEST_F(ParameterLists, AreWrittenInTheTypeOfTheFormat) {
    const BuiltSection built;

    kvsPutListParam(built.file(), "a", "di", 3, 4.9);

    EXPECT_EQ(built.lines(), "a = 3.0, 4\n");
}

} // namespace
