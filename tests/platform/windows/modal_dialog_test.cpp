#include "tests/platform/windows/test_windows.h"

#include "platform/framework/dialog.h"
#include "platform/framework/input.h"
#include "platform/framework/message_box.h"

#include <memory>

namespace {

using kota::WindowKind;
using kota::test::TestWindow;
using testing::ElementsAre;
using testing::HasSubstr;

enum : UINT { NameDialog = 250, NoDialog };
enum : UINT { NameEdit = 10, AgeEdit };

constexpr kota::DialogItem nameItems[] = {kota::field("&Name", NameEdit), kota::field("&Age", AgeEdit)};
constexpr kota::DialogTemplate dialogs[] = {{.id = NameDialog, .caption = "Names", .items = nameItems}};

const kota::Module& modalModule() {
    static const kota::Module module("modal test", {.dialogs = dialogs});
    return module;
}

class NameBox : public CDialog {
    DECLARE_DYNAMIC(NameBox)
public:
    using CDialog::CDialog;

    BOOL OnInitDialog() override {
        if (endsAtOnce)
            EndDialog(IDCANCEL);
        return CDialog::OnInitDialog();
    }
    void DoDataExchange(CDataExchange* exchange) override {
        exchanges.emplace_back(exchange->saveAndValidate ? "save" : "show");
        DDX_Text(exchange, NameEdit, name);
        DDX_Text(exchange, AgeEdit, age);
    }

