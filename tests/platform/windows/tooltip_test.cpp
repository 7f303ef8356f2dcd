#include "tests/platform/windows/test_windows.h"

#include "platform/framework/tooltip.h"

namespace {

using kota::test::TestWindow;
using kota::test::textOf;

class ToolTips : public testing::Test {
protected:
    ToolTips() { tips.Create(&dialog); }

    std::string first() const { return textOf(firstTool.State()->toolTip); }
    std::string second() const { return textOf(secondTool.State()->toolTip); }

    kota::test::WatchedScreen screen;
    TestWindow dialog;
    TestWindow firstTool{&dialog};
    TestWindow secondTool{&dialog};
    CToolTipCtrl tips;
};

TEST_F(ToolTips, AreSaidByTheirTools) {
    tips.AddTool(&firstTool, "one");
    tips.AddTool(&secondTool, "two");

    EXPECT_EQ(first(), "one");
    EXPECT_EQ(second(), "two");
}

TEST_F(ToolTips, MayBeReplaced) {
    tips.AddTool(&firstTool, "one");

    tips.UpdateTipText("another", &firstTool);

    EXPECT_EQ(first(), "another");
}

TEST_F(ToolTips, AreSilentWhileInactive) {
    tips.AddTool(&firstTool, "one");

    tips.Activate(FALSE);
    EXPECT_FALSE(tips.IsActive());
    EXPECT_EQ(first(), "");

    tips.AddTool(&secondTool, "two");
    EXPECT_EQ(second(), "");

    tips.Activate(TRUE);
    EXPECT_TRUE(tips.IsActive());
    EXPECT_EQ(first(), "one");
    EXPECT_EQ(second(), "two");
}

TEST_F(ToolTips, OutliveATool) {
    tips.AddTool(&firstTool, "one");
    tips.AddTool(&secondTool, "two");
    firstTool.DestroyWindow();

    tips.Activate(FALSE);

    EXPECT_EQ(second(), "");
}

TEST_F(ToolTips, AreToldToTheScreen) {
    kota::tellScreen();
    screen.told.clear();
    {
        const kota::Turn turn;
        tips.AddTool(&firstTool, "one");
    }
    ASSERT_EQ(screen.told.size(), 1U);
    EXPECT_EQ(screen.told[0][0].window, firstTool.GetSafeHwnd());
    EXPECT_TRUE(screen.told[0][0].has(kota::Change::Text));
}

TEST_F(ToolTips, GoWithTheirDialog) {
    dialog.DestroyWindow();

    EXPECT_EQ(tips.GetSafeHwnd(), nullptr);
}

class NotingTips : public CToolTipCtrl {
public:
    LRESULT WindowProc(UINT message, WPARAM wParam, LPARAM lParam) override {
        if (message == TTM_RELAYEVENT)
            relayed = reinterpret_cast<const MSG*>(lParam)->message;
        return CToolTipCtrl::WindowProc(message, wParam, lParam);
    }
    UINT relayed = 0;
};

TEST_F(ToolTips, GetTheMessagesOfTheirTools) {
    NotingTips noting;
    noting.Create(&dialog);
    MSG message{.hwnd = firstTool.GetSafeHwnd(), .message = WM_MOUSEMOVE};

    noting.RelayEvent(&message);

    EXPECT_EQ(noting.relayed, WM_MOUSEMOVE);
}

} // namespace
