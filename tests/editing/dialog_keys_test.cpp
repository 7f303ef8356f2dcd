#include "platform/framework/dialog.h"
#include "platform/framework/message_box.h"
#include "platform/framework/property_sheet.h"
#include "resources/ids.h"
#include "tests/support/document_window.h"

#include <gmock/gmock.h>

using namespace kota::test;

namespace {

using kota::headless::User;
using testing::ElementsAre;

// What can be reached by the keyboard alone.
class ByTheKeyboard : public DocumentWindow {
protected:
    static constexpr kota::input::Modifiers control{.control = true};

    // Has `user` at the dialog that the command opens.
    void inDialog(UINT command, const std::function<void(CDialog&)>& user) {
        session.screen().answerDialog([&](CDialog& dialog) {
            user(dialog);
            dialog.EndDialog(IDCANCEL);
        });
        EXPECT_TRUE(User(session).command(command));
    }
    static bool isOn(const CDialog& dialog, UINT id) { return dialog.GetDlgItem(id)->GetCheck() != 0; }
};

TEST_F(ByTheKeyboard, TheTabsArePagedRoundTheEnds) {
    create();
    User user(session);
    ASSERT_TRUE(user.selectTab("Components"));
    EXPECT_TRUE(user.key(VK_NEXT, control));
    EXPECT_EQ(user.tab(), "Dispersion");
    EXPECT_TRUE(user.key(VK_PRIOR, control));
    EXPECT_TRUE(user.key(VK_PRIOR, control));
    EXPECT_EQ(user.tab(), "KOTA 32 Additional output");
    EXPECT_TRUE(user.key(VK_NEXT, control));
    EXPECT_EQ(user.tab(), "Components");
}

TEST_F(ByTheKeyboard, ATabWithABadNumberIsNotLeft) {
    create();
    User user(session);
    ASSERT_TRUE(user.selectTab("Decay"));
    ASSERT_TRUE(user.putCursor(1, 2));
    ASSERT_TRUE(user.type("1e"));
    user.key(VK_NEXT, control);
    EXPECT_EQ(user.tab(), "Decay");
    EXPECT_EQ(user.warning(), "Double number required");
}

TEST_F(ByTheKeyboard, AGridIsLeftForTheFieldsBesideIt) {
    create();
    User user(session);
    ASSERT_TRUE(user.selectTab("Dispersion"));
    ASSERT_TRUE(user.putCursor(1, 3));
    const CWnd* const grid = CWnd::GetFocus();
    EXPECT_TRUE(user.key(VK_TAB, control));
    const CWnd* const behind = CWnd::GetFocus();
    EXPECT_NE(behind, grid);
    EXPECT_TRUE(user.page().IsChild(behind));
    EXPECT_TRUE(user.key(VK_TAB, {.shift = true, .control = true}));
    EXPECT_EQ(CWnd::GetFocus(), grid);
}

TEST_F(ByTheKeyboard, ARadioButtonComesOnByAnArrow) {
    createDispersion();
    inDialog(CommandId::Search, [](CDialog& dialog) {
        dialog.GetDlgItem(ControlId::SearchNotUsed)->SetFocus();
        kota::input::click(*dialog.GetDlgItem(ControlId::SearchNotUsed));
        kota::input::key(VK_UP);
        EXPECT_TRUE(isOn(dialog, ControlId::SearchAbove));
        EXPECT_FALSE(isOn(dialog, ControlId::SearchNotUsed));
        EXPECT_EQ(CWnd::GetFocus(), dialog.GetDlgItem(ControlId::SearchAbove));
        kota::input::key(VK_RIGHT);
        kota::input::key(VK_DOWN);
        EXPECT_TRUE(isOn(dialog, ControlId::SearchBelow)) << "round the end of its own group";
        kota::input::key(VK_LEFT);
        EXPECT_TRUE(isOn(dialog, ControlId::SearchNotUsed));
    });
}

TEST_F(ByTheKeyboard, EnterPressesTheButtonThatHasTheFocus) {
    createDispersion();
    User user(session);
    ASSERT_TRUE(user.putCursor(1, 3));
    session.screen().answerDialog([](CDialog& dialog) {
        kota::input::typeText(*dialog.GetDlgItem(ControlId::LineNumber), "2");
        dialog.GetDlgItem(IDCANCEL)->SetFocus();
        kota::input::key(VK_RETURN);
        EXPECT_TRUE(dialog.IsEnded());
    });
    EXPECT_TRUE(user.command(CommandId::GotoLine));
    EXPECT_EQ(user.cursor().first, 1U) << "it was Cancel";
}

TEST_F(ByTheKeyboard, ADialogKeepsItsKeysFromTheMainWindow) {
    createDispersion();
    CKota0_adDoc& document = createDispersion();
    document.SetModifiedFlag(TRUE);
    inDialog(CommandId::GotoLine, [](CDialog&) { kota::input::key('S', {.control = true}); });
    EXPECT_TRUE(document.IsModified()) << "nothing was saved";
}

} // namespace
