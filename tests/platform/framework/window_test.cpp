#include "platform/framework/exception.h"
#include "platform/framework/message_box.h"
#include "platform/framework/window.h"
#include "platform/headless/session.h"

#include <gmock/gmock.h>

#include <functional>
#include <memory>
#include <string>
#include <vector>

namespace {

using testing::ElementsAre;
using testing::HasSubstr;

class ToldWindow : public CWnd {
public:
    explicit ToldWindow(std::string called) : name(std::move(called)) { Create(); }

    LRESULT WindowProc(UINT message, WPARAM wParam, LPARAM lParam) override {
        if (onMessage)
            return onMessage(message, wParam, lParam);
        return 0;
    }

    std::string name;
    std::function<LRESULT(UINT, WPARAM, LPARAM)> onMessage;
};

TEST(Window, AnswersAMessageBeforeSendMessageReturns) {
    ToldWindow window("w");
    window.onMessage = [](UINT message, WPARAM wParam, LPARAM lParam) {
        return static_cast<LRESULT>(message + wParam) + lParam;
    };

    EXPECT_EQ(window.SendMessage(100, 20, 3), 123);
    EXPECT_EQ(SendMessage(window.GetSafeHwnd(), 1, 2, -5), -2);
}

TEST(Window, ThatIsGoneAnswersNothing) {
    ToldWindow window("w");
    window.onMessage = [](UINT, WPARAM, LPARAM) { return LRESULT{1}; };
    const HWND handle = window.GetSafeHwnd();

    EXPECT_TRUE(window.DestroyWindow());

    EXPECT_EQ(SendMessage(handle, 1, 0, 0), 0);
    EXPECT_EQ(window.SendMessage(1), 0);
    EXPECT_FALSE(IsWindow(handle));
    EXPECT_EQ(CWnd::FromHandle(handle), nullptr);
    EXPECT_FALSE(window.DestroyWindow());
}

TEST(Window, HasAHandleThatNoWindowHadBefore) {
    ToldWindow window("w");
    const HWND first = window.GetSafeHwnd();
    EXPECT_FALSE(window.Create());
    window.DestroyWindow();

    EXPECT_TRUE(window.Create());

    EXPECT_NE(window.GetSafeHwnd(), first);
    EXPECT_EQ(CWnd::FromHandle(window.GetSafeHwnd()), &window);
}

class Focus : public testing::Test {
protected:
    Focus() {
        for (ToldWindow* window : {&first, &second, &third})
            window->onMessage = [this, window](UINT message, WPARAM, LPARAM) {
                told.push_back(window->name + (message == WM_SETFOCUS ? " gets" : " loses"));
                return LRESULT{0};
            };
    }

    std::vector<std::string> told;
    ToldWindow first{"first"};
    ToldWindow second{"second"};
    ToldWindow third{"third"};
};

TEST_F(Focus, IsLostByTheOldHolderBeforeTheNewOneGetsIt) {
    first.SetFocus();
    told.clear();

    EXPECT_EQ(second.SetFocus(), &first);

    EXPECT_THAT(told, ElementsAre("first loses", "second gets"));
    EXPECT_EQ(CWnd::GetFocus(), &second);
}

TEST_F(Focus, IsNotMovedToItsHolder) {
    first.SetFocus();
    told.clear();

    first.SetFocus();

    EXPECT_THAT(told, ElementsAre());
}

TEST_F(Focus, IsTakenAway) {
    first.SetFocus();
    told.clear();

    EXPECT_EQ(SetFocus(nullptr), first.GetSafeHwnd());

    EXPECT_THAT(told, ElementsAre("first loses"));
    EXPECT_EQ(GetFocus(), nullptr);
}

TEST_F(Focus, GoesWithItsWindow) {
    first.SetFocus();

    first.DestroyWindow();

    EXPECT_EQ(GetFocus(), nullptr);
}

TEST_F(Focus, IsNobodysWhenTheNewHolderIsClosedByTheOldOne) {
    first.SetFocus();
    first.onMessage = [&](UINT, WPARAM, LPARAM) { return LRESULT{second.DestroyWindow()}; };
    told.clear();

    second.SetFocus();

    EXPECT_THAT(told, ElementsAre());
    EXPECT_EQ(GetFocus(), nullptr);
}

TEST_F(Focus, StaysWhereTheOldHolderSendsIt) {
    first.SetFocus();
    first.onMessage = [&](UINT message, WPARAM, LPARAM) {
        if (message == WM_KILLFOCUS)
            third.SetFocus();
        return LRESULT{0};
    };
    told.clear();

    second.SetFocus();

    EXPECT_THAT(told, ElementsAre("third gets"));
    EXPECT_EQ(CWnd::GetFocus(), &third);
}

TEST(RegisteredMessage, HasOneNumberForOneName) {
    const UINT number = RegisterWindowMessage("KOTATestMessage");

    EXPECT_GE(number, 0xC000U);
    EXPECT_EQ(RegisterWindowMessage("KOTATestMessage"), number);
    EXPECT_NE(RegisterWindowMessage("KOTAOtherTestMessage"), number);
}

TEST(InvalidArgument, EndsTheHandlerAndIsTold) {
    kota::headless::Session session([](const std::string& text) { ADD_FAILURE() << text; });
    session.screen().answerBox(IDOK);
    ToldWindow window("w");
    window.onMessage = [](UINT, WPARAM, LPARAM) -> LRESULT { AfxThrowInvalidArgException("GetNext"); };

    EXPECT_EQ(window.SendMessage(1), 0);

    ASSERT_EQ(session.screen().boxes().size(), 1U);
    EXPECT_THAT(std::string(session.screen().boxes()[0].text), HasSubstr("GetNext"));
}

} // namespace
