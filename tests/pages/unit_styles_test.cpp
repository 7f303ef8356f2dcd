#include "editing/base/unit_items.h"
#include "editing/base/unit_styles.h"
#include "platform/framework/exception.h"

#include <gtest/gtest.h>

namespace {

class UnitStylesOfAPage : public testing::Test {
protected:
    UnitStylesOfAPage() {
        styles.SetSize(6);
        styles.Bind(5, UnitItem::Chainage, "%-lf");
    }

    UnitStyles styles;
};

TEST_F(UnitStylesOfAPage, AreKnownByTheirEntries) {
    EXPECT_EQ(styles.At(5).GetUomItemId(), 100143);
    EXPECT_EQ(styles.At(5).UnitConvertFromBase_T(1.5, 1), "1.500000");
}

TEST_F(UnitStylesOfAPage, AreGivenOnce) {
    CKhEditStyle& first = styles.At(5);
    EXPECT_EQ(&styles.Bind(5, UnitItem::FirstOrderRate, "%-g"), &first);
    EXPECT_EQ(first.GetUomItemId(), 100143);
}

TEST_F(UnitStylesOfAPage, StayWhenThereAreToBeMore) {
    styles.SetSize(11);
    EXPECT_EQ(styles.At(5).GetUomItemId(), 100143);
    EXPECT_EQ(styles.Bind(10, UnitItem::FirstOrderRate, "%-g").GetUomItemId(), 100149);
}

TEST_F(UnitStylesOfAPage, FailBeyondTheirNumber) {
    EXPECT_THROW(styles.At(6), CInvalidArgException);
    EXPECT_THROW(styles.Bind(6, UnitItem::Chainage, "%-lf"), CInvalidArgException);
}

TEST_F(UnitStylesOfAPage, FailForAnEntryWithoutAUnit) {
    EXPECT_THROW(styles.At(0), CInvalidArgException);
    EXPECT_THROW(styles.At(4), CInvalidArgException);
}

} // namespace
