#include "platform/framework/message_box.h"
#include "tests/pages/tabs.h"

namespace {

using kota::test::recordOf;
using testing::ElementsAre;
using testing::IsEmpty;

namespace Edit {
constexpr UINT Factor = 1008;
constexpr UINT Exponent = 1010;
constexpr UINT Minimum = 1012;
constexpr UINT Maximum = 1015;
} // namespace Edit

constexpr const char* boundsMessage = "Maximum disp. coef. must be greater than minimum disp. coef.";

class TheDispersionEdits : public kota::test::OnATab {
protected:
    TheDispersionEdits() : OnATab("Dispersion") {}

    AD_Global_Var& globals() { return document().globalVar; }
    std::string toolTipOf(UINT id) { return kota::test::textOf(user->control(id).State()->toolTip); }
};

TEST_F(TheDispersionEdits, ShowTheGlobalValuesWithThreeDecimals) {
    EXPECT_EQ(user->textOf(Edit::Factor), "0.000");
    EXPECT_EQ(user->textOf(Edit::Exponent), "0.000");
    EXPECT_EQ(user->textOf(Edit::Minimum), "0.000");
    EXPECT_EQ(user->textOf(Edit::Maximum), "100.000");
}

TEST_F(TheDispersionEdits, ShowTheDocumentsStateEachTimeTheTabComesToTheFront) {
    leaveTab();
    globals().G_exponent = -1.25;
    ASSERT_TRUE(user->selectTab("Dispersion"));
    EXPECT_EQ(user->textOf(Edit::Exponent), "-1.250");
}

TEST_F(TheDispersionEdits, BearTheirNames) {
    EXPECT_EQ(user->control(Edit::Factor).State()->label, "Dispersion factor");
    EXPECT_EQ(user->control(Edit::Exponent).State()->label, "Exponent");
    EXPECT_EQ(user->control(Edit::Minimum).State()->label, "Minimum disp. coefficient");
    EXPECT_EQ(user->control(Edit::Maximum).State()->label, "Maximum disp. coefficient");
}

TEST_F(TheDispersionEdits, TellTheirUnits) {
    EXPECT_EQ(toolTipOf(Edit::Factor), "");
    EXPECT_EQ(toolTipOf(Edit::Exponent), "");
    EXPECT_EQ(toolTipOf(Edit::Minimum), "Unit: m^2/s");
    EXPECT_EQ(toolTipOf(Edit::Maximum), "Unit: m^2/s");
}

TEST_F(TheDispersionEdits, WriteEachItsOwnValueWhenTheFocusLeaves) {
    ASSERT_TRUE(user->enterInto(Edit::Factor, "1.5"));
    ASSERT_TRUE(user->enterInto(Edit::Exponent, "-.5"));
    ASSERT_TRUE(user->enterInto(Edit::Minimum, "+2"));
    ASSERT_TRUE(user->enterInto(Edit::Maximum, "3e2"));
    EXPECT_EQ(globals().G_disp_factor, 1.5);
    EXPECT_EQ(globals().G_exponent, -0.5);
    EXPECT_EQ(globals().G_min_disp_coef, 2.0);
    EXPECT_EQ(globals().G_max_disp_coef, 300.0);
    EXPECT_EQ(user->textOf(Edit::Exponent), "-0.500");
    EXPECT_EQ(user->textOf(Edit::Maximum), "300.000");
    EXPECT_TRUE(document().IsModified());
}

TEST_F(TheDispersionEdits, WriteNothingWhileTheFocusStays) {
    ASSERT_TRUE(user->typeInto(Edit::Factor, "1.5"));
    EXPECT_EQ(globals().G_disp_factor, 0.0);
    EXPECT_FALSE(document().IsModified());
    ASSERT_TRUE(user->goTo(Edit::Exponent));
    EXPECT_EQ(globals().G_disp_factor, 1.5);
}

TEST_F(TheDispersionEdits, WriteWhenTheTabIsLeft) {
    ASSERT_TRUE(user->typeInto(Edit::Factor, "1.5"));
    leaveTab();
    EXPECT_EQ(globals().G_disp_factor, 1.5);
}

TEST_F(TheDispersionEdits, StoreTheNumberAsTypedAndShowItRounded) {
    ASSERT_TRUE(user->enterInto(Edit::Factor, "1.23456"));
    EXPECT_EQ(globals().G_disp_factor, 1.23456);
    EXPECT_EQ(user->textOf(Edit::Factor), "1.235");
}

TEST_F(TheDispersionEdits, NormaliseATextOfTheSameValueAndChangeNothing) {
    ASSERT_TRUE(user->enterInto(Edit::Maximum, "1e2"));
    EXPECT_EQ(user->textOf(Edit::Maximum), "100.000");
    EXPECT_FALSE(document().IsModified());
}

TEST_F(TheDispersionEdits, KeepTheOldValueForAnEmptyText) {
    ASSERT_TRUE(user->enterInto(Edit::Maximum, ""));
    EXPECT_EQ(globals().G_max_disp_coef, 100.0);
    EXPECT_EQ(user->textOf(Edit::Maximum), "") << "the text stays until the page is shown anew";
    EXPECT_FALSE(document().IsModified());
    EXPECT_THAT(boxes(), IsEmpty());
    fill();
    EXPECT_EQ(user->textOf(Edit::Maximum), "100.000");
}

TEST_F(TheDispersionEdits, RefuseATextThatIsNoNumber) {
    session.screen().answerBox(IDOK);
    user->enterInto(Edit::Maximum, "12 ");
    EXPECT_THAT(boxes(), ElementsAre("Invalid floating point number!"));
    EXPECT_EQ(globals().G_max_disp_coef, 100.0);
    EXPECT_EQ(user->textOf(Edit::Maximum), "12 ");
    EXPECT_FALSE(document().IsModified());
}

TEST_F(TheDispersionEdits, TakeTwentyCharacters) {
    EXPECT_TRUE(user->typeInto(Edit::Factor, "0.12345678901234567890"));
    EXPECT_EQ(user->textOf(Edit::Factor), "0.123456789012345678");
}

TEST_F(TheDispersionEdits, ChangeNoLine) {
    ASSERT_TRUE(user->enterInto(Edit::Maximum, "300"));
    EXPECT_EQ(user->held(1, 6), "100.000000");
    leaveTab();
    EXPECT_EQ(recordOf(document().dispersList).maxCoef, 100.0);
}

TEST_F(TheDispersionEdits, ShowTheNewValueInTheOtherWindows) {
    ASSERT_TRUE(user->newWindow());
    kota::headless::User other(session);
    ASSERT_NE(&other.view(), &user->view());
    ASSERT_TRUE(other.selectTab("Dispersion"));
    ASSERT_TRUE(other.enterInto(Edit::Exponent, "4"));
    EXPECT_EQ(user->textOf(Edit::Exponent), "4.000");
}

TEST_F(TheDispersionEdits, HoldTheTabWhileTheMinimumIsAboveTheMaximum) {
    ASSERT_TRUE(user->enterInto(Edit::Exponent, "1.5"));
    ASSERT_TRUE(user->enterInto(Edit::Minimum, "100.001"));
    put(1, 1, "NILE");
    put(1, 4, "");
    session.screen().answerBox(IDOK);
    EXPECT_FALSE(user->selectTab("Components"));
    EXPECT_EQ(user->tab(), "Dispersion");
    EXPECT_THAT(boxes(), ElementsAre(boundsMessage));
    EXPECT_EQ(recordOf(document().dispersList).riverName, "NILE") << "the lines are stored all the same";
    EXPECT_EQ(user->held(1, 4), "1.5") << "blanks have their values";
    EXPECT_EQ(recordOf(document().dispersList).exponent, 1.5) << "and these are stored too";
}

TEST_F(TheDispersionEdits, LetTheTabGoWhenTheMinimumIsTheMaximum) {
    ASSERT_TRUE(user->enterInto(Edit::Minimum, "100"));
    EXPECT_TRUE(user->selectTab("Components"));
    EXPECT_THAT(boxes(), IsEmpty());
}

TEST_F(TheDispersionEdits, LetTheTabGoOnceTheBoundsAreMended) {
    ASSERT_TRUE(user->enterInto(Edit::Minimum, "200"));
    session.screen().answerBox(IDOK);
    EXPECT_FALSE(user->selectTab("Components"));
    ASSERT_TRUE(user->typeInto(Edit::Maximum, "201"));
    EXPECT_TRUE(user->selectTab("Components"));
    EXPECT_EQ(globals().G_max_disp_coef, 201.0);
}

} // namespace
