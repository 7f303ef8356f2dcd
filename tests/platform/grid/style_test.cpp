#include "platform/grid/style.h"

#include <gmock/gmock.h>

#include <string>

namespace {

TEST(Style, OfNothingGivesWhatHoldsByItself) {
    const CGXStyle style;

    EXPECT_TRUE(style.IsEmpty());
    EXPECT_FALSE(style.HasValue());
    EXPECT_FALSE(style.HasInterior());
    EXPECT_FALSE(style.HasReadOnly());
    EXPECT_EQ(style.GetValue(), "");
    EXPECT_EQ(style.GetControl(), GX_IDS_CTRL_EDIT);
    EXPECT_EQ(style.GetChoiceList(), "");
    EXPECT_FALSE(style.GetReadOnly());
    EXPECT_TRUE(style.GetEnabled());
    EXPECT_EQ(style.GetHorizontalAlignment(), alignLeft);
    EXPECT_EQ(style.GetInterior(), 0xFFFFFFU);
    EXPECT_EQ(style.GetFont(), CGXFont());
    EXPECT_EQ(style.GetUserAttribute(GX_IDS_UA_TOOLTIPTEXT), "");
}

TEST(Style, GivesWhatItWasGiven) {
    const CGXStyle style = CGXStyle()
                               .SetValue("v")
                               .SetControl(52532)
                               .SetChoiceList("a\nb\n")
                               .SetReadOnly(TRUE)
                               .SetEnabled(FALSE)
                               .SetHorizontalAlignment(alignRight)
                               .SetInterior(0x808080)
                               .SetFont({.face = "Sans", .points = 9})
                               .SetUserAttribute(51022, "tip")
                               .SetUserAttribute(3, "other");

    EXPECT_FALSE(style.IsEmpty());
    EXPECT_EQ(style.GetValue(), "v");
    EXPECT_EQ(style.GetControl(), 52532U);
    EXPECT_EQ(style.GetChoiceList(), "a\nb\n");
    EXPECT_TRUE(style.GetReadOnly());
    EXPECT_FALSE(style.GetEnabled());
    EXPECT_EQ(style.GetHorizontalAlignment(), alignRight);
    EXPECT_EQ(style.GetInterior(), 0x808080U);
    EXPECT_EQ(style.GetFont().face, "Sans");
    EXPECT_EQ(style.GetUserAttribute(51022), "tip");
    EXPECT_EQ(style.GetUserAttribute(3), "other");
}

TEST(Style, WritesNumbersAsShortAsTheyReadBack) {
    EXPECT_EQ(CGXStyle().SetValue(-12).GetValue(), "-12");
    EXPECT_EQ(CGXStyle().SetValue(0.1).GetValue(), "0.1");
    EXPECT_EQ(CGXStyle().SetValue(2.0).GetValue(), "2");
    EXPECT_EQ(CGXStyle().SetValue(1029.56).GetValue(), "1029.56");
}

TEST(Style, LaidOverAnotherWinsWhereItIsSet) {
    CGXStyle style = CGXStyle()
                         .SetValue("below")
                         .SetReadOnly(TRUE)
                         .SetInterior(1)
                         .SetUserAttribute(1, "a")
                         .SetUserAttribute(2, "b");

    style.ChangeStyle(CGXStyle().SetReadOnly(FALSE).SetUserAttribute(2, "c"));

    EXPECT_EQ(style, CGXStyle()
                         .SetValue("below")
                         .SetReadOnly(FALSE)
                         .SetInterior(1)
                         .SetUserAttribute(1, "a")
                         .SetUserAttribute(2, "c"));
}

TEST(Style, DoesNotChangeWithItsCopy) {
    const CGXStyle original = CGXStyle().SetValue("original");
    CGXStyle copy = original;

    copy.SetValue("copy");

    EXPECT_EQ(original.GetValue(), "original");
    EXPECT_EQ(copy.GetValue(), "copy");
}

TEST(Style, LaidOverItselfStaysAsItIs) {
    CGXStyle style = CGXStyle().SetValue("v").SetUserAttribute(1, "a");

    style.ChangeStyle(style);

    EXPECT_EQ(style, CGXStyle().SetValue("v").SetUserAttribute(1, "a"));
}

TEST(Style, WithoutItsValueEqualsOneThatNeverHadAny) {
    CGXStyle style = CGXStyle().SetValue("v");
    EXPECT_TRUE(style.HasOnlyValue());

    style.ClearValue();

    EXPECT_FALSE(style.HasOnlyValue());
    EXPECT_TRUE(style.IsEmpty());
    EXPECT_EQ(style, CGXStyle());
    EXPECT_FALSE(style == CGXStyle().SetValue(""));
    EXPECT_FALSE(style == CGXStyle().SetReadOnly(FALSE));
}

TEST(Style, HasABlankValueThatIsNotNone) {
    EXPECT_TRUE(CGXStyle().SetValue("").HasValue());
    EXPECT_EQ(std::string(CGXStyle().SetValue("text").ValueText()), "text");
}

} // namespace
