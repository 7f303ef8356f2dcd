#include "tests/platform/windows/test_windows.h"

#include "platform/framework/controls.h"
#include "platform/framework/input.h"

#include <string_view>

namespace {

using kota::Change;
using kota::WindowKind;
using kota::test::TestWindow;
using kota::test::textOf;
using testing::ElementsAre;

enum : UINT { EditId = 11, OtherId };

// Two edits in a row of a dialog that notes what they tell.
class EditInADialog : public testing::Test {
protected:
    EditInADialog() {
        dialog.onCommand = [this](UINT id, int notification) {
            told.push_back(nameOf(notification) + (id == EditId ? "" : " of the other") + ": " +
                           textOf(edit.GetWindowText()));
            return true;
        };
        kota::tellScreen();
        screen.told.clear();
    }

    static std::string nameOf(int notification) {
        switch (notification) {
        case EN_CHANGE:
            return "change";
        case EN_SETFOCUS:
            return "focus";
        case EN_KILLFOCUS:
            return "leave";
        default:
            return "unknown";
        }
    }

    kota::test::WatchedScreen screen;
    TestWindow dialog;
    TestWindow row{&dialog, WindowKind::Row};
    TestWindow edit{&row, WindowKind::Edit, EditId};
    TestWindow other{&row, WindowKind::Edit, OtherId};
    std::vector<std::string> told;
};

TEST_F(EditInADialog, TellsEachChangeOfItsTextBeforeTheCallReturns) {
    edit.SetWindowText("1");
    EXPECT_THAT(told, ElementsAre("change: 1"));

    edit.SetWindowText("2");
    EXPECT_THAT(told, ElementsAre("change: 1", "change: 2"));
}

TEST_F(EditInADialog, TellsAnEqualTextToo) {
    edit.SetWindowText("1");
    edit.SetWindowText("1");

    EXPECT_THAT(told, ElementsAre("change: 1", "change: 1"));
}

TEST_F(EditInADialog, TellsAChangeWhileItIsDisabled) {
    dialog.EnableWindow(FALSE);

    edit.SetWindowText("1");

    EXPECT_THAT(told, ElementsAre("change: 1"));
}

TEST_F(EditInADialog, NamesItselfInItsNotification) {
    HWND sender = nullptr;
    dialog.onMessage = [&](UINT message, WPARAM wParam, LPARAM lParam) {
        if (message == WM_COMMAND && commandNotification(wParam) == EN_CHANGE)
            sender = reinterpret_cast<HWND>(lParam);
    };

    edit.SetWindowText("1");

    EXPECT_EQ(sender, edit.GetSafeHwnd());
}

TEST_F(EditInADialog, MayBeSetAnewWhileItTells) {
    dialog.onCommand = [&](UINT, int) {
        told.push_back(textOf(edit.GetWindowText()));
        if (edit.GetWindowText() == "1")
            edit.SetWindowText("2");
        return true;
    };

    edit.SetWindowText("1");

    EXPECT_THAT(told, ElementsAre("1", "2"));
    EXPECT_EQ(edit.GetWindowText(), "2");
}

TEST_F(EditInADialog, TellsTheScreenOnceAfterTheTurn) {
    {
        const kota::Turn turn;
        edit.SetWindowText("1");
        edit.SetWindowText("2");
        EXPECT_EQ(screen.told.size(), 0U);
    }

    ASSERT_EQ(screen.told.size(), 1U);
    ASSERT_EQ(screen.told[0].size(), 1U);
    EXPECT_EQ(screen.told[0][0].window, edit.GetSafeHwnd());
    EXPECT_EQ(screen.told[0][0].changes, static_cast<unsigned>(Change::Text));
}

TEST_F(EditInADialog, OfAnotherKindThanEditTellsNothing) {
    row.SetWindowText("caption");

    EXPECT_THAT(told, ElementsAre());
    EXPECT_EQ(row.GetWindowText(), "caption");
}

TEST_F(EditInADialog, TakesTheTextThatAUserTypes) {
    EXPECT_TRUE(kota::input::typeText(edit, "12"));

    EXPECT_THAT(told, ElementsAre("focus: ", "change: 12"));
    EXPECT_EQ(CWnd::GetFocus(), &edit);
}

TEST_F(EditInADialog, TellsTheScreenOnceWhatAUserTyped) {
    kota::input::typeText(edit, "12");

    ASSERT_EQ(screen.told.size(), 1U);
    ASSERT_EQ(screen.told[0].size(), 1U);
    EXPECT_EQ(screen.told[0][0].changes,
              static_cast<unsigned>(Change::Text) | static_cast<unsigned>(Change::Focus));
}

TEST_F(EditInADialog, CutsWhatAUserTypesAtItsLimit) {
    edit.SendMessage(EM_LIMITTEXT, 3);

    EXPECT_TRUE(kota::input::typeText(edit, "12345"));

    EXPECT_EQ(edit.GetWindowText(), "123");
}

TEST_F(EditInADialog, CountsCharactersForItsLimitWhateverTheirBytes) {
    edit.SendMessage(EM_LIMITTEXT, 3);

    EXPECT_TRUE(kota::input::typeText(edit, "\u00e4\u00f6\u20ac\u00fc"));
    EXPECT_EQ(edit.GetWindowText(), "\u00e4\u00f6\u20ac");

    EXPECT_TRUE(kota::input::typeText(edit, "\xe4\xf6\xfc\xdf")); // of an old code page
    EXPECT_EQ(edit.GetWindowText(), "\xe4\xf6\xfc");
}

TEST_F(EditInADialog, CutsNothingThatTheProgramSets) {
    edit.SendMessage(EM_LIMITTEXT, 3);

    edit.SetWindowText("12345");

    EXPECT_EQ(edit.GetWindowText(), "12345");
}

TEST_F(EditInADialog, HasNoLimitWithZero) {
    edit.SendMessage(EM_LIMITTEXT, 3);
    edit.SendMessage(EM_LIMITTEXT, 0);

    kota::input::typeText(edit, "12345");

    EXPECT_EQ(edit.GetWindowText(), "12345");
}

TEST_F(EditInADialog, TakesNoTypingWhileItIsDisabledOrHidden) {
    row.EnableWindow(FALSE);
    EXPECT_FALSE(kota::input::typeText(edit, "1"));

    row.EnableWindow(TRUE);
    edit.ShowWindow(FALSE);
    EXPECT_FALSE(kota::input::typeText(edit, "1"));

    EXPECT_THAT(told, ElementsAre());
    EXPECT_EQ(edit.GetWindowText(), "");
}

TEST_F(EditInADialog, TakesNoTypingWhileAnotherKeepsTheFocus) {
    other.SetFocus();
    other.letsGo = [] { return false; };

    EXPECT_FALSE(kota::input::typeText(edit, "1"));

    EXPECT_EQ(edit.GetWindowText(), "");
    EXPECT_EQ(CWnd::GetFocus(), &other);
}

TEST_F(EditInADialog, TakesNoTypingOnceTheOneThatWasLeftDisabledIt) {
    other.SetFocus();
    other.letsGo = [&] {
        edit.EnableWindow(FALSE);
        return true;
    };

    EXPECT_FALSE(kota::input::typeText(edit, "1"));

    EXPECT_EQ(edit.GetWindowText(), "");
}

TEST_F(EditInADialog, IsLeftBeforeTheNextOneIsEntered) {
    edit.SetFocus();
    told.clear();

    other.SetFocus();

    EXPECT_THAT(told, ElementsAre("leave: ", "focus of the other: "));
}

TEST(Edit, TakesItsLimitFromItsFace) {
    kota::test::WatchedScreen screen;
    CEdit edit;
    edit.Create({.kind = WindowKind::Edit});

    edit.LimitText(2);

    EXPECT_EQ(edit.State()->textLimit, 2);
    kota::input::typeText(edit, "123");
    EXPECT_EQ(edit.GetWindowText(), "12");
}

} // namespace
