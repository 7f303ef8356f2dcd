#include "platform/foundation/edit_style.h"

#include <gtest/gtest.h>
#include <rapidcheck.h>

#include <cmath>
#include <cstdint>
#include <limits>
#include <string_view>

namespace {

constexpr double infinity = std::numeric_limits<double>::infinity();
constexpr int toBase = 0;
constexpr int toDisplay = 1;

constexpr int chainage = 100143;
constexpr int layerHeight = 100155;
constexpr int dimensionlessItem = 100144;
constexpr int unknownItem = 123;

class EditStyle : public testing::Test {
protected:
    ~EditStyle() override { kota::setDisplayUnit(chainage, 0); }

    CKhEditStyle style;
};

// Calls `check` with a style for every item, in each of its units.
template <class Check>
void forEveryUnit(Check check) {
    for (const kota::UnitItem& item : kota::unitItems())
        for (int unit = 0; unit < static_cast<int>(item.units.size()); ++unit)
            check(CKhEditStyle().SetUomUnitBaseGroup(item.id, unit));
}

// What a cell's text becomes when it is stored in a record and the cell is filled from that again.
CString storedAndFilled(const CKhEditStyle& style, std::string_view text) {
    const double value = style.UnitConvertFromBase(kota::textToDouble(text), toBase);
    return style.UnitConvertFromBase_T(value, toDisplay);
}

TEST_F(EditStyle, IsBoundToNothingFromTheStart) {
    EXPECT_EQ(style.GetUomItemId(), 999);
    EXPECT_EQ(style.GetUomUnitId(), -1);
    EXPECT_EQ(style.GetUomToolTipText(), "");
    EXPECT_EQ(style.UnitConvertFromBase(0.1, toDisplay), 0.1);
    EXPECT_EQ(style.UnitConvertFromBase_T(0.1, toDisplay), "0.100000");
}

TEST_F(EditStyle, TakesTheUnitOfTheUsersSettingAtTheTime) {
    kota::setDisplayUnit(chainage, 1);
    style.SetUomUnitBaseGroup(chainage);
    kota::setDisplayUnit(chainage, 0);

    EXPECT_EQ(style.GetUomItemId(), chainage);
    EXPECT_EQ(style.GetUomUnitId(), 1);
    EXPECT_EQ(style.GetUomToolTipText(), "Unit: ft");
    EXPECT_EQ(style.UnitConvertFromBase(0.3048, toDisplay), 1);
    EXPECT_EQ(CKhEditStyle().SetUomUnitBaseGroup(chainage).GetUomToolTipText(), "Unit: m");
}

TEST_F(EditStyle, TakesTheGivenUnitWhateverTheSetting) {
    kota::setDisplayUnit(chainage, 1);

    EXPECT_EQ(style.SetUomUnitBaseGroup(chainage, 0).GetUomToolTipText(), "Unit: m");
    EXPECT_EQ(style.SetUomUnitBaseGroup(layerHeight, 2).GetUomToolTipText(), "Unit: mm");
}

TEST_F(EditStyle, TakesTheBaseUnitForAUnitThatTheItemDoesNotHave) {
    for (const int unit : {-1, 2, std::numeric_limits<int>::max(), std::numeric_limits<int>::min()}) {
        style.SetUomUnitBaseGroup(chainage, unit);

        EXPECT_EQ(style.GetUomUnitId(), 0) << unit;
        EXPECT_EQ(style.GetUomToolTipText(), "Unit: m") << unit;
    }
}

TEST_F(EditStyle, LeavesTheItemBeforeForAnUnknownOne) {
    style.SetUomUnitBaseGroup(chainage, 1).SetUomUnitBaseGroup(unknownItem, 1);

    EXPECT_EQ(style.GetUomItemId(), unknownItem);
    EXPECT_EQ(style.GetUomUnitId(), -1);
    EXPECT_EQ(style.GetUomToolTipText(), "");
    EXPECT_EQ(style.UnitConvertFromBase(7, toDisplay), 7);
}

TEST_F(EditStyle, HasNoToolTipForADimensionlessItem) {
    style.SetUomUnitBaseGroup(dimensionlessItem);

    EXPECT_EQ(style.GetUomUnitId(), 0);
    EXPECT_EQ(style.GetUomToolTipText(), "");
}

TEST_F(EditStyle, ConvertsBothWays) {
    style.SetUomUnitBaseGroup(layerHeight, 1);

    EXPECT_EQ(style.UnitConvertFromBase(0.25, toDisplay), 25);
    EXPECT_EQ(style.UnitConvertFromBase(25, toBase), 0.25);
    EXPECT_EQ(style.UnitConvertFromBase_T(0.25, toDisplay), "25.000000");
    EXPECT_EQ(style.UnitConvertFromBase_T(25, toBase), "0.250000");
}

TEST_F(EditStyle, PrintsInItsFormat) {
    style.SetUomUnitBaseGroup(chainage, 1);
    style.SetFormat("%-.2E");
    EXPECT_EQ(style.UnitConvertFromBase_T(304.8, toDisplay), "1.00E+03");

    style.SetFormat("%.1lf");
    EXPECT_EQ(style.UnitConvertFromBase_T(304.8, toDisplay), "1000.0");

    style.SetFormat(nullptr);
    EXPECT_EQ(style.UnitConvertFromBase_T(304.8, toDisplay), "1000.000000");
}

TEST_F(EditStyle, PrintsTheSameToABuffer) {
    style.SetUomUnitBaseGroup(chainage, 1);
    kota::NumberBuffer buffer;

    EXPECT_EQ(style.print(304.8, toDisplay, buffer), "1000.000000");
    EXPECT_EQ(style.print(1000, toBase, buffer), "304.800000");
}

TEST_F(EditStyle, ConvertsSpecialNumbersLikeOthers) {
    style.SetUomUnitBaseGroup(layerHeight, 1);

    EXPECT_EQ(style.UnitConvertFromBase_T(infinity, toDisplay), "inf");
    EXPECT_EQ(style.UnitConvertFromBase(-infinity, toBase), -infinity);
    EXPECT_TRUE(std::isnan(style.UnitConvertFromBase(std::nan(""), toBase)));
    EXPECT_EQ(style.UnitConvertFromBase_T(1e10, toDisplay), "1000000000000.000000");
}

TEST_F(EditStyle, ACopyKeepsUnitAndFormat) {
    style.SetUomUnitBaseGroup(chainage, 1);
    style.SetFormat("%.1f");
    const CKhEditStyle copy = style;

    style.SetUomUnitBaseGroup(kota::noUnitItem);
    style.SetFormat("%g");

    EXPECT_EQ(copy.UnitConvertFromBase_T(304.8, toDisplay), "1000.0");
}

TEST(EditStyleInEveryUnit, KeepsATextOfACellThroughAStoreAndAFill) {
    EXPECT_TRUE(rc::check("six decimals, below a thousand million", [] {
        const auto millionths =
            *rc::gen::inRange<std::int64_t>(-1'000'000'000'000'000, 1'000'000'000'000'000);
        const double shrunk = *rc::gen::element(1.0, 1e-3, 1e-6, 1e-9);
        const CString typed = kota::NumberFormat("%-lf")(static_cast<double>(millionths) / 1e6 * shrunk);
        forEveryUnit([&](const CKhEditStyle& style) {
            RC_ASSERT(storedAndFilled(style, typed.View()).View() == typed.View());
        });
    }));
}

TEST(EditStyleInEveryUnit, KeepsARecordsNumberThroughASecondFillAndStore) {
    const auto holds = [](const CKhEditStyle& style, double value) {
        const CString filled = style.UnitConvertFromBase_T(value, toDisplay);
        const double stored = style.UnitConvertFromBase(kota::textToDouble(filled.View()), toBase);
        const CString again = style.UnitConvertFromBase_T(stored, toDisplay);
        return again == filled &&
               style.UnitConvertFromBase(kota::textToDouble(again.View()), toBase) == stored;
    };
    EXPECT_TRUE(rc::check("up to a million base units", [&] {
        const double value =
            static_cast<double>(*rc::gen::inRange<std::int64_t>(-1'000'000'000, 1'000'000'000)) /
            *rc::gen::element(1e3, 7e3, 1e6, 3e9, 1e15);
        forEveryUnit([&](const CKhEditStyle& style) { RC_ASSERT(holds(style, value)); });
    }));
    for (const double blank : {1e10, infinity, -infinity})
        forEveryUnit([&](const CKhEditStyle& style) { EXPECT_TRUE(holds(style, blank)) << blank; });
}

TEST(EditStyleInEveryUnit, GivesABlankChainageBackInEveryUnit) {
    forEveryUnit([](const CKhEditStyle& style) {
        const CString filled = style.UnitConvertFromBase_T(1e10, toDisplay);
        EXPECT_EQ(style.UnitConvertFromBase(kota::textToDouble(filled.View()), toBase), 1e10) << filled;
    });
}

} // namespace
