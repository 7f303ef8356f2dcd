#include "tests/platform/windows/test_windows.h"

#include "platform/framework/frame.h"
#include "platform/framework/input.h"

namespace {

using kota::Change;
using kota::Turn;
using kota::test::TestWindow;
using testing::ElementsAre;

// Counts how many of it were deleted.
class Mortal : public CObject {
public:
    explicit Mortal(int& deleted) : deleted_(&deleted) {}
    ~Mortal() override { ++*deleted_; }

private:
    int* deleted_;
};

class TheTurn : public testing::Test {
protected:
    TheTurn() {
        window.onMessage = [this](UINT message, WPARAM, LPARAM) { got.push_back(message); };
        kota::tellScreen();
        screen.told.clear();
        screen.pendingCalls = 0;
    }

    kota::test::WatchedScreen screen;
    std::vector<UINT> got;
    TestWindow window;
    int deleted = 0;
};

TEST_F(TheTurn, DeliversPostedMessagesAtItsEndInTheirOrder) {
    {
        const Turn turn;
        EXPECT_TRUE(window.PostMessage(1001));
        EXPECT_TRUE(window.PostMessage(1002));
        window.SendMessage(1003);
        EXPECT_THAT(got, ElementsAre(1003U));
    }
    EXPECT_THAT(got, ElementsAre(1003U, 1001U, 1002U));
}

TEST_F(TheTurn, DeliversWhatAPostedMessagePosts) {
    window.onMessage = [this](UINT message, WPARAM, LPARAM) {
        got.push_back(message);
        if (message == 1001)
            window.PostMessage(1002);
    };
    {
        const Turn turn;
        window.PostMessage(1001);
    }
    EXPECT_THAT(got, ElementsAre(1001U, 1002U));
}

TEST_F(TheTurn, EndsThoughAMessageAlwaysPostsItselfAnew) {
    window.onMessage = [this](UINT message, WPARAM, LPARAM) {
        got.push_back(message);
        window.PostMessage(message);
    };
    {
        const Turn turn;
        window.PostMessage(1001);
    }
    EXPECT_GT(got.size(), 1U);
    window.onMessage = nullptr;
}

TEST_F(TheTurn, DropsAPostedMessageOfAWindowThatIsGone) {
    {
        const Turn turn;
        window.PostMessage(1001);
        window.DestroyWindow();
        EXPECT_FALSE(window.PostMessage(1002));
    }
    EXPECT_THAT(got, ElementsAre());
}

TEST_F(TheTurn, DeletesAtTheEndOfTheOutermostOneOnly) {
    {
        const Turn outer;
        {
            const Turn inner;
            kota::deleteLater(new Mortal(deleted));
        }
        EXPECT_EQ(deleted, 0);
    }
    EXPECT_EQ(deleted, 1);
}

TEST_F(TheTurn, DeletesAnObjectOnceThatWasPutOffTwice) {
    {
        const Turn turn;
        auto* const object = new Mortal(deleted);
        kota::deleteLater(object);
        kota::deleteLater(object);
        kota::deleteLater(nullptr);
    }
    EXPECT_EQ(deleted, 1);
}

TEST_F(TheTurn, DeletesAfterPostedMessagesWereDelivered) {
    int deletedBefore = -1;
    window.onMessage = [&](UINT, WPARAM, LPARAM) { deletedBefore = deleted; };
    {
        const Turn turn;
        kota::deleteLater(new Mortal(deleted));
        window.PostMessage(1001);
    }
    EXPECT_EQ(deletedBefore, 0);
    EXPECT_EQ(deleted, 1);
}

TEST_F(TheTurn, TellsTheScreenOnceWithAllThatChangedOfAWindow) {
    TestWindow other;
    kota::tellScreen();
    screen.told.clear();
    {
        const Turn turn;
        window.SetToolTip("tip");
        other.BringWindowToTop();
        window.ShowWindow(FALSE);
        window.DrawMenuBar();
    }
    ASSERT_EQ(screen.told.size(), 1U);
    ASSERT_EQ(screen.told[0].size(), 2U);
    const kota::WindowChange& change = screen.told[0][0];
    EXPECT_EQ(change.window, window.GetSafeHwnd());
    EXPECT_TRUE(change.has(Change::Text) && change.has(Change::State) && change.has(Change::Menu));
    EXPECT_FALSE(change.has(Change::Raised));
    EXPECT_EQ(screen.told[0][1].window, other.GetSafeHwnd());
    EXPECT_EQ(screen.told[0][1].changes, static_cast<unsigned>(Change::Raised));
}

TEST_F(TheTurn, TellsTheScreenWhatPostedMessagesChanged) {
    window.onMessage = [this](UINT, WPARAM, LPARAM) { window.EnableWindow(FALSE); };
    {
        const Turn turn;
        window.PostMessage(1001);
    }
    ASSERT_EQ(screen.told.size(), 1U);
    EXPECT_TRUE(screen.told[0][0].has(Change::State));
}

TEST_F(TheTurn, TellsTheScreenNothingWhereNothingChanged) {
    {
        const Turn turn;
        window.SendMessage(1001);
    }
    EXPECT_EQ(screen.told.size(), 0U);
    EXPECT_EQ(screen.pendingCalls, 0);
}

TEST_F(TheTurn, TellsOfWindowsThatCameAndWent) {
    HWND handle = nullptr;
    {
        const Turn turn;
        TestWindow passing;
        handle = passing.GetSafeHwnd();
    }
    ASSERT_EQ(screen.told.size(), 1U);
    EXPECT_EQ(screen.told[0][0].window, handle);
    EXPECT_TRUE(screen.told[0][0].has(Change::Made) && screen.told[0][0].has(Change::Gone));
}

TEST_F(TheTurn, IsAskedForWhenSomethingChangesOutsideOfOne) {
    window.SetToolTip("tip");
    window.ShowWindow(FALSE);
    EXPECT_EQ(screen.pendingCalls, 1);
    EXPECT_EQ(screen.told.size(), 0U);
    { const Turn turn; }
    EXPECT_EQ(screen.told.size(), 1U);
    window.ShowWindow(TRUE);
    EXPECT_EQ(screen.pendingCalls, 2);
}

TEST_F(TheTurn, IsAskedForByAPostedMessageAndADeletionOutsideOfOne) {
    window.PostMessage(1001);
    EXPECT_EQ(screen.pendingCalls, 1);
    kota::deleteLater(new Mortal(deleted));
    EXPECT_EQ(screen.pendingCalls, 2);
    EXPECT_EQ(deleted, 0);
    { const Turn turn; }
    EXPECT_THAT(got, ElementsAre(1001U));
    EXPECT_EQ(deleted, 1);
}

TEST_F(TheTurn, IsNotAskedForWithinOne) {
    const Turn turn;
    window.SetToolTip("tip");
    window.PostMessage(1001);
    kota::deleteLater(new Mortal(deleted));

    EXPECT_EQ(screen.pendingCalls, 0);
}

const kota::Module& turnModule() {
    static const kota::Module module("turn test", kota::Resources{});
    return module;
}

// A view that sends a message on a command and says afterwards what it is still.
class SendingView : public CView {
    DECLARE_DYNCREATE(SendingView)
public:
    ~SendingView() override { ++deletedViews; }

