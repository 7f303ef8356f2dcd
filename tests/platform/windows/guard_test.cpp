#include "tests/platform/windows/test_windows.h"

#include "platform/framework/exception.h"
#include "platform/framework/input.h"
#include "platform/framework/message_box.h"

namespace {

using kota::WindowKind;
using kota::test::TestWindow;
using kota::test::textOf;
using testing::HasSubstr;

class InvalidArgumentFailure : public kota::test::WithSession {
protected:
    InvalidArgumentFailure() {
        session.screen().answerBox(IDOK);
        dialog.onCommand = [](UINT, int) -> bool { AfxThrowInvalidArgException("GetNext"); };
    }

    void expectTold(const char* operation) {
        ASSERT_EQ(session.screen().boxes().size(), 1U);
        const kota::MessageBoxRequest& box = session.screen().boxes()[0];
        EXPECT_THAT(textOf(box.text), HasSubstr(operation));
        EXPECT_EQ(box.owner, session.mainWindow().GetSafeHwnd());
    }

    TestWindow dialog;
    TestWindow button{&dialog, WindowKind::PushButton, 5};
    TestWindow edit{&dialog, WindowKind::Edit, 6};
};

TEST_F(InvalidArgumentFailure, InAHandlerOfACommandIsToldAndGivesZero) {
    EXPECT_EQ(dialog.SendMessage(WM_COMMAND, commandParam(1, 0)), 0);

    expectTold("GetNext");
}

TEST_F(InvalidArgumentFailure, InANotificationLeavesTheSenderUnharmed) {
    edit.SetWindowText("1");

    EXPECT_EQ(edit.GetWindowText(), "1");
    expectTold("GetNext");
}

TEST_F(InvalidArgumentFailure, InAPostedMessageEndsThatMessageAlone) {
    int others = 0;
    dialog.onMessage = [&](UINT message, WPARAM, LPARAM) { others += message == 1001; };
    {
        const kota::Turn turn;
        dialog.PostMessage(WM_COMMAND, commandParam(1, 0));
        dialog.PostMessage(1001);
    }
    EXPECT_EQ(others, 1);
    expectTold("GetNext");
}

TEST_F(InvalidArgumentFailure, OnTheWayOfAKeyIsToldAndGivesFalse) {
    dialog.onCommand = nullptr;
    edit.SetFocus();
    dialog.onKey = [](WPARAM) -> bool { AfxThrowInvalidArgException("GetAt"); };

    EXPECT_FALSE(kota::input::key(VK_RETURN));

    expectTold("GetAt");
}

TEST_F(InvalidArgumentFailure, OfAKeyLetsItsModifiersGo) {
    dialog.onCommand = nullptr;
    edit.SetFocus();
    dialog.onKey = [](WPARAM) -> bool { AfxThrowInvalidArgException("GetAt"); };

    kota::input::key(VK_RETURN, {.shift = true});

    EXPECT_EQ(GetKeyState(VK_SHIFT), 0);
}

TEST_F(InvalidArgumentFailure, WhileTheFocusIsLetGoIsTold) {
    dialog.onCommand = nullptr;
    edit.SetFocus();
    edit.letsGo = []() -> bool { AfxThrowInvalidArgException("SetAt"); };

    kota::input::focus(button);

    expectTold("SetAt");
}

} // namespace