    CString name;
    int age = 0;
    bool endsAtOnce = false;
    std::vector<std::string> exchanges;
};
IMPLEMENT_DYNAMIC(NameBox, CDialog, modalModule)

class ModalDialog : public testing::Test {
protected:
    kota::test::WatchedScreen screen;
    TestWindow owner;
    TestWindow edit{&owner, WindowKind::Edit};
};

TEST_F(ModalDialog, TakesOverWhatTheUserEnteredOnOk) {
    NameBox box(NameDialog, &owner);
    screen.answerDialog([](CDialog& dialog) {
        kota::input::typeText(*dialog.GetDlgItem(NameEdit), "Platte");
        kota::input::typeText(*dialog.GetDlgItem(AgeEdit), "7");
        kota::input::key(VK_RETURN);
        EXPECT_TRUE(dialog.IsEnded());
    });

    EXPECT_EQ(box.DoModal(), IDOK);

    EXPECT_EQ(box.name, "Platte");
    EXPECT_EQ(box.age, 7);
    EXPECT_EQ(box.GetSafeHwnd(), nullptr);
}

TEST_F(ModalDialog, LeavesItsMembersOnCancel) {
    NameBox box(NameDialog, &owner);
    box.name = "before";
    screen.answerDialog([](CDialog& dialog) {
        kota::input::typeText(*dialog.GetDlgItem(NameEdit), "Platte");
        kota::input::key(VK_ESCAPE);
    });

    EXPECT_EQ(box.DoModal(), IDCANCEL);

    EXPECT_EQ(box.name, "before");
    EXPECT_THAT(box.exchanges, ElementsAre("show"));
}

TEST_F(ModalDialog, IsCancelledByItsCloseButton) {
    NameBox box(NameDialog, &owner);
    screen.answerDialog([](CDialog& dialog) {
        kota::input::close(dialog);
        EXPECT_TRUE(dialog.IsEnded());
    });

    EXPECT_EQ(box.DoModal(), IDCANCEL);
}

TEST_F(ModalDialog, IsEndedByTheCommandsOfItsButtons) {
    for (const int button : {IDOK, IDCANCEL}) {
        NameBox box(NameDialog, &owner);
        screen.answerDialog([&](CDialog& dialog) {
            dialog.SendMessage(WM_COMMAND, commandParam(static_cast<UINT>(button), BN_CLICKED));
        });

        EXPECT_EQ(box.DoModal(), button);
    }
}

TEST_F(ModalDialog, StaysOpenWhileItHoldsWhatItCannotTakeOver) {
    NameBox box(NameDialog, &owner);
    box.age = 3;
    screen.answerBox(IDOK);
    screen.answerDialog([](CDialog& dialog) {
        kota::input::typeText(*dialog.GetDlgItem(AgeEdit), "many");
        kota::input::key(VK_RETURN);
        EXPECT_FALSE(dialog.IsEnded());
        kota::input::key(VK_ESCAPE);
    });

    EXPECT_EQ(box.DoModal(), IDCANCEL);

    EXPECT_EQ(box.age, 3);
    ASSERT_EQ(screen.boxes().size(), 1U);
}

TEST_F(ModalDialog, BorrowsTheFocusAndGivesItBack) {
    edit.SetFocus();
    NameBox box(NameDialog, &owner);
    UINT focused = 0;
    screen.answerDialog([&](CDialog& dialog) {
        focused = CWnd::GetFocus()->GetDlgCtrlID();
        dialog.EndDialog(IDOK);
    });

    box.DoModal();

    EXPECT_EQ(focused, NameEdit);
    EXPECT_EQ(CWnd::GetFocus(), &edit);
}

TEST_F(ModalDialog, IsNotShownWhileAnotherWindowKeepsTheFocus) {
    edit.SetFocus();
    edit.letsGo = [] { return false; };
    NameBox box(NameDialog, &owner);

    EXPECT_EQ(box.DoModal(), IDCANCEL); // the script has no answer for a dialog

    EXPECT_EQ(CWnd::GetFocus(), &edit);
}

TEST_F(ModalDialog, LeavesNoFocusBehindWhereThereWasNone) {
    NameBox box(NameDialog, &owner);
    screen.answerDialog([](CDialog& dialog) { dialog.EndDialog(IDOK); });

    box.DoModal();

    EXPECT_EQ(GetFocus(), nullptr);
}

TEST_F(ModalDialog, SurvivesThatItsOwnerIsClosedBehindIt) {
    auto passing = std::make_unique<TestWindow>();
    TestWindow inside(passing.get(), WindowKind::Edit);
    inside.SetFocus();
    NameBox box(NameDialog, passing.get());
    screen.answerDialog([&](CDialog& dialog) {
        passing.reset();
        EXPECT_TRUE(dialog.IsEnded());
    });

    EXPECT_EQ(box.DoModal(), -1);

    EXPECT_EQ(GetFocus(), nullptr);
}

TEST_F(ModalDialog, IsNotShownWhenItEndsBeforehand) {
    NameBox box(NameDialog, &owner);
    box.endsAtOnce = true;

    EXPECT_EQ(box.DoModal(), IDCANCEL); // the script has no answer for a dialog

    EXPECT_EQ(box.GetSafeHwnd(), nullptr);
}

TEST_F(ModalDialog, MayBeShownAgain) {
    NameBox box(NameDialog, &owner);
    screen.answerDialog([](CDialog& dialog) { dialog.EndDialog(IDOK); });
    screen.answerDialog([](CDialog& dialog) {
        EXPECT_FALSE(dialog.IsEnded());
        dialog.EndDialog(77);
    });

    EXPECT_EQ(box.DoModal(), IDOK);
    EXPECT_EQ(box.DoModal(), 77);
}

TEST_F(ModalDialog, GivesMinusOneWithoutATemplate) {
    NameBox box(NoDialog, &owner);

    EXPECT_EQ(box.DoModal(), -1);
}

TEST(ADialogWithoutScreen, GivesMinusOne) {
    const kota::Turn turn;
    NameBox box(NameDialog);

    EXPECT_EQ(box.DoModal(), -1);

    EXPECT_EQ(box.GetSafeHwnd(), nullptr);
}

TEST(ADialogThatTheScriptDoesNotAnswer, FailsTheScriptAndIsCancelled) {
    std::vector<std::string> failures;
    kota::headless::ScriptedScreen screen([&](const std::string& text) { failures.push_back(text); });
    kota::Screen* const before = kota::attachScreen(&screen);
    int result = 0;
    {
        const kota::Turn turn;
        result = NameBox(NameDialog).DoModal();
    }
    kota::attachScreen(before);

    EXPECT_EQ(result, IDCANCEL);
    EXPECT_THAT(failures, ElementsAre(HasSubstr("Names")));
}

} // namespace
