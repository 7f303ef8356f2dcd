#include "tests/platform/windows/test_windows.h"

#include "platform/framework/dialog.h"
#include "platform/framework/input.h"
#include "platform/framework/message_box.h"

namespace {

using kota::WindowKind;
using kota::test::TestWindow;
using testing::ElementsAre;

enum : UINT { KeyDialog = 400 };
enum : UINT { First = 10, Second, Disabled, Hidden, InDisabled, InGroup, OnRadio, OffRadio, Box, Last };

constexpr kota::DialogItem disabledItems[] = {kota::field("In disabled", InDisabled)};
constexpr kota::DialogItem groupItems[] = {
    kota::field("In group", InGroup),
    {.kind = WindowKind::RadioButton, .id = OnRadio, .caption = "On", .startsGroup = true},
    kota::control(WindowKind::RadioButton, OffRadio, "Off"),
};
constexpr kota::DialogItem rowItems[] = {kota::control(WindowKind::CheckBox, Box, "Box"),
                                         kota::control(WindowKind::PushButton, Last, "Last")};
constexpr kota::DialogItem keyItems[] = {
    kota::label("Label"),
    kota::field("First", First),
    kota::field("Second", Second),
    {.kind = WindowKind::Edit, .id = Disabled, .caption = "Disabled", .enabled = false},
    {.kind = WindowKind::Edit, .id = Hidden, .caption = "Hidden", .visible = false},
    {.kind = WindowKind::Group, .caption = "Disabled group", .items = disabledItems, .enabled = false},
    kota::group("Group", groupItems),
    kota::row(rowItems),
};
constexpr kota::DialogItem oneItem[] = {kota::field("Only", First)};
constexpr kota::DialogTemplate dialogs[] = {{.id = KeyDialog, .caption = "Keys", .items = keyItems},
                                            {.id = KeyDialog + 1, .caption = "One", .items = oneItem},
                                            {.id = KeyDialog + 2, .caption = "None"}};

const kota::Module& keyModule() {
    static const kota::Module module("key test", {.dialogs = dialogs});
    return module;
}

class KeyBox : public CDialog {
    DECLARE_DYNAMIC(KeyBox)
public:
    using CDialog::CDialog;
};
IMPLEMENT_DYNAMIC(KeyBox, CDialog, keyModule)

// Three windows inside one another that note the keys that pass.
class AKey : public testing::Test {
protected:
    AKey() {
        watch(outer, "outer");
        watch(middle, "middle");
        watch(inner, "inner");
        inner.SetFocus();
    }

    void watch(TestWindow& window, const std::string& name) {
        window.onKey = [this, name](WPARAM) {
            passed.push_back(name);
            return name == takenBy;
        };
        window.onMessage = [this, name](UINT message, WPARAM, LPARAM) {
            if (message == WM_KEYDOWN || message == WM_HELP)
                passed.push_back(name + (message == WM_HELP ? " help" : " key"));
        };
    }

    kota::test::WatchedScreen screen;
    std::vector<std::string> passed;
    std::string takenBy;
    TestWindow outer;
    TestWindow middle{&outer};
    TestWindow inner{&middle, WindowKind::Edit};
};

TEST_F(AKey, PassesOutwardBeforeTheWindowItselfGetsIt) {
    EXPECT_FALSE(kota::input::key(VK_DOWN));

    EXPECT_THAT(passed, ElementsAre("inner", "middle", "outer", "inner key"));
}

TEST_F(AKey, GoesNoFurtherThanToTheOneThatTookIt) {
    takenBy = "middle";

    EXPECT_TRUE(kota::input::key(VK_DOWN));

    EXPECT_THAT(passed, ElementsAre("inner", "middle"));
}

TEST_F(AKey, IsTakenByAWindowThatClosesTheHolder) {
    middle.onKey = [&](WPARAM) { return outer.DestroyWindow() != 0; };

    EXPECT_TRUE(kota::input::key(VK_DOWN));

    EXPECT_THAT(passed, ElementsAre("inner"));
}

TEST_F(AKey, IsNobodysOnceItsWindowIsClosedOnTheWay) {
    middle.onKey = [&](WPARAM) {
        outer.DestroyWindow();
        return false;
    };

    EXPECT_FALSE(kota::input::key(VK_DOWN));

    EXPECT_THAT(passed, ElementsAre("inner"));
}

TEST_F(AKey, IsNobodysWithoutFocus) {
    SetFocus(nullptr);

    EXPECT_FALSE(kota::input::key(VK_DOWN));

    EXPECT_THAT(passed, ElementsAre());
}

TEST_F(AKey, ComesWithTheModifiersThatAreHeld) {
    std::vector<bool> down;
    inner.onMessage = [&](UINT message, WPARAM, LPARAM) {
        if (message == WM_KEYDOWN)
            for (const WPARAM key : {VK_SHIFT, VK_CONTROL, VK_MENU})
                down.push_back(GetKeyState(key) < 0);
    };

    kota::input::key(VK_DOWN, {.control = true});
    kota::input::key(VK_DOWN, {.shift = true, .alt = true});

    EXPECT_THAT(down, ElementsAre(false, true, false, true, false, true));
    EXPECT_EQ(GetKeyState(VK_CONTROL), 0);
    EXPECT_EQ(GetKeyState(VK_DOWN), 0);
}

TEST_F(AKey, LeavesItsModifiersHeldForWhatItPosts) {
    bool heldThen = false;
    inner.onKey = [&](WPARAM) { return outer.PostMessage(1001) != 0; };
    outer.onMessage = [&](UINT message, WPARAM, LPARAM) {
        if (message == 1001)
            heldThen = GetKeyState(VK_CONTROL) < 0;
    };

    kota::input::key(VK_F4, {.control = true});

    EXPECT_TRUE(heldThen);
    EXPECT_EQ(GetKeyState(VK_CONTROL), 0);
}

TEST_F(AKey, ThatAsksForHelpGoesOutwardUntilSomebodyKnows) {
    EXPECT_FALSE(kota::input::key(VK_F1));

    EXPECT_THAT(passed, ElementsAre("inner", "middle", "outer", "inner help", "middle help", "outer help"));
}

// A dialog with controls of every kind that the Tab key stops at or passes.
class TheTabKey : public testing::Test {
protected:
    TheTabKey() {
        box.Create(KeyDialog, nullptr);
        box.GetDlgItem(OnRadio)->SetCheck(TRUE);
    }

