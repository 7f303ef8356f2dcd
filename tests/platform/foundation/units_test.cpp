#include "platform/foundation/units.h"

#include <gtest/gtest.h>
#include <rapidcheck.h>

#include <bit>
#include <cmath>
#include <cstdint>
#include <limits>
#include <stdexcept>
#include <string>
#include <string_view>

namespace {

using kota::findUnitItem;
using kota::toBase;
using kota::toDisplay;
using kota::Unit;
using kota::UnitItem;

constexpr double infinity = std::numeric_limits<double>::infinity();

// As "m | ft": the base unit first.
std::string unitsOf(int item) {
    std::string symbols;
    for (const Unit& unit : findUnitItem(item)->units)
        symbols += (symbols.empty() ? "" : " | ") + std::string(unit.symbol);
    return symbols;
}

const Unit& unitOf(int item, std::string_view symbol) {
    for (const Unit& unit : findUnitItem(item)->units)
        if (unit.symbol == symbol)
            return unit;
    throw std::invalid_argument("no such unit");
}

class UnitSettings : public testing::Test {
protected:
    ~UnitSettings() override {
        for (const UnitItem& item : kota::unitItems())
            kota::setDisplayUnit(item.id, 0);
    }
};

TEST(Units, OfEveryItem) {
    EXPECT_EQ(kota::unitItems().size(), 16u);
    EXPECT_EQ(unitsOf(100143), "m | ft");
    EXPECT_EQ(unitsOf(100147), "m | ft");
    EXPECT_EQ(unitsOf(100155), "m | cm | mm | ft");
    EXPECT_EQ(unitsOf(100149), "1/h | 1/day");
    EXPECT_EQ(unitsOf(100127), "m");
    EXPECT_EQ(unitsOf(100153), "m^2/s");
    EXPECT_EQ(unitsOf(100154), "-");
    EXPECT_EQ(unitsOf(100144), "-");
    EXPECT_EQ(unitsOf(100145), "-");
    EXPECT_EQ(unitsOf(100123), "10^-6 m^2/s");
    EXPECT_EQ(unitsOf(100128), "m/s");
    EXPECT_EQ(unitsOf(100016), "m/s");
    EXPECT_EQ(unitsOf(100152), "N/m^2");
    EXPECT_EQ(unitsOf(100151), "g/(m^2 s)");
    EXPECT_EQ(unitsOf(100032), "m^0.5/s");
    EXPECT_EQ(unitsOf(100017), "kg/m^3");
}

TEST(Units, HaveAnItemPerQuantity) {
    EXPECT_EQ(findUnitItem(100143)->quantity, "chainage");
    EXPECT_EQ(findUnitItem(100147)->quantity, "width");
    for (const UnitItem& item : kota::unitItems())
        EXPECT_EQ(findUnitItem(item.id), &item);
}

TEST(Units, HaveNoItemOutsideTheCatalogue) {
    for (const int item : {kota::noUnitItem, 0, -1, 100000, 100146, 100156, std::numeric_limits<int>::max()})
        EXPECT_EQ(findUnitItem(item), nullptr) << item;
}

TEST(Units, ConvertByTheirExactFactors) {
    EXPECT_EQ(toDisplay(unitOf(100143, "ft"), 0.3048), 1);
    EXPECT_EQ(toBase(unitOf(100143, "ft"), 10), 3.048);
    EXPECT_EQ(toBase(unitOf(100147, "ft"), 1e6), 304800);
    EXPECT_EQ(toBase(unitOf(100143, "ft"), 0.17), 0.051816);
    EXPECT_EQ(toDisplay(unitOf(100143, "ft"), 0.23), 0.7545931758530184);
    EXPECT_EQ(toDisplay(unitOf(100155, "cm"), 0.127), 12.7);
    EXPECT_EQ(toBase(unitOf(100155, "cm"), 12.7), 0.127);
    EXPECT_EQ(toDisplay(unitOf(100155, "mm"), 0.003), 3);
    EXPECT_EQ(toBase(unitOf(100155, "mm"), 0.1), 0.0001);
    EXPECT_EQ(toDisplay(unitOf(100149, "1/day"), 0.5), 12);
    EXPECT_EQ(toBase(unitOf(100149, "1/day"), 6), 0.25);
}

TEST(Units, RoundAWholeNumberOfFeetToTheNearestDouble) {
    EXPECT_TRUE(rc::check("feet", [] {
        const int feet = *rc::gen::inRange(-100'000'000, 100'000'000);
        RC_ASSERT(toBase(unitOf(100143, "ft"), feet) == feet * 3048.0 / 10000.0);
    }));
}

TEST(Units, KeepEveryBitOfAValueInTheBaseUnit) {
    EXPECT_TRUE(rc::check("doubles of any bits", [](std::uint64_t bits) {
        const auto value = std::bit_cast<double>(bits * 0x9E3779B97F4A7C15u);
        for (const UnitItem& item : kota::unitItems()) {
            const Unit& base = item.units.front();
            RC_ASSERT(std::bit_cast<std::uint64_t>(toDisplay(base, value)) ==
                      std::bit_cast<std::uint64_t>(value));
            RC_ASSERT(std::bit_cast<std::uint64_t>(toBase(base, value)) ==
                      std::bit_cast<std::uint64_t>(value));
        }
    }));
}

TEST(Units, ConvertWhatIsNoOrdinaryNumber) {
    const double greatest = std::numeric_limits<double>::max();
    for (const UnitItem& item : kota::unitItems())
        for (const Unit& unit : item.units) {
            EXPECT_EQ(toDisplay(unit, infinity), infinity);
            EXPECT_EQ(toBase(unit, -infinity), -infinity);
            EXPECT_TRUE(std::isnan(toDisplay(unit, std::nan(""))));
            EXPECT_TRUE(std::isnan(toBase(unit, std::nan(""))));
            EXPECT_TRUE(std::signbit(toDisplay(unit, -0.0)));
            EXPECT_TRUE(std::signbit(toBase(unit, -0.0)));
            EXPECT_TRUE(std::isfinite(toBase(unit, greatest)));
        }
    EXPECT_EQ(toDisplay(unitOf(100143, "ft"), greatest), infinity);
    EXPECT_DOUBLE_EQ(toBase(unitOf(100143, "ft"), greatest), greatest * 0.3048);
}

TEST_F(UnitSettings, AreTheBaseUnitFromTheStart) {
    for (const UnitItem& item : kota::unitItems())
        EXPECT_EQ(kota::displayUnit(item.id), 0) << item.id;
}

TEST_F(UnitSettings, AreKeptPerItem) {
    EXPECT_TRUE(kota::setDisplayUnit(100143, 1));
    EXPECT_TRUE(kota::setDisplayUnit(100155, 3));

    EXPECT_EQ(kota::displayUnit(100143), 1);
    EXPECT_EQ(kota::displayUnit(100155), 3);
    EXPECT_EQ(kota::displayUnit(100147), 0);
}

TEST_F(UnitSettings, TakeOnlyAUnitThatTheItemHas) {
    kota::setDisplayUnit(100143, 1);

    EXPECT_FALSE(kota::setDisplayUnit(100143, 2));
    EXPECT_FALSE(kota::setDisplayUnit(100143, -1));
    EXPECT_FALSE(kota::setDisplayUnit(kota::noUnitItem, 0));

    EXPECT_EQ(kota::displayUnit(100143), 1);
    EXPECT_EQ(kota::displayUnit(kota::noUnitItem), -1);
}

} // namespace