    BOOL OnCmdMsg(UINT /*id*/, int /*notification*/) override {
        receiver->SendMessage(1001);
        note = GetSafeHwnd() ? "open" : "closed";
        frameIsThere = GetParentFrame() != nullptr;
        return TRUE;
    }

    static inline int deletedViews = 0;
    static inline CWnd* receiver = nullptr;
    static inline std::string note;
    static inline bool frameIsThere = true;
};
IMPLEMENT_DYNCREATE(SendingView, CView, turnModule)

TEST_F(TheTurn, KeepsTheObjectsOfAFrameThatIsClosedInsideAMessageItSent) {
    auto* const frame = new CMDIChildWnd;
    ASSERT_TRUE(frame->LoadFrame(&window, {.viewClass = RUNTIME_CLASS(SendingView)}));
    const HWND handle = frame->GetSafeHwnd();
    TestWindow shell;
    shell.onMessage = [&](UINT, WPARAM, LPARAM) { kota::input::close(*frame); };
    SendingView::receiver = &shell;
    SendingView::deletedViews = 0;
    {
        const Turn turn;
        EXPECT_EQ(SendMessage(handle, WM_COMMAND, commandParam(1, 0), 0), 1);
        EXPECT_EQ(SendingView::note, "closed");
        EXPECT_FALSE(SendingView::frameIsThere);
        EXPECT_FALSE(IsWindow(handle));
        EXPECT_EQ(SendingView::deletedViews, 0);
    }
    EXPECT_EQ(SendingView::deletedViews, 1);
}

} // namespace
