#include "tests/platform/windows/test_windows.h"

#include "platform/framework/input.h"

namespace {

using kota::WindowKind;
using kota::test::TestWindow;
using testing::ElementsAre;

// Three edits; what they are told of the focus.
class FocusAmongEdits : public testing::Test {
protected:
    FocusAmongEdits() {
        watch(first, "first");
        watch(second, "second");
        watch(third, "third");
        first.SetFocus();
        told.clear();
    }

    void watch(TestWindow& window, const std::string& name) {
        window.onMessage = [this, name](UINT message, WPARAM, LPARAM) {
            if (message == WM_SETFOCUS || message == WM_KILLFOCUS)
                told.push_back(name + (message == WM_SETFOCUS ? " gets" : " loses"));
        };
    }

    kota::test::WatchedScreen screen;
    std::vector<std::string> told;
    TestWindow dialog;
    TestWindow first{&dialog, WindowKind::Edit};
    TestWindow second{&dialog, WindowKind::Edit};
    TestWindow third{&dialog, WindowKind::Edit};
};

TEST_F(FocusAmongEdits, SaysWhereItGoesAndWhereItComesFrom) {
    HWND goesTo = nullptr;
    HWND cameFrom = nullptr;
    first.onMessage = [&](UINT, WPARAM wParam, LPARAM) { goesTo = reinterpret_cast<HWND>(wParam); };
    second.onMessage = [&](UINT, WPARAM wParam, LPARAM) { cameFrom = reinterpret_cast<HWND>(wParam); };

    second.SetFocus();

    EXPECT_EQ(goesTo, second.GetSafeHwnd());
    EXPECT_EQ(cameFrom, first.GetSafeHwnd());
}

TEST_F(FocusAmongEdits, StaysWithAHolderThatKeepsIt) {
    first.letsGo = [] { return false; };

    EXPECT_EQ(second.SetFocus(), &first);

    EXPECT_EQ(CWnd::GetFocus(), &first);
    EXPECT_THAT(told, ElementsAre());
    EXPECT_FALSE(kota::input::focus(second));
}

TEST_F(FocusAmongEdits, IsNotTakenAwayFromAHolderThatKeepsIt) {
    first.letsGo = [] { return false; };

    SetFocus(nullptr);

    EXPECT_EQ(CWnd::GetFocus(), &first);
}

TEST_F(FocusAmongEdits, IsNotTakenByADisabledWindow) {
    bool asked = false;
    first.letsGo = [&] { return asked = true; };
    second.EnableWindow(FALSE);

    EXPECT_EQ(second.SetFocus(), &first);

    EXPECT_EQ(CWnd::GetFocus(), &first);
    EXPECT_FALSE(asked);
    EXPECT_THAT(told, ElementsAre());
}

TEST_F(FocusAmongEdits, IsNotTakenInsideADisabledWindow) {
    TestWindow group(&dialog, WindowKind::Group);
    TestWindow edit(&group, WindowKind::Edit);
    group.EnableWindow(FALSE);

    edit.SetFocus();

    EXPECT_EQ(CWnd::GetFocus(), &first);
}

TEST_F(FocusAmongEdits, IsNotTakenByAWindowThatIsGone) {
    const HWND gone = second.GetSafeHwnd();
    second.DestroyWindow();

    EXPECT_EQ(SetFocus(gone), first.GetSafeHwnd());

    EXPECT_EQ(CWnd::GetFocus(), &first);
}

TEST_F(FocusAmongEdits, IsNotTakenByAWindowThatTheHolderDisabledOnItsWayOut) {
    first.letsGo = [&] {
        second.EnableWindow(FALSE);
        return true;
    };

    second.SetFocus();

    EXPECT_EQ(CWnd::GetFocus(), &first);
    EXPECT_THAT(told, ElementsAre());
}

TEST_F(FocusAmongEdits, StaysWhenTheHolderClosesTheNextOne) {
    first.letsGo = [&] { return second.DestroyWindow() != 0; };

    second.SetFocus();

    EXPECT_EQ(CWnd::GetFocus(), &first);
    EXPECT_THAT(told, ElementsAre());
}

TEST_F(FocusAmongEdits, IsNobodysWhenTheHolderClosesEverything) {
    const kota::Turn turn;
    first.letsGo = [&] { return dialog.DestroyWindow() != 0; };

    second.SetFocus();

    EXPECT_EQ(GetFocus(), nullptr);
    EXPECT_THAT(told, ElementsAre());
}

TEST_F(FocusAmongEdits, GoesOnFromWhereTheHolderMovedIt) {
    bool moving = false;
    first.letsGo = [&] {
        if (!std::exchange(moving, true))
            third.SetFocus();
        return true;
    };

    second.SetFocus();

    EXPECT_THAT(told, ElementsAre("first loses", "third gets", "third loses", "second gets"));
    EXPECT_EQ(CWnd::GetFocus(), &second);
}

TEST_F(FocusAmongEdits, IsNotMovedTwiceWhenTheHolderMovedItThereItself) {
    bool moving = false;
    first.letsGo = [&] {
        if (!std::exchange(moving, true))
            second.SetFocus();
        return true;
    };

    second.SetFocus();

    EXPECT_THAT(told, ElementsAre("first loses", "second gets"));
    EXPECT_EQ(CWnd::GetFocus(), &second);
}

TEST_F(FocusAmongEdits, IsNobodysWhileItIsOnItsWay) {
    HWND between = first.GetSafeHwnd();
    first.onMessage = [&](UINT message, WPARAM, LPARAM) {
        if (message == WM_KILLFOCUS)
            between = GetFocus();
    };

    second.SetFocus();

    EXPECT_EQ(between, nullptr);
}

TEST_F(FocusAmongEdits, TellsTheScreenOfBothWindows) {
    kota::tellScreen();
    screen.told.clear();
    {
        const kota::Turn turn;
        second.SetFocus();
    }

    ASSERT_EQ(screen.told.size(), 1U);
    std::vector<HWND> windows;
    for (const kota::WindowChange& change : screen.told[0])
        if (change.has(kota::Change::Focus))
            windows.push_back(change.window);
    EXPECT_THAT(windows, ElementsAre(first.GetSafeHwnd(), second.GetSafeHwnd()));
}

TEST_F(FocusAmongEdits, IsNotGivenByAUserToAHiddenWindow) {
    second.ShowWindow(FALSE);

    EXPECT_FALSE(kota::input::focus(second));

    EXPECT_EQ(CWnd::GetFocus(), &first);
}

TEST_F(FocusAmongEdits, IsNotGivenByAUserToAWindowThatTheHolderClosedWithItself) {
    first.letsGo = [&] { return dialog.DestroyWindow() != 0; };

    EXPECT_FALSE(kota::input::focus(second));
}

TEST_F(FocusAmongEdits, LeavesAButtonUnpressedThatTheHolderClosedWithItself) {
    TestWindow button(&dialog, WindowKind::PushButton);
    first.letsGo = [&] { return dialog.DestroyWindow() != 0; };

    EXPECT_FALSE(kota::input::click(button));
}

TEST_F(FocusAmongEdits, LeavesAButtonUnpressedThatIsClosedByItsOwnMessage) {
    TestWindow button(&dialog, WindowKind::PushButton);
    std::vector<UINT> commands;
    dialog.onCommand = [&](UINT id, int notification) {
        if (notification == BN_CLICKED)
            commands.push_back(id);
        return true;
    };
    button.onMessage = [&](UINT message, WPARAM, LPARAM) {
        if (message == WM_SETFOCUS)
            button.DestroyWindow();
    };

    EXPECT_FALSE(kota::input::click(button));

    EXPECT_THAT(commands, ElementsAre());
}

TEST_F(FocusAmongEdits, PressesTheButtonBeforeWhatTheOldHolderPosted) {
    TestWindow button(&dialog, WindowKind::PushButton, 5);
    dialog.onMessage = [&](UINT message, WPARAM, LPARAM) {
        if (message == WM_CLOSE)
            dialog.DestroyWindow();
    };
    std::vector<UINT> commands;
    dialog.onCommand = [&](UINT id, int notification) {
        if (notification == BN_CLICKED)
            commands.push_back(id);
        return true;
    };
    first.onMessage = [&](UINT message, WPARAM, LPARAM) {
        if (message == WM_KILLFOCUS)
            dialog.PostMessage(WM_CLOSE);
    };

    EXPECT_TRUE(kota::input::click(button));

    EXPECT_THAT(commands, ElementsAre(5U));
    EXPECT_EQ(dialog.GetSafeHwnd(), nullptr);
}

} // namespace
