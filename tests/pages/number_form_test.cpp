#include "editing/base/number_form.h"

#include <gtest/gtest.h>

namespace {

struct Text {
    const char* text;
    bool isNumber;
};

class AText : public testing::TestWithParam<Text> {};

TEST_P(AText, IsANumberInOneFormAlone) {
    EXPECT_EQ(isNumberText(GetParam().text), GetParam().isNumber) << '"' << GetParam().text << '"';
}

INSTANTIATE_TEST_SUITE_P(Numbers, AText,
                         testing::Values(Text{"0", true}, Text{"007", true}, Text{"-12", true},
                                         Text{"+12", true}, Text{"1.5", true}, Text{".5", true},
                                         Text{"-.5", true}, Text{"+.25", true}, Text{"1e5", true},
                                         Text{"1E5", true}, Text{"1e+5", true}, Text{"1e-5", true},
                                         Text{".5e1", true}, Text{"-1.25E-03", true}, Text{"1e0005", true},
                                         Text{"12345678901234567890", true}));

INSTANTIATE_TEST_SUITE_P(Incomplete, AText,
                         testing::Values(Text{"", false}, Text{"-", false}, Text{"+", false},
                                         Text{".", false}, Text{"-.", false}, Text{"3.", false},
                                         Text{"+3.", false}, Text{"5.e3", false}, Text{"1e", false},
                                         Text{"1E+", false}, Text{"1e-", false}, Text{"e5", false},
                                         Text{"E5", false}, Text{"-e5", false}, Text{".e5", false}));

INSTANTIATE_TEST_SUITE_P(WithMore, AText,
                         testing::Values(Text{" 1", false}, Text{"1 ", false}, Text{"1 2", false},
                                         Text{"- 1", false}, Text{"1e 5", false}, Text{"\t1", false},
                                         Text{"1\n", false}, Text{"--1", false}, Text{"1-", false},
                                         Text{"1.5.2", false}, Text{"1,5", false}, Text{"1e5.0", false},
                                         Text{"1e5e5", false}, Text{"1x", false}, Text{"0x1F", false},
                                         Text{"1d5", false}, Text{"1.5f", false}, Text{"inf", false},
                                         Text{"nan", false}, Text{"\xC2\xA0", false},
                                         Text{"\xD9\xA1", false} /* a digit of another script */));

TEST(ATextWithANul, IsNoNumber) {
    EXPECT_FALSE(isNumberText(std::string_view("1\0", 2)));
    EXPECT_FALSE(isNumberText(std::string_view("1\0002", 3)));
}

} // namespace
