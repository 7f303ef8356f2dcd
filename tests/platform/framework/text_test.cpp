#include "platform/framework/text.h"

#include <gtest/gtest.h>

#include <string_view>
#include <utility>

namespace {

using namespace std::string_view_literals;

TEST(Text, IsEmptyFromANullPointer) {
    const char* none = nullptr;
    CString text(none);

    EXPECT_TRUE(text.IsEmpty());
    text = "something";
    text = none;
    EXPECT_EQ(text, "");
    text += none;
    EXPECT_EQ(text.GetLength(), 0);
}

TEST(Text, HoldsAnyBytes) {
    const CString text("a\0b\xFF"sv);

    EXPECT_EQ(text.GetLength(), 4);
    EXPECT_EQ(text.View(), "a\0b\xFF"sv);
}

TEST(Text, ACopyDoesNotChangeWithItsOriginal) {
    CString original("river");
    const CString copy = original;

    original += " bed";

    EXPECT_EQ(copy, "river");
    EXPECT_EQ(original, "river bed");
}

TEST(Text, AnOriginalDoesNotChangeWithItsCopy) {
    const CString original("river");
    CString copy;
    copy = original;

    copy.Empty();

    EXPECT_EQ(original, "river");
}

TEST(Text, GrowsByATextOfItsOwn) {
    CString text("ab");

    text += text;
    text += static_cast<const char*>(text);
    text += 'c';

    EXPECT_EQ(text, "ababababc");
}

TEST(Text, MovesLeaveTheBytesWithTheNewText) {
    CString source("river");
    const CString target = std::move(source);

    EXPECT_EQ(target, "river");
}

TEST(Text, IsAssignedToItself) {
    CString text("river");

    text = static_cast<const CString&>(text);
    text = static_cast<const char*>(text);

    EXPECT_EQ(text, "river");
}

TEST(Text, IsFormattedWithAnArgumentOfItsOwnBytes) {
    CString text("12");

    text.Format("%s and %d", static_cast<const char*>(text), 7);

    EXPECT_EQ(text, "12 and 7");
}

TEST(Text, ComparesByUnsignedBytesAndCase) {
    EXPECT_LT(CString("z").Compare("\xC3\xA5"), 0);
    EXPECT_LT(CString("A").Compare("a"), 0);
    EXPECT_EQ(CString("a").Compare("a"), 0);
    EXPECT_GT(CString("ab").Compare("a"), 0);
    EXPECT_TRUE(CString("a") < CString("b"));
    EXPECT_FALSE(CString("a") == "A");
}

TEST(Text, IsPutTogether) {
    EXPECT_EQ(CString("a") + CString("b"), "ab");
    EXPECT_EQ("a" + CString("b"), "ab");
    EXPECT_EQ(CString("a") + "b", "ab");
}

} // namespace
