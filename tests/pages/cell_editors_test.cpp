#include "editing/base/cell_editors.h"
#include "platform/grid/user.h"

#include <gtest/gtest.h>

namespace {

// A grid with a cell of each editor of the editor's grids, and of two with other arguments.
class ACellEditor : public testing::Test {
protected:
    static constexpr UINT exponentForm = 1;
    static constexpr UINT wideQuality = 2;

    ACellEditor() {
        grid.Create({.kind = kota::WindowKind::Grid});
        grid.Initialize();
        registerCellEditors(grid);
        grid.RegisterControl(exponentForm, std::make_unique<CGridDoubleEdit>(2, 40, false, &grid, 7));
        grid.RegisterControl(wideQuality, std::make_unique<CQualityEdit>(-3, 12, &grid, 8));
        grid.SetColCount(2);
        grid.SetRowCount(1);
    }

    // Makes the cell one of that control, with that value.
    void use(UINT control, const char* value = "") {
        grid.SetStyleRange(CGXRange(1, 1), CGXStyle().SetControl(control).SetValue(value));
    }
    std::string shown(const char* value) {
        grid.SetValueRange(CGXRange(1, 1), value);
        return std::string(grid.GetDisplayText(1, 1).View());
    }
    std::string held() { return std::string(grid.CellText(1, 1)); }
    std::string warning() { return std::string(grid.Warning().text.View()); }
    // Types into the cell and leaves it.
    bool enter(const char* text) {
        EXPECT_TRUE(kota::grid::clickCell(grid, 1, 1));
        EXPECT_TRUE(kota::grid::typeText(grid, text));
        return kota::grid::clickCell(grid, 1, 2);
    }

    CGXGridWnd grid;
};

TEST_F(ACellEditor, IsRegisteredByItsControlIdAndItemNumber) {
    constexpr std::pair<UINT, UINT> items[] = {{4788, 1103}, {4789, 1104}, {4790, 1105}, {4791, 1106}};
    for (const auto& [control, item] : items) {
        use(control);
        EXPECT_EQ(grid.GetControl(1, 1)->ItemId(), item);
    }
}

struct Shown {
    UINT control;
    const char* value;
    const char* text;
};

class AShownValue : public ACellEditor, public testing::WithParamInterface<Shown> {};

TEST_P(AShownValue, HasTheFormOfItsEditorAndStaysAsItIs) {
    use(GetParam().control);
    EXPECT_EQ(shown(GetParam().value), GetParam().text);
    EXPECT_EQ(held(), GetParam().value);
}

INSTANTIATE_TEST_SUITE_P(WithThreeDecimals, AShownValue,
                         testing::Values(Shown{4789, "", ""}, Shown{4789, "1", "1.000"},
                                         Shown{4789, "-0.98765", "-0.988"}, Shown{4789, "1e5", "100000.000"},
                                         Shown{4789, "125.000000.3", "125.000"}, Shown{4789, "x", "0.000"}));
INSTANTIATE_TEST_SUITE_P(WithoutDecimals, AShownValue,
                         testing::Values(Shown{4791, "", ""}, Shown{4791, "12.5", "12"},
                                         Shown{4791, "13.5", "14"}, Shown{4791, "-0.4", "-0"},
                                         Shown{4791, "125.000000.3", "125"}));
INSTANTIATE_TEST_SUITE_P(WithAnExponent, AShownValue,
                         testing::Values(Shown{1, "", ""}, Shown{1, "12345", "1.23E+04"},
                                         Shown{1, "0.5", "5.00E-01"}));
INSTANTIATE_TEST_SUITE_P(OfQuality, AShownValue,
                         testing::Values(Shown{4790, "", ""}, Shown{4790, "3", "3"}, Shown{4790, "3.9", "3"},
                                         Shown{4790, "04", "4"}, Shown{4790, "x", "0"}));
INSTANTIATE_TEST_SUITE_P(InUpperCase, AShownValue,
                         testing::Values(Shown{4788, "", ""}, Shown{4788, "Nile 1", "NILE 1"},
                                         Shown{4788, "gudenå", "GUDENÅ"}, Shown{4788, "ж", "Ж"}));

TEST_F(ACellEditor, TakesANumberAsItIsTyped) {
    for (const UINT control : {4789U, 4791U, exponentForm}) {
        use(control, "1");
        EXPECT_TRUE(enter("-1.50e0"));
        EXPECT_EQ(held(), "-1.50e0");
    }
}

TEST_F(ACellEditor, HoldsTheCellOfANumberThatIsNone) {
    for (const UINT control : {4789U, 4791U, exponentForm}) {
        use(control, "1");
        EXPECT_FALSE(enter("1 "));
        EXPECT_EQ(warning(), "Double number required");
        EXPECT_EQ(held(), "1");
        EXPECT_TRUE(kota::grid::typeText(grid, "2"));
        EXPECT_TRUE(kota::grid::clickCell(grid, 1, 2)) << "until it is mended";
    }
}

TEST_F(ACellEditor, TakesABlankAlways) {
    for (const UINT control : {4788U, 4789U, 4790U, 4791U, exponentForm, wideQuality}) {
        use(control, "1");
        EXPECT_TRUE(enter(""));
        EXPECT_EQ(held(), "");
    }
}

TEST_F(ACellEditor, StoresTextInUpperCase) {
    use(4788);
    EXPECT_TRUE(enter("élan ß 1"));
    EXPECT_EQ(held(), "ÉLAN ß 1") << "no letter becomes two";
}

struct Quality {
    UINT control;
    const char* text;
    const char* warning; // "" when the text is taken
};

class AQuality : public ACellEditor, public testing::WithParamInterface<Quality> {};

TEST_P(AQuality, IsAnIntegerWithinTheBounds) {
    const std::string expected = GetParam().warning;
    use(GetParam().control, "1");
    EXPECT_EQ(enter(GetParam().text), expected.empty()) << GetParam().text;
    EXPECT_EQ(warning(), expected);
    EXPECT_EQ(held(), expected.empty() ? GetParam().text : "1");
}

constexpr const char* outside = "Integer between 0 and 6 required";
constexpr const char* outsideWide = "Integer between -3 and 12 required";

INSTANTIATE_TEST_SUITE_P(FromZeroToSix, AQuality,
                         testing::Values(Quality{4790, "0", ""}, Quality{4790, "6", ""},
                                         Quality{4790, "6.9", ""}, Quality{4790, "7", outside},
                                         Quality{4790, "-1", outside}, Quality{4790, "99", outside}));
INSTANTIATE_TEST_SUITE_P(WithinOtherBounds, AQuality,
                         testing::Values(Quality{2, "-3", ""}, Quality{2, "12", ""},
                                         Quality{2, "-4", outsideWide}, Quality{2, "13", outsideWide}));

} // namespace
