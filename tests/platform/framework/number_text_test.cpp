#include "platform/framework/number_text.h"

#include <gtest/gtest.h>
#include <rapidcheck.h>

#include <bit>
#include <climits>
#include <cmath>
#include <cstdint>
#include <cstdio>
#include <cstdlib>
#include <limits>
#include <string>
#include <string_view>
#include <vector>

namespace {

using kota::NumberFormat;
using kota::textToDouble;
using kota::textToInt;

constexpr double infinity = std::numeric_limits<double>::infinity();
constexpr double nan = std::numeric_limits<double>::quiet_NaN();

std::uint64_t bitsOf(double value) {
    return std::bit_cast<std::uint64_t>(value);
}

// By the C library, which reads and prints in the "C" locale in a program that sets none.
std::string printed(const std::string& format, double value) {
    std::string text(1000, '\0');
    const int length = std::snprintf(text.data(), text.size(), format.c_str(), value);
    text.resize(static_cast<std::size_t>(length));
    return text;
}

bool readsAsAtof(const std::string& text) {
    const double expected = std::atof(text.c_str());
    const double value = textToDouble(text);
    return std::isnan(expected) ? std::isnan(value) : bitsOf(value) == bitsOf(expected);
}

TEST(TextToDouble, ReadsTheLongestStartThatIsANumber) {
    EXPECT_EQ(textToDouble("12.5"), 12.5);
    EXPECT_EQ(textToDouble(" \t\n\v\f\r+12.5abc"), 12.5);
    EXPECT_EQ(textToDouble("125.000000.3"), 125);
    EXPECT_EQ(textToDouble("-.5"), -0.5);
    EXPECT_EQ(textToDouble("5.e1"), 50);
    EXPECT_EQ(textToDouble("1e"), 1);
    EXPECT_EQ(textToDouble("1e+"), 1);
    EXPECT_EQ(textToDouble("1E-2-3"), 0.01);
    EXPECT_EQ(textToDouble("1,5"), 1);
}

TEST(TextToDouble, IsZeroWithoutANumber) {
    for (const char* text : {"", " ", "-", "+", ".", "e5", "abc", "--1", "+-1", "-+1", "- 1"})
        EXPECT_EQ(bitsOf(textToDouble(text)), bitsOf(0.0)) << text;
    EXPECT_EQ(bitsOf(textToDouble("-0")), bitsOf(-0.0));
}

TEST(TextToDouble, EndsWhereTheViewEnds) {
    EXPECT_EQ(textToDouble(std::string_view("12345").substr(0, 2)), 12);
    EXPECT_EQ(textToDouble(std::string_view("0x12").substr(0, 3)), 1);
    EXPECT_EQ(textToDouble(std::string_view("0x12").substr(0, 2)), 0);
    EXPECT_EQ(textToDouble(std::string_view("1e5").substr(0, 2)), 1);
}

TEST(TextToDouble, ReadsHexadecimalNumbers) {
    EXPECT_EQ(textToDouble("0x10"), 16);
    EXPECT_EQ(textToDouble("-0X.8p1z"), -1);
    EXPECT_EQ(textToDouble("0x1.8p"), 1.5);
    for (const char* text : {"0x", "0x.", "0xnan", "0x-1", "0xg", "0x 1"})
        EXPECT_EQ(bitsOf(textToDouble(text)), bitsOf(0.0)) << text;
}

TEST(TextToDouble, ReadsInfinityAndNanInAnyCase) {
    EXPECT_EQ(textToDouble("inf"), infinity);
    EXPECT_EQ(textToDouble("-INFINITY"), -infinity);
    EXPECT_EQ(textToDouble("Infinit"), infinity);
    EXPECT_TRUE(std::isnan(textToDouble("NaN")));
    EXPECT_TRUE(std::signbit(textToDouble("-nan")));
}

TEST(TextToDouble, GivesInfinityForTooLargeAndZeroForTooSmall) {
    const std::string zeros(400, '0');
    const std::string nines(400, '9');

    EXPECT_EQ(textToDouble("1e309"), infinity);
    EXPECT_EQ(textToDouble("-1e309"), -infinity);
    EXPECT_EQ(textToDouble("1e99999999999999999999"), infinity);
    EXPECT_EQ(textToDouble("0x1p1024"), infinity);
    EXPECT_EQ(textToDouble("0x" + nines), infinity);
    EXPECT_EQ(textToDouble("0x1" + zeros + "p-500"), infinity);
    EXPECT_EQ(textToDouble(nines + " e-999"), infinity);
    EXPECT_EQ(textToDouble("0." + zeros + "1e999"), infinity);
    EXPECT_EQ(textToDouble("3e-324"), std::numeric_limits<double>::denorm_min());
    EXPECT_EQ(bitsOf(textToDouble("1e-324")), bitsOf(0.0));
    EXPECT_EQ(bitsOf(textToDouble("-1e-99999999999999999999")), bitsOf(-0.0));
    EXPECT_EQ(bitsOf(textToDouble("0x1p-1080")), bitsOf(0.0));
    EXPECT_EQ(bitsOf(textToDouble("1e-" + zeros + "400")), bitsOf(0.0));
    EXPECT_EQ(bitsOf(textToDouble(nines + "e-999")), bitsOf(0.0));
    EXPECT_EQ(bitsOf(textToDouble("0." + zeros + "1")), bitsOf(0.0));
}

TEST(TextToDouble, HoldsLongNumbersWhoseExponentBringsThemBack) {
    const std::string zeros(400, '0');

    EXPECT_EQ(textToDouble("1" + zeros + "e-400"), 1);
    EXPECT_EQ(textToDouble("0." + zeros + "1e401"), 1);
}

TEST(TextToDouble, ReadsAnyTextAsAtofDoes) {
    const auto pieces = rc::gen::element<std::string>("0", "1", "9", "225", ".", "-", "+", "e", "E", "0x",
                                                      "p", "inf", "nan", "a", " ", "e3", "e-32", "x");
    EXPECT_TRUE(rc::check("texts", [&] {
        std::string text;
        for (const std::string& piece : *rc::gen::container<std::vector<std::string>>(pieces))
            text += piece;
        RC_ASSERT(readsAsAtof(text));
    }));
}

TEST(TextToDouble, ReadsADoubleOfAnyBitsAsAtofDoes) {
    EXPECT_TRUE(rc::check("doubles", [](std::uint64_t bits) {
        // Mixed, since the generator prefers small numbers.
        const auto value = std::bit_cast<double>(bits * 0x9E3779B97F4A7C15u);
        for (const char* format : {"%.17g", "%.17e", "%.30f", "%a"})
            RC_ASSERT(readsAsAtof(printed(format, value)));
    }));
}

TEST(TextToInt, ReadsTheDigitsAtTheStart) {
    EXPECT_EQ(textToInt("42"), 42);
    EXPECT_EQ(textToInt(" \t-42.9"), -42);
    EXPECT_EQ(textToInt("+7th"), 7);
    EXPECT_EQ(textToInt("0x10"), 0);
    for (const char* text : {"", "-", "abc", "--1", "+-1", "- 1"})
        EXPECT_EQ(textToInt(text), 0) << text;
    EXPECT_EQ(textToInt(std::string_view("12345").substr(0, 2)), 12);
}

TEST(TextToInt, StopsAtTheLimitsOfAnInt) {
    EXPECT_EQ(textToInt("2147483647"), INT_MAX);
    EXPECT_EQ(textToInt("2147483648"), INT_MAX);
    EXPECT_EQ(textToInt("-2147483648"), INT_MIN);
    EXPECT_EQ(textToInt("-2147483649"), INT_MIN);
    EXPECT_EQ(textToInt("99999999999999999999"), INT_MAX);
    EXPECT_EQ(textToInt("-99999999999999999999"), INT_MIN);
}

const std::vector<std::string> formats = {"%-lf",  "%lf",   "%f",    "%.3lf", "%.0f",      "%.f",
                                          "%.1F",  "%.12f", "%-.2E", "%.4e",  "%-g",       "%.0G",
                                          "%.17g", "%.e",   "%--f",  "%.99f", "a%%%.2fb%%"};

// Printed by NumberFormat as by the C library, in every format.
testing::AssertionResult isPrintedAsByPrintf(double value) {
    for (const std::string& format : formats) {
        const CString text = NumberFormat(format)(value);
        if (text.View() != printed(format, value))
            return testing::AssertionFailure() << format << " of " << printed("%a", value) << ": " << text
                                               << ", not " << printed(format, value);
    }
    return testing::AssertionSuccess();
}

TEST(NumberFormat, PrintsAsItsFormatSays) {
    EXPECT_EQ(NumberFormat("%-lf")(227000), "227000.000000");
    EXPECT_EQ(NumberFormat("%.3lf")(-2.0005), "-2.001");
    EXPECT_EQ(NumberFormat("%-.2E")(1234.5), "1.23E+03");
    EXPECT_EQ(NumberFormat("%-g")(1e10), "1e+10");
    EXPECT_EQ(NumberFormat("%.0f")(2.5), "2");
    EXPECT_EQ(NumberFormat("%f")(-1e-9), "-0.000000");
    EXPECT_EQ(NumberFormat("%f")(-infinity), "-inf");
    EXPECT_EQ(NumberFormat("%G")(nan), "NAN");
    EXPECT_EQ(NumberFormat("at %.1f m, 50%% of it")(0.25), "at 0.2 m, 50% of it");
}

TEST(NumberFormat, PrintsTheEdgesOfTheDoublesAsPrintfDoes) {
    using Limits = std::numeric_limits<double>;
    for (const double value : {0.0,
                               infinity,
                               nan,
                               Limits::denorm_min(),
                               Limits::min(),
                               Limits::max(),
                               1e10,
                               999999.9999995,
                               0.9999995,
                               1e12,
                               999999999999.0,
                               0.5,
                               1.5,
                               2.5,
                               0.125,
                               0.0000005,
                               1e-5,
                               999999.5,
                               1e15 / 7,
                               1e17}) {
        EXPECT_TRUE(isPrintedAsByPrintf(value));
        EXPECT_TRUE(isPrintedAsByPrintf(-value));
        EXPECT_TRUE(isPrintedAsByPrintf(std::nextafter(value, infinity)));
        EXPECT_TRUE(isPrintedAsByPrintf(std::nextafter(value, -infinity)));
    }
}

TEST(NumberFormat, PrintsADoubleOfAnyBitsAsPrintfDoes) {
    EXPECT_TRUE(rc::check("doubles of any bits", [](std::uint64_t bits) {
        // Mixed, since the generator prefers small numbers.
        RC_ASSERT(isPrintedAsByPrintf(std::bit_cast<double>(bits * 0x9E3779B97F4A7C15u)));
    }));
}

TEST(NumberFormat, PrintsDecimalsAsPrintfDoes) {
    EXPECT_TRUE(rc::check("decimals", [] {
        const double decimal =
            static_cast<double>(*rc::gen::inRange<std::int64_t>(-100'000'000'000, 100'000'000'000));
        const double unit = *rc::gen::element(1.0, 0.5, 0.001, 1.0 / (1 << 20), 5e-7, 1e-9);
        RC_ASSERT(isPrintedAsByPrintf(decimal * unit));
    }));
}

TEST(NumberFormat, PrintsAnInvalidFormatLikeF) {
    for (const char* format : {"",
                               "text",
                               "%",
                               "100%",
                               "%%",
                               "%d",
                               "%s",
                               "%5f",
                               "%05f",
                               "%+f",
                               "% f",
                               "%#f",
                               "%Lf",
                               "%llf",
                               "%a",
                               "%.-1f",
                               "%.*f",
                               "%f %f",
                               "%f%",
                               "a %.2f %d",
                               "a %",
                               "%.200f",
                               "%.99999999999999999999f"})
        EXPECT_EQ(NumberFormat(format)(0.25), "0.250000") << format;
    EXPECT_EQ(NumberFormat(std::string(200, 'a') + "%.0f")(0.25), "0.250000");
}

TEST(NumberFormat, HoldsTheLongestNumberOfTheLongestFormat) {
    const std::string format = std::string(100, 'a') + "%.98f" + "b";
    const double longest = -std::numeric_limits<double>::max();

    EXPECT_EQ(NumberFormat(format)(longest).View(), printed(format, longest));
}

TEST(NumberFormat, PrintsToABuffer) {
    kota::NumberBuffer buffer;

    const std::string_view text = NumberFormat("<%.1f>").print(1.25, buffer);

    EXPECT_EQ(text, "<1.2>");
    EXPECT_EQ(text.data(), buffer.data());
}

} // namespace
