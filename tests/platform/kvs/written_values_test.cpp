#include "tests/platform/kvs/kvs_files.h"

#include <rapidcheck.h>

#include <charconv>
#include <cmath>
#include <cstdint>
#include <iterator>
#include <limits>

// How a value and a name stand in the text that is built.
namespace {

using namespace kvs_test;

class WrittenValues : public FileLibrary {};

struct WrittenDouble {
    double value;
    const char* text;
};

TEST_F(WrittenValues, ADoubleIsTheShortestFormWithAPointOrAnExponent) {
    constexpr WrittenDouble rows[] = {
        {0.0, "0.0"},
        {-0.0, "-0.0"},
        {1.0, "1.0"},
        {-1.0, "-1.0"},
        {0.1, "0.1"},
        {0.1 + 0.2, "0.30000000000000004"},
        {1.0 / 3.0, "0.3333333333333333"},
        {12.5, "12.5"},
        {227000.0, "227000.0"},
        {1e10, "1e+10"},
        {1e22, "1e+22"},
        {0.000001, "1e-06"},
        {123456789.0, "123456789.0"},
        {5e-324, "5e-324"},
        {1.7976931348623157e308, "1.7976931348623157e+308"},
        {2.2250738585072014e-308, "2.2250738585072014e-308"},
        {std::numeric_limits<double>::quiet_NaN(), "nan"},
        {-std::numeric_limits<double>::quiet_NaN(), "nan"},
        {std::numeric_limits<double>::infinity(), "inf"},
        {-std::numeric_limits<double>::infinity(), "-inf"},
    };
    for (const WrittenDouble& row : rows) {
        const BuiltSection built;
        kvsAddKeyword(built.file(), "v");
        kvsAddDouble(built.file(), row.value);
        EXPECT_EQ(built.lines(), std::string("v = ") + row.text + "\n");
    }
}

// What std::to_chars gives, which is the shortest form, with ".0" where it looks like an int.
std::string shortest(double value) {
    char text[32];
    const std::string digits(text, std::to_chars(text, std::end(text), value).ptr);
    return digits.find_first_of(".en") == std::string::npos ? digits + ".0" : digits;
}

TEST_F(WrittenValues, DecimalsOfFewDigitsAreInTheShortestForm) {
    const BuiltSection built;
    std::string expected;
    for (double scale = 1e-9; scale <= 1e12; scale *= 10) {
        for (int digits = -120; digits <= 1200; ++digits) {
            kvsPutListParam(built.file(), "v", "d", digits * scale);
            expected += "v = " + shortest(digits * scale) + "\n";
        }
    }

    EXPECT_EQ(built.lines(), expected);
}

TEST_F(WrittenValues, DoublesOfAnyDigitsAreInTheShortestForm) {
    EXPECT_TRUE(rc::check("decimals", [] {
        const double value = static_cast<double>(*rc::gen::arbitrary<std::int64_t>()) /
                             std::pow(10.0, *rc::gen::inRange(-5, 25));
        const BuiltSection built;
        kvsPutListParam(built.file(), "v", "d", value);
        RC_ASSERT(built.lines() == "v = " + shortest(value) + "\n");
    }));
}

TEST_F(WrittenValues, AnIntHasNoPoint) {
    const BuiltSection built;

    kvsPutListParam(built.file(), "v", "iii", std::numeric_limits<int>::min(),
                    std::numeric_limits<int>::max(), 0);

    EXPECT_EQ(built.lines(), "v = -2147483648, 2147483647, 0\n");
}

struct WrittenString {
    std::string_view bytes;
    const char* text;
};

TEST_F(WrittenValues, AStringIsQuotedAndItsBytesEscapedWhereNeeded) {
    const WrittenString rows[] = {
        {"", R"("")"},
        {"MISSOURI", R"("MISSOURI")"},
        {"a # b, { } =", R"("a # b, { } =")"},
        {"\"\\", R"("\"\\")"},
        {"\n\r\t", R"("\n\r\t")"},
        {std::string_view("\0\x01\x1F\x7F", 4), R"("\x00\x01\x1F\x7F")"},
        // UTF-8 of two, three and four bytes, to the last character there is
        {"\xC3\x85SNES", "\"\xC3\x85SNES\""},
        {"\xC2\x80\xDF\xBF", "\"\xC2\x80\xDF\xBF\""},
        {"\xE5\xB7\x9D\xE0\xA0\x80\xEF\xBF\xBF", "\"\xE5\xB7\x9D\xE0\xA0\x80\xEF\xBF\xBF\""},
        {"\xF0\x9F\x8C\x8A\xF0\x90\x80\x80\xF4\x8F\xBF\xBF",
         "\"\xF0\x9F\x8C\x8A\xF0\x90\x80\x80\xF4\x8F\xBF\xBF\""},
        // what looks like it and is not
        {"\x80", R"("\x80")"},
        {"\xFF\xFE", R"("\xFF\xFE")"},
        {"\xC3", R"("\xC3")"},
        {"\xC3(", R"("\xC3(")"},
        {"\xE5\xB7", R"("\xE5\xB7")"},
        {"\xF0\x9F\x8C", R"("\xF0\x9F\x8C")"},
        {"\xC0\x80", R"("\xC0\x80")"},                 // overlong
        {"\xC1\xBF", R"("\xC1\xBF")"},                 //
        {"\xE0\x9F\xBF", R"("\xE0\x9F\xBF")"},         //
        {"\xF0\x8F\xBF\xBF", R"("\xF0\x8F\xBF\xBF")"}, //
        {"\xED\xA0\x80", R"("\xED\xA0\x80")"},         // surrogates
        {"\xED\xBF\xBF", R"("\xED\xBF\xBF")"},         //
        {"\xF4\x90\x80\x80", R"("\xF4\x90\x80\x80")"}, // beyond Unicode
        {"\xF5\x80\x80\x80", R"("\xF5\x80\x80\x80")"}, //
        {"\xC3\xC3\x85", "\"\\xC3\xC3\x85\""},         // a letter behind half of one
    };
    for (const WrittenString& row : rows) {
        const BuiltSection built;
        kvsAddKeyword(built.file(), "v");
        kvsAddString(built.file(), row.bytes);
        EXPECT_EQ(built.lines(), std::string("v = ") + row.text + "\n");
    }
}

TEST_F(WrittenValues, ANameThatIsNotPlainStandsInQuotes) {
    const WrittenString rows[] = {
        {"a", "a"},
        {"_", "_"},
        {"a.b-c_9", "a.b-c_9"},
        {"target", "target"},
        {"section", "section"},
        {"", R"("")"},
        {"9", R"("9")"},
        {"-a", R"("-a")"},
        {".a", R"(".a")"},
        {"a b", R"("a b")"},
        {"a\"", R"("a\"")"},
        {"\t", R"("\t")"},
        {"\xC3\x85", "\"\xC3\x85\""},
        {"\xFF", R"("\xFF")"},
    };
    for (const WrittenString& row : rows) {
        const std::string name(row.bytes);
        const std::string written = row.text;
        const Built built;
        kvsAddTarget(built.file(), name.c_str());
        kvsAddSection(built.file(), name.c_str());
        kvsAddKeyword(built.file(), name.c_str());
        EXPECT_EQ(built.text(),
                  "target " + written + " {\n  section " + written + " {\n    " + written + " =\n  }\n}\n");
    }
}

} // namespace
