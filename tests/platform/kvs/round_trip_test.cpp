#include "tests/platform/kvs/kvs_files.h"

#include <rapidcheck.h>

#include <bit>
#include <charconv>
#include <cmath>
#include <cstdint>
#include <limits>
#include <vector>

// What is written is read back, bit for bit.
namespace {

using namespace kvs_test;

class RoundTrip : public FileLibrary {};

constexpr std::uint64_t bitsOf(double value) {
    return std::bit_cast<std::uint64_t>(value);
}

std::vector<double> doublesRead(const std::vector<double>& written) {
    const BuiltSection built;
    kvsAddKeyword(built.file(), "d");
    for (const double value : written)
        kvsAddDouble(built.file(), value);
    const Loaded loaded(built.text());
    void* const keyword = kvsKeywordByNameNum(kvsSectionByNameNum(loaded.target(), "S", 1), "d", 1);
    std::vector<double> read;
    for (int place = 1; void* const parameter = kvsParamByNum(keyword, place); ++place)
        read.push_back(kvsGetDouble(parameter));
    return read;
}

std::string stringRead(const std::string& written) {
    const BuiltSection built;
    kvsAddKeyword(built.file(), "s");
    kvsAddString(built.file(), written);
    const Loaded loaded(built.text());
    void* const keyword = kvsKeywordByNameNum(kvsSectionByNameNum(loaded.target(), "S", 1), "s", 1);
    return loaded.failed() ? loaded.error().text : stringOf(kvsParamByNum(keyword, 1));
}

double nextUp(double value) {
    return std::nextafter(value, std::numeric_limits<double>::infinity());
}

TEST_F(RoundTrip, KeepsSpecialDoublesBitForBit) {
    using Limits = std::numeric_limits<double>;
    const std::vector<double> special = {
        0.0,
        -0.0,
        1.0,
        -1.0,
        0.1,
        1.0 / 3.0,
        1e10,
        1e15,
        1e16,
        1e17,
        1e22,
        1e23,
        9007199254740991.0, // 2^53 - 1
        9007199254740992.0,
        9007199254740993e3,
        9223372036854775808.0,
        18446744073709551616.0,
        2147483647.0,
        2147483648.0,
        123456789012345678.0,
        8.41e21, // halfway cases of the shortest form
        9.5e-322,
        2.2250738585072011e-308,
        Limits::min(),
        nextUp(Limits::min()),
        std::nextafter(Limits::min(), 0.0),
        Limits::denorm_min(),
        -Limits::denorm_min(),
        Limits::max(),
        Limits::lowest(),
        std::nextafter(Limits::max(), 0.0),
        Limits::epsilon(),
        nextUp(1.0),
        std::nextafter(1.0, 0.0),
        Limits::infinity(),
        -Limits::infinity(),
    };

    const std::vector<double> read = doublesRead(special);

    ASSERT_EQ(read.size(), special.size());
    for (std::size_t i = 0; i < special.size(); ++i)
        EXPECT_EQ(bitsOf(read[i]), bitsOf(special[i])) << special[i];
}

TEST_F(RoundTrip, KeepsThatADoubleIsNoNumber) {
    EXPECT_TRUE(std::isnan(doublesRead({std::numeric_limits<double>::quiet_NaN()}).at(0)));
    EXPECT_TRUE(std::isnan(doublesRead({-std::numeric_limits<double>::signaling_NaN()}).at(0)));
}

TEST_F(RoundTrip, KeepsEveryPowerOfTwoAndItsNeighbours) {
    std::vector<double> values;
    for (int exponent = -1074; exponent <= 1023; ++exponent) {
        const double power = std::ldexp(1.0, exponent);
        values.insert(values.end(), {power, nextUp(power), -std::nextafter(power, 0.0)});
    }

    const std::vector<double> read = doublesRead(values);

    ASSERT_EQ(read.size(), values.size());
    for (std::size_t i = 0; i < values.size(); ++i)
        ASSERT_EQ(bitsOf(read[i]), bitsOf(values[i])) << values[i];
}

TEST_F(RoundTrip, KeepsDoublesOfAnyBits) {
    EXPECT_TRUE(rc::check("doubles of any bits", [](const std::vector<std::uint64_t>& patterns) {
        std::vector<double> values;
        for (const std::uint64_t bits : patterns)
            values.push_back(std::bit_cast<double>(bits));
        const std::vector<double> read = doublesRead(values);
        RC_ASSERT(read.size() == values.size());
        for (std::size_t i = 0; i < values.size(); ++i)
            RC_ASSERT(bitsOf(read[i]) == bitsOf(values[i]) || (std::isnan(read[i]) && std::isnan(values[i])));
    }));
}

// The generator of whole numbers prefers small ones, so the bits are mixed to reach all exponents.
TEST_F(RoundTrip, KeepsDoublesOfAllMagnitudes) {
    EXPECT_TRUE(rc::check("doubles of all magnitudes", [](std::uint64_t seed) {
        std::vector<double> values;
        for (int i = 0; i < 200; ++i) {
            seed += 0x9E3779B97F4A7C15u;
            std::uint64_t mixed = (seed ^ (seed >> 30)) * 0xBF58476D1CE4E5B9u;
            mixed = (mixed ^ (mixed >> 27)) * 0x94D049BB133111EBu;
            values.push_back(std::bit_cast<double>(mixed ^ (mixed >> 31)));
        }
        const std::vector<double> read = doublesRead(values);
        RC_ASSERT(read.size() == values.size());
        for (std::size_t i = 0; i < values.size(); ++i)
            RC_ASSERT(bitsOf(read[i]) == bitsOf(values[i]) || (std::isnan(read[i]) && std::isnan(values[i])));
    }));
}

// Digits as a hand writes them, more than a double holds included.
TEST_F(RoundTrip, ReadsDecimalsToTheNearestDouble) {
    const auto digits = [](int most) {
        return rc::gen::mapcat(rc::gen::inRange(1, most + 1), [](int length) {
            return rc::gen::container<std::string>(static_cast<std::size_t>(length),
                                                   rc::gen::inRange('0', static_cast<char>('9' + 1)));
        });
    };
    EXPECT_TRUE(rc::check("decimals", [&] {
        std::string text = *rc::gen::element<std::string>("", "-") + *digits(25) + "." + *digits(25);
        if (*rc::gen::arbitrary<bool>())
            text += "e" + std::to_string(*rc::gen::inRange(-330, 260));
        double expected = 0;
        const auto [end, error] = std::from_chars(text.data(), text.data() + text.size(), expected);
        RC_PRE(error == std::errc());
        const LoadedValue loaded(text);
        RC_ASSERT(bitsOf(kvsGetDouble(loaded.get())) == bitsOf(expected));
    }));
}

TEST_F(RoundTrip, KeepsIntsOfAnyValue) {
    EXPECT_TRUE(rc::check("ints of any value", [](int value) {
        const BuiltSection built;
        kvsPutListParam(built.file(), "i", "i", value);
        const LoadedSection loaded(built.lines());
        RC_ASSERT(kvsGetInt(loaded.parameter("i")) == value);
    }));
}

TEST_F(RoundTrip, KeepsEveryByteOfAString) {
    std::string bytes;
    for (int byte = 0; byte < 256; ++byte)
        bytes += static_cast<char>(byte);

    EXPECT_EQ(stringRead(bytes), bytes);
    EXPECT_EQ(stringRead(std::string(bytes.rbegin(), bytes.rend())),
              std::string(bytes.rbegin(), bytes.rend()));
}

TEST_F(RoundTrip, KeepsStringsOfAnyBytes) {
    EXPECT_TRUE(rc::check("strings of any bytes",
                          [](const std::string& bytes) { RC_ASSERT(stringRead(bytes) == bytes); }));
}

TEST_F(RoundTrip, KeepsALongString) {
    const std::string plain(3'000'000, 'x');
    const std::string escaped(1'000'000, '\x01');

    EXPECT_EQ(stringRead(plain), plain);
    EXPECT_EQ(stringRead(escaped), escaped);
}

TEST_F(RoundTrip, KeepsNamesOfAnyBytes) {
    EXPECT_TRUE(rc::check("names of any bytes", [](std::string name) {
        std::erase(name, '\0');
        const Built built;
        kvsAddTarget(built.file(), name.c_str());
        kvsAddSection(built.file(), name.c_str());
        kvsAddKeyword(built.file(), name.c_str());
        kvsAddInt(built.file(), 5);
        const Loaded loaded(built.text());
        void* const section = kvsSectionByNameNum(loaded.target(name.c_str()), name.c_str(), 1);
        RC_ASSERT(kvsGetInt(kvsParamByNum(kvsKeywordByNameNum(section, name.c_str(), 1), 1)) == 5);
    }));
}

} // namespace
