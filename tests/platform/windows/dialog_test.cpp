#include "tests/platform/windows/test_windows.h"

#include "platform/framework/dialog.h"

namespace {

using kota::WindowKind;
using kota::test::TestWindow;
using testing::ElementsAre;

enum : UINT { NameDialog = 200, NoDialog };
enum : UINT { NameEdit = 10, AgeEdit, KindCombo, HiddenEdit, DisabledBox, FirstRadio, SecondRadio, Apply };

constexpr kota::DialogItem choiceItems[] = {
    {.kind = WindowKind::RadioButton, .id = FirstRadio, .caption = "&First", .startsGroup = true},
    {.kind = WindowKind::RadioButton, .id = SecondRadio, .caption = "&Second"},
};
constexpr kota::DialogItem rowItems[] = {kota::field("&Age", AgeEdit),
                                         kota::control(WindowKind::PushButton, Apply, "&Apply")};
constexpr kota::DialogItem nameItems[] = {
    kota::label("What it is about"),
    kota::field("&Name", NameEdit),
    kota::row(rowItems),
    kota::group("Choice", choiceItems),
    {.kind = WindowKind::ComboBox, .id = KindCombo, .caption = "&Kind", .choices = "One\nTwo\nThree"},
    {.kind = WindowKind::Edit, .id = HiddenEdit, .caption = "Hidden", .visible = false},
    {.kind = WindowKind::CheckBox, .id = DisabledBox, .caption = "&Disabled", .enabled = false},
};
constexpr kota::DialogTemplate dialogs[] = {{.id = NameDialog, .caption = "Names", .items = nameItems}};

const kota::Module& dialogModule() {
    static const kota::Module module("dialog test", {.dialogs = dialogs});
    return module;
}

class NameBox : public CDialog {
    DECLARE_DYNAMIC(NameBox)
public:
    using CDialog::CDialog;

    BOOL OnInitDialog() override {
        told.emplace_back("init");
        return CDialog::OnInitDialog();
    }
    void DoDataExchange(CDataExchange* exchange) override {
        told.emplace_back(exchange->saveAndValidate ? "save" : "show");
        DDX_Text(exchange, NameEdit, name);
        DDX_Text(exchange, AgeEdit, age);
    }

    CString name;
    int age = 0;
    std::vector<std::string> told;
};
IMPLEMENT_DYNAMIC(NameBox, CDialog, dialogModule)

class Dialog : public testing::Test {
protected:
    kota::test::WatchedScreen screen;
    TestWindow owner;
};

TEST_F(Dialog, IsBuiltFromItsTemplate) {
    NameBox box;

    ASSERT_TRUE(box.Create(NameDialog, &owner));

    EXPECT_EQ(box.GetWindowText(), "Names");
    EXPECT_EQ(box.GetParent(), &owner);
    ASSERT_EQ(box.State()->children.size(), std::size(nameItems));
    for (std::size_t i = 0; i < std::size(nameItems); ++i)
        EXPECT_EQ(CWnd::FromHandle(box.State()->children[i])->State()->setup.kind, nameItems[i].kind);
    EXPECT_EQ(CWnd::FromHandle(box.State()->children[0])->GetWindowText(), "What it is about");
}

TEST_F(Dialog, GivesEditsAndComboBoxesTheirCaptionsAsLabels) {
    NameBox box;
    box.Create(NameDialog, nullptr);

    EXPECT_EQ(box.GetDlgItem(AgeEdit)->State()->label, "&Age");
    EXPECT_EQ(box.GetDlgItem(KindCombo)->State()->label, "&Kind");
    EXPECT_EQ(box.GetDlgItem(KindCombo)->GetWindowText(), "");
    EXPECT_EQ(box.GetDlgItem(Apply)->GetWindowText(), "&Apply");
    EXPECT_EQ(box.GetDlgItem(FirstRadio)->GetWindowText(), "&First");
    EXPECT_EQ(box.GetDlgItem(FirstRadio)->GetParent()->GetWindowText(), "Choice");
}

TEST_F(Dialog, GivesItsControlsTheStatesOfTheTemplate) {
    NameBox box;
    box.Create(NameDialog, nullptr);

    EXPECT_FALSE(box.GetDlgItem(HiddenEdit)->IsWindowVisible());
    EXPECT_TRUE(box.GetDlgItem(HiddenEdit)->IsWindowEnabled());
    EXPECT_FALSE(box.GetDlgItem(DisabledBox)->IsWindowEnabled());
    EXPECT_TRUE(box.GetDlgItem(DisabledBox)->IsWindowVisible());
    EXPECT_TRUE(box.GetDlgItem(FirstRadio)->State()->startsGroup);
    EXPECT_FALSE(box.GetDlgItem(SecondRadio)->State()->startsGroup);
    EXPECT_THAT(box.GetDlgItem(KindCombo)->State()->choices,
                ElementsAre(CString("One"), CString("Two"), CString("Three")));
    EXPECT_EQ(box.GetDlgItem(KindCombo)->State()->chosen, -1);
}

TEST_F(Dialog, ShowsItsMembersWhenItIsInitialised) {
    NameBox box;
    box.name = "Platte";
    box.age = 12;

    box.Create(NameDialog, nullptr);

    EXPECT_THAT(box.told, ElementsAre("init", "show"));
    EXPECT_EQ(box.GetDlgItem(NameEdit)->GetWindowText(), "Platte");
    EXPECT_EQ(box.GetDlgItem(AgeEdit)->GetWindowText(), "12");
}

TEST_F(Dialog, IsNotBuiltWithoutATemplateOrTwice) {
    NameBox box;
    EXPECT_FALSE(box.Create(NoDialog, nullptr));
    EXPECT_EQ(box.GetSafeHwnd(), nullptr);

    EXPECT_TRUE(box.Create(NameDialog, nullptr));
    const HWND handle = box.GetSafeHwnd();

    EXPECT_FALSE(box.Create(NameDialog, nullptr));
    EXPECT_EQ(box.GetSafeHwnd(), handle);
    EXPECT_THAT(box.told, ElementsAre("init", "show"));
}

TEST_F(Dialog, OfAnotherModuleHasNoSuchTemplate) {
    CDialog box;

    EXPECT_FALSE(box.Create(NameDialog, nullptr));
}

} // namespace
