#include "platform/framework/dialog.h"
#include "platform/framework/message_box.h"
#include "resources/ids.h"
#include "tests/support/document_window.h"

#include <gmock/gmock.h>

using namespace kota::test;

namespace {

using kota::headless::User;
using testing::ElementsAre;

class GoingToALine : public DocumentWindow {
protected:
    static void typeAndPressOk(CDialog& dialog, const char* number) {
        kota::input::typeText(*dialog.GetDlgItem(ControlId::LineNumber), number);
        kota::input::click(*dialog.GetDlgItem(IDOK));
    }
    void goToLine(const char* number) {
        session.screen().answerDialog([=](CDialog& dialog) {
            typeAndPressOk(dialog, number);
            EXPECT_TRUE(dialog.IsEnded());
        });
        EXPECT_TRUE(User(session).command(CommandId::GotoLine));
    }
};

TEST_F(GoingToALine, MovesTheCursorThere) {
    createDispersion();
    User user(session);
    user.putCursor(1, 3);

    goToLine("2");

    EXPECT_EQ(user.cursor(), std::make_pair(2U, user.grid().GetLeftCol()));
}

TEST_F(GoingToALine, BeyondTheEndGoesToTheLast) {
    createDispersion();

    goToLine("2147483647");

    EXPECT_EQ(User(session).cursor().first, 2U);
}

TEST_F(GoingToALine, BelowOneIsRefusedAndTheDialogStays) {
    CKota0_adDoc& document = createDispersion();
    for (int box = 0; box < 2; ++box)
        session.screen().answerBox(IDOK);
    session.screen().answerDialog([&](CDialog& dialog) {
        EXPECT_EQ(dialog.GetWindowText(), "Go to grid line");
        EXPECT_EQ(dialog.GetDlgItem(ControlId::LineNumber)->GetWindowText(), "0");
        kota::input::click(*dialog.GetDlgItem(IDOK));
        EXPECT_FALSE(dialog.IsEnded());
        typeAndPressOk(dialog, "-1");
        EXPECT_FALSE(dialog.IsEnded());
        EXPECT_EQ(User(viewOf(document)).cursor().first, 1U);
        typeAndPressOk(dialog, "2");
        EXPECT_TRUE(dialog.IsEnded());
    });

    User(session).command(CommandId::GotoLine);

    EXPECT_THAT(boxes(),
                ElementsAre("Line number must be greater than 0", "Line number must be greater than 0"));
    EXPECT_FALSE(session.screen().boxes()[0].caption.has_value());
    EXPECT_EQ(User(session).cursor().first, 2U);
}

TEST_F(GoingToALine, GivesTheFocusToTheTabThatTheShellShowsMeanwhile) {
    createDispersion();
    User user(session);
    user.putCursor(1, 3);
    session.screen().answerDialog([&](CDialog& dialog) {
        user.sheet().SetActivePage(4);
        dialog.EndDialog(IDCANCEL);
    });

    user.command(CommandId::GotoLine);

    EXPECT_EQ(CWnd::GetFocus(), &user.grid(ControlId::DecayGrid));
}

TEST_F(GoingToALine, NeedsANumber) {
    createDispersion();
    session.screen().answerBox(IDOK);
    session.screen().answerDialog([&](CDialog& dialog) {
        typeAndPressOk(dialog, "second");
        EXPECT_FALSE(dialog.IsEnded());
        kota::input::click(*dialog.GetDlgItem(IDCANCEL));
    });

    User(session).command(CommandId::GotoLine);

    EXPECT_EQ(boxes().size(), 1U);
    EXPECT_EQ(User(session).cursor().first, 1U) << "it was cancelled";
}

TEST_F(GoingToALine, IsNotOfferedWhileACellHoldsABadNumber) {
    createDispersion();
    User user(session);
    user.putCursor(1, 3);
    user.type("1x");

    EXPECT_TRUE(user.command(CommandId::GotoLine)) << "no dialog comes up";

    EXPECT_EQ(user.cursor(), std::make_pair(1U, 3U));
    EXPECT_EQ(user.warning(), "Double number required");
    EXPECT_EQ(CWnd::GetFocus(), &user.grid());
}

TEST_F(GoingToALine, WorksOnComponentsAndDecay) {
    CKota0_adDoc& document = create();
    addComponent(document.compList, 1, "BOD", 0);
    addComponent(document.compList, 2, "DO", 0);
    addGlobal(document.decayList, 1);
    addGlobal(document.decayList, 2);
    document.UpdateAllViews(nullptr, UpdateHint::Fill);
    User user(session);

    for (const char* caption : {"Components", "Decay"}) {
        user.selectTab(caption);
        goToLine("2");
        EXPECT_EQ(user.cursor().first, 2U) << caption;
    }
}

TEST_F(GoingToALine, StartsWithZeroEachTime) {
    createDispersion();
    goToLine("2");
    session.screen().answerDialog(
        [](CDialog& dialog) { EXPECT_EQ(dialog.GetDlgItem(ControlId::LineNumber)->GetWindowText(), "0"); });
    User(session).command(CommandId::GotoLine);
}

} // namespace