    // Presses Tab as often as this and gives where the focus was.
    static std::vector<UINT> tab(int times, bool backward) {
        std::vector<UINT> stops;
        for (int i = 0; i < times; ++i) {
            EXPECT_TRUE(kota::input::key(VK_TAB, {.shift = backward}));
            stops.push_back(CWnd::GetFocus()->GetDlgCtrlID());
        }
        return stops;
    }

    kota::test::WatchedScreen screen;
    KeyBox box;
};

TEST_F(TheTabKey, GoesThroughTheControlsAndTheirGroupsAndAround) {
    EXPECT_EQ(box.FirstFocusControl(), box.GetDlgItem(First));
    box.GetDlgItem(First)->SetFocus();

    EXPECT_THAT(tab(6, false), ElementsAre(Second, InGroup, OnRadio, Box, Last, First));
}

TEST_F(TheTabKey, GoesBackwardWithShift) {
    box.GetDlgItem(First)->SetFocus();

    EXPECT_THAT(tab(6, true), ElementsAre(Last, Box, OnRadio, InGroup, Second, First));
}

TEST_F(TheTabKey, StopsAtTheCheckedRadioButtonOfAGroup) {
    kota::input::click(*box.GetDlgItem(OffRadio));
    box.GetDlgItem(InGroup)->SetFocus();

    EXPECT_THAT(tab(2, false), ElementsAre(OffRadio, Box));
}

TEST_F(TheTabKey, LeavesNoControlThatKeepsTheFocus) {
    class KeepingEdit : public CWnd {
    public:
        bool LetFocusGo() override { return false; }
    };
    KeepingEdit keeping;
    ASSERT_TRUE(keeping.SubclassDlgItem(First, &box));
    keeping.SetFocus();

    EXPECT_TRUE(kota::input::key(VK_TAB));

    EXPECT_EQ(CWnd::GetFocus(), &keeping);
}

TEST_F(TheTabKey, StaysAtTheOnlyControl) {
    KeyBox one;
    one.Create(KeyDialog + 1, nullptr);
    one.GetDlgItem(First)->SetFocus();

    EXPECT_TRUE(kota::input::key(VK_TAB));

    EXPECT_EQ(CWnd::GetFocus(), one.GetDlgItem(First));
}

TEST_F(TheTabKey, FindsNothingInAnEmptyDialog) {
    KeyBox none;
    none.Create(KeyDialog + 2, nullptr);
    none.SetFocus();

    EXPECT_EQ(none.FirstFocusControl(), nullptr);
    EXPECT_TRUE(kota::input::key(VK_TAB));

    EXPECT_EQ(CWnd::GetFocus(), &none);
}

TEST_F(TheTabKey, IsTheOnlyKeyThatADialogWithoutModeTakes) {
    box.GetDlgItem(First)->SetFocus();

    EXPECT_FALSE(kota::input::key(VK_RETURN));
    EXPECT_FALSE(kota::input::key(VK_ESCAPE));

    EXPECT_FALSE(box.IsEnded());
}

TEST(TheKeysOfAModalDialog, EndIt) {
    kota::test::WatchedScreen screen;
    for (const auto& [key, result] : {std::pair(VK_RETURN, IDOK), std::pair(VK_ESCAPE, IDCANCEL)}) {
        KeyBox box(KeyDialog);
        screen.answerDialog([key = key](CDialog& dialog) {
            EXPECT_FALSE(kota::input::key(VK_DOWN));
            EXPECT_FALSE(dialog.IsEnded());
            EXPECT_TRUE(kota::input::key(key));
            EXPECT_TRUE(dialog.IsEnded());
        });

        EXPECT_EQ(box.DoModal(), result);
    }
}

} // namespace
