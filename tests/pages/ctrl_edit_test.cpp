#include "editing/base/ctrl_edit.h"
#include "platform/framework/input.h"
#include "platform/framework/message_box.h"
#include "platform/headless/session.h"

#include <gmock/gmock.h>

namespace {

std::vector<UINT> relayed;

} // namespace

// Stands before the platform's for all libraries.
void CToolTipCtrl::RelayEvent(MSG* message) {
    relayed.push_back(message->message);
}

namespace {

// An edit of a number, and another window that the focus may leave for.
class AnEditOfANumber : public testing::Test {
protected:
    static constexpr int usersUnit = -1;
    static constexpr int layerHeight = 100155; // m, cm, mm, ft
    static constexpr int noItem = 999;

    AnEditOfANumber() {
        const HWND window = session.mainWindow().GetSafeHwnd();
        edit.Create({.parent = window, .id = 1, .kind = kota::WindowKind::Edit});
        other.Create({.parent = window, .id = 2, .kind = kota::WindowKind::Edit});
    }

    std::string shown() { return std::string(edit.GetWindowText().View()); }
    std::string toolTip() { return std::string(edit.State()->toolTip.View()); }
    bool enter(const char* text) { return kota::input::typeText(edit, text) && kota::input::focus(other); }

    kota::headless::Session session{[](const std::string& text) { ADD_FAILURE() << text; }};
    double number = 0.5;
    CCtrlEdit edit;
    CWnd other;
};

TEST_F(AnEditOfANumber, ShowsItInFixedNotation) {
    edit.Setup(&number, 20, 1, true, noItem, usersUnit);
    EXPECT_EQ(shown(), "0.5");
    EXPECT_EQ(toolTip(), "");
}

TEST_F(AnEditOfANumber, ShowsItWithAnExponent) {
    edit.Setup(&number, 20, 3, false, noItem, usersUnit);
    EXPECT_EQ(shown(), "5.000E-01");
    EXPECT_TRUE(enter("12345"));
    EXPECT_EQ(number, 12345.0);
    EXPECT_EQ(shown(), "1.234E+04") << "half to even, as the C library prints";
}

TEST_F(AnEditOfANumber, ShowsItInTheUnitThatItIsGiven) {
    edit.Setup(&number, 20, 3, true, layerHeight, 2);
    EXPECT_EQ(shown(), "500.000");
    EXPECT_EQ(toolTip(), "Unit: mm");
    EXPECT_TRUE(enter("250"));
    EXPECT_EQ(number, 0.25);
    EXPECT_EQ(shown(), "250.000");
}

TEST_F(AnEditOfANumber, ShowsItInTheUsersUnitOtherwise) {
    ASSERT_TRUE(kota::setDisplayUnit(layerHeight, 1));
    edit.Setup(&number, 20, 3, true, layerHeight, usersUnit);
    ASSERT_TRUE(kota::setDisplayUnit(layerHeight, 0));
    EXPECT_EQ(shown(), "50.000");
    EXPECT_EQ(toolTip(), "Unit: cm");
}

TEST_F(AnEditOfANumber, TakesAsManyCharactersAsItIsTold) {
    edit.Setup(&number, 4, 3, true, noItem, usersUnit);
    EXPECT_TRUE(enter("1.2345"));
    EXPECT_EQ(number, 1.23);
}

TEST_F(AnEditOfANumber, GoesOnWithAnotherOneWhenItIsSetUpAgain) {
    double next = 7.0;
    edit.Setup(&number, 20, 3, true, layerHeight, 2);
    edit.Setup(&next, 20, 0, true, noItem, usersUnit);
    EXPECT_EQ(shown(), "7");
    EXPECT_EQ(toolTip(), "");
    EXPECT_TRUE(enter("8"));
    EXPECT_EQ(next, 8.0);
    EXPECT_EQ(number, 0.5);
}

TEST_F(AnEditOfANumber, HasItsToolTipFollowTheMouse) {
    edit.Setup(&number, 20, 1, true, layerHeight, usersUnit);
    relayed.clear();

    for (const UINT message : {WM_MOUSEMOVE, WM_LBUTTONDOWN, WM_KEYDOWN, WM_LBUTTONUP})
        edit.SendMessage(message);

    EXPECT_THAT(relayed, testing::ElementsAre(WM_MOUSEMOVE, WM_LBUTTONDOWN, WM_LBUTTONUP));
}

TEST_F(AnEditOfANumber, KeepsItForAnEmptyText) {
    edit.Setup(&number, 20, 3, true, noItem, usersUnit);
    EXPECT_TRUE(enter(""));
    EXPECT_EQ(number, 0.5);
    EXPECT_EQ(shown(), "");
}

TEST_F(AnEditOfANumber, TellsTheUserWhenTheTextIsNone) {
    edit.Setup(&number, 20, 3, true, noItem, usersUnit);
    session.screen().answerBox(IDOK);
    enter("1e");
    ASSERT_EQ(session.screen().boxes().size(), 1U);
    EXPECT_EQ(session.screen().boxes().front().text, "Invalid floating point number!");
    EXPECT_EQ(number, 0.5);
    EXPECT_EQ(shown(), "1e");
}

TEST_F(AnEditOfANumber, DoesNothingBeforeItIsSetUp) {
    EXPECT_TRUE(enter("3"));
    EXPECT_EQ(shown(), "3");
}

} // namespace
