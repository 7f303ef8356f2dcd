#include "tests/platform/kvs/kvs_files.h"

#include <cmath>
#include <limits>

// What stands behind an equals sign, and what the getters make of it.
namespace {

using namespace kvs_test;

class Values : public FileLibrary {};

TEST_F(Values, AnIntIsADecimalOfThirtyTwoBits) {
    EXPECT_EQ(kvsGetInt(LoadedValue("0").get()), 0);
    EXPECT_EQ(kvsGetInt(LoadedValue("-0").get()), 0);
    EXPECT_EQ(kvsGetInt(LoadedValue("2147483647").get()), 2147483647);
    EXPECT_EQ(kvsGetInt(LoadedValue("-2147483648").get()), std::numeric_limits<int>::min());
}

TEST_F(Values, ZerosInFrontOfAnIntCountForNothing) {
    EXPECT_EQ(kvsGetInt(LoadedValue("007").get()), 7);
    EXPECT_EQ(kvsGetInt(LoadedValue("-0000000000000000012").get()), -12);
    EXPECT_EQ(kvsGetInt(LoadedValue("00000000000000000000042").get()), 42);
}

TEST_F(Values, ADoubleHasAPointOrAnExponent) {
    EXPECT_EQ(kvsGetDouble(LoadedValue("1.5").get()), 1.5);
    EXPECT_EQ(kvsGetDouble(LoadedValue("-0.25").get()), -0.25);
    EXPECT_EQ(kvsGetDouble(LoadedValue("1e3").get()), 1000.0);
    EXPECT_EQ(kvsGetDouble(LoadedValue("1E+3").get()), 1000.0);
    EXPECT_EQ(kvsGetDouble(LoadedValue("2.5e-3").get()), 0.0025);
    EXPECT_EQ(kvsGetDouble(LoadedValue(".5").get()), 0.5);
    EXPECT_EQ(kvsGetDouble(LoadedValue("5.").get()), 5.0);
    EXPECT_EQ(kvsGetDouble(LoadedValue("2147483648.0").get()), 2147483648.0);
    EXPECT_EQ(kvsGetDouble(LoadedValue("99999999999999999999.0").get()), 1e20);
}

TEST_F(Values, WhatIsNotFiniteHasWords) {
    EXPECT_TRUE(std::isnan(kvsGetDouble(LoadedValue("nan").get())));
    EXPECT_EQ(kvsGetDouble(LoadedValue("inf").get()), std::numeric_limits<double>::infinity());
    EXPECT_EQ(kvsGetDouble(LoadedValue("-inf").get()), -std::numeric_limits<double>::infinity());
}

TEST_F(Values, AMinusZeroKeepsItsSign) {
    EXPECT_TRUE(std::signbit(kvsGetDouble(LoadedValue("-0.0").get())));
    EXPECT_FALSE(std::signbit(kvsGetDouble(LoadedValue("0.0").get())));
}

TEST_F(Values, ABoolIsTrueOrFalse) {
    EXPECT_TRUE(kvsGetBool(LoadedValue("true").get()));
    EXPECT_FALSE(kvsGetBool(LoadedValue("false").get()));
}

TEST_F(Values, AStringStandsInDoubleQuotes) {
    EXPECT_EQ(stringOf(LoadedValue(R"("MISSOURI")").get()), "MISSOURI");
    EXPECT_EQ(stringOf(LoadedValue(R"("")").get()), "");
    EXPECT_EQ(stringOf(LoadedValue(R"("  a, b = { } # 'c'  ")").get()), "  a, b = { } # 'c'  ");
    EXPECT_EQ(stringOf(LoadedValue("\"tab\there\"").get()), "tab\there");
}

TEST_F(Values, AStringHasEscapes) {
    EXPECT_EQ(stringOf(LoadedValue(R"("\"\\\n\r\t")").get()), "\"\\\n\r\t");
    EXPECT_EQ(stringOf(LoadedValue(R"("\x41\x6a\xfF")").get()), "Aj\xFF");
    EXPECT_EQ(stringOf(LoadedValue(R"("a\x00b")").get()), std::string("a\0b", 3));
    EXPECT_EQ(stringOf(LoadedValue(R"("\x414")").get()), "A4");
    EXPECT_EQ(stringOf(LoadedValue(R"("\\n")").get()), "\\n");
}

TEST_F(Values, OtherBytesOfAStringStandForThemselves) {
    const std::string bytes = "\xC3\x85SNES \xE5\xB7\x9D \xF0\x9F\x8C\x8A \xFF\xFE\x80 \x01\x7F";

    EXPECT_EQ(stringOf(LoadedValue('"' + bytes + '"').get()), bytes);
}

TEST_F(Values, ANulByteInAStringStandsForItself) {
    const std::string bytes("a\0b", 3);

    EXPECT_EQ(stringOf(LoadedValue('"' + bytes + '"').get()), bytes);
}

TEST_F(Values, EqualAndNeighbouringStringsAreNotMixedUp) {
    const LoadedSection loaded(R"(s = "MISSOURI", "MISSOURI", "MISSOUCI", "MXSSOURI", "", "\x4dISSOURI")");

    EXPECT_EQ(stringOf(loaded.parameter("s", 1)), "MISSOURI");
    EXPECT_EQ(stringOf(loaded.parameter("s", 2)), "MISSOURI");
    EXPECT_EQ(stringOf(loaded.parameter("s", 3)), "MISSOUCI");
    EXPECT_EQ(stringOf(loaded.parameter("s", 4)), "MXSSOURI");
    EXPECT_EQ(stringOf(loaded.parameter("s", 5)), "");
    EXPECT_EQ(stringOf(loaded.parameter("s", 6)), "MISSOURI");
}

TEST_F(Values, ParametersOfAllTypesAreFoundByTheirPlace) {
    const LoadedSection loaded(R"(DATA = 1, 12.5, false, "MISSOURI", 227000.0)");

    EXPECT_EQ(kvsGetInt(loaded.parameter("DATA", 1)), 1);
    EXPECT_EQ(kvsGetDouble(loaded.parameter("DATA", 2)), 12.5);
    EXPECT_FALSE(kvsGetBool(loaded.parameter("DATA", 3)));
    EXPECT_EQ(stringOf(loaded.parameter("DATA", 4)), "MISSOURI");
    EXPECT_EQ(kvsGetDouble(loaded.parameter("DATA", 5)), 227000.0);
    EXPECT_EQ(loaded.parameter("DATA", 6), nullptr);
    EXPECT_EQ(loaded.parameter("DATA", 0), nullptr);
    EXPECT_EQ(loaded.parameter("DATA", -1), nullptr);
}

struct Natural {
    const char* value;
    int asInt;
    double asDouble;
    bool asBool;
    const char* asString;
};

TEST_F(Values, EveryGetterGivesTheNaturalValueOrZero) {
    constexpr Natural rows[] = {
        {"0", 0, 0.0, false, ""},
        {"1", 1, 1.0, true, ""},
        {"2", 2, 2.0, false, ""},
        {"-1", -1, -1.0, false, ""},
        {"0.0", 0, 0.0, false, ""},
        {"1.0", 1, 1.0, true, ""},
        {"0.5", 0, 0.5, false, ""},
        {"1.9", 1, 1.9, false, ""},
        {"-1.9", -1, -1.9, false, ""},
        {"true", 1, 1.0, true, ""},
        {"false", 0, 0.0, false, ""},
        {R"("1")", 0, 0.0, false, "1"},
        {R"("true")", 0, 0.0, false, "true"},
        {R"("")", 0, 0.0, false, ""},
    };
    for (const Natural& row : rows) {
        SCOPED_TRACE(row.value);
        const LoadedValue loaded(row.value);
        EXPECT_EQ(kvsGetInt(loaded.get()), row.asInt);
        EXPECT_EQ(kvsGetDouble(loaded.get()), row.asDouble);
        EXPECT_EQ(kvsGetBool(loaded.get()), row.asBool);
        EXPECT_EQ(stringOf(loaded.get()), row.asString);
    }
}

TEST_F(Values, ADoubleBeyondTheRangeOfAnIntIsZeroAsAnInt) {
    EXPECT_EQ(kvsGetInt(LoadedValue("2147483647.9").get()), 2147483647);
    EXPECT_EQ(kvsGetInt(LoadedValue("2147483648.0").get()), 0);
    EXPECT_EQ(kvsGetInt(LoadedValue("-2147483648.9").get()), std::numeric_limits<int>::min());
    EXPECT_EQ(kvsGetInt(LoadedValue("-2147483649.0").get()), 0);
    for (const char* value : {"1e10", "-1e300", "nan", "inf", "-inf"})
        EXPECT_EQ(kvsGetInt(LoadedValue(value).get()), 0) << value;
}

TEST_F(Values, AStringLivesUntilTheFileIsClosed) {
    const LoadedSection loaded(R"(a = "one", "two", "th\x72ee")");

    const CString& first = kvsGetString(loaded.parameter("a", 1));
    const CString& third = kvsGetString(loaded.parameter("a", 3));
    kvsGetString(loaded.parameter("a", 2));

    EXPECT_EQ(first, "one");
    EXPECT_EQ(third, "three");
}

} // namespace
