#include "tests/platform/windows/test_windows.h"

#include "platform/framework/controls.h"
#include "platform/framework/dialog.h"
#include "platform/framework/input.h"
#include "platform/framework/message_box.h"

namespace {

using kota::WindowKind;
using testing::ElementsAre;

enum : UINT { ExchangeDialog = 300, PartDialog };
enum : UINT {
    NameEdit = 10,
    AgeEdit,
    Box,
    Combo,
    FirstRadio,
    SecondRadio,
    ThirdRadio,
    OtherRadio,
    PartEdit,
    Nowhere
};

constexpr kota::DialogItem radioItems[] = {
    {.kind = WindowKind::RadioButton, .id = FirstRadio, .caption = "First", .startsGroup = true},
    kota::control(WindowKind::RadioButton, SecondRadio, "Second"),
    kota::control(WindowKind::RadioButton, ThirdRadio, "Third"),
    {.kind = WindowKind::RadioButton, .id = OtherRadio, .caption = "Other", .startsGroup = true},
};
constexpr kota::DialogItem exchangeItems[] = {
    kota::field("Name", NameEdit),
    kota::field("Age", AgeEdit),
    kota::control(WindowKind::CheckBox, Box, "Box"),
    {.kind = WindowKind::ComboBox, .id = Combo, .caption = "Combo", .choices = "One\nTwo"},
    kota::group("Radios", radioItems),
};
constexpr kota::DialogItem partItems[] = {kota::field("Part", PartEdit)};
constexpr kota::DialogTemplate dialogs[] = {
    {.id = ExchangeDialog, .caption = "Exchange", .items = exchangeItems},
    {.id = PartDialog, .caption = "Part", .items = partItems}};

const kota::Module& exchangeModule() {
    static const kota::Module module("exchange test", {.dialogs = dialogs});
    return module;
}

// A dialog inside another one, with data of its own.
class PartBox : public CDialog {
    DECLARE_DYNAMIC(PartBox)
public:
    void DoDataExchange(CDataExchange* exchange) override { DDX_Text(exchange, PartEdit, value); }

    int value = 0;
};
IMPLEMENT_DYNAMIC(PartBox, CDialog, exchangeModule)

class ExchangeBox : public CDialog {
    DECLARE_DYNAMIC(ExchangeBox)
public:
    void DoDataExchange(CDataExchange* exchange) override {
        DDX_Control(exchange, NameEdit, nameEdit);
        DDX_Text(exchange, NameEdit, name);
        DDX_Text(exchange, AgeEdit, age);
        DDX_Check(exchange, Box, checked);
        DDX_CBIndex(exchange, Combo, entry);
        DDX_Radio(exchange, FirstRadio, radio);
        DDX_Radio(exchange, OtherRadio, other);
    }

    CEdit nameEdit;
    CString name = "Platte";
    int age = -7;
    int checked = 1;
    int entry = 1;
    int radio = 2;
    int other = -1;
};
IMPLEMENT_DYNAMIC(ExchangeBox, CDialog, exchangeModule)

class DataExchange : public testing::Test {
protected:
    DataExchange() { dialog.Create(ExchangeDialog, nullptr); }

    CWnd& control(UINT id) const { return *dialog.GetDlgItem(id); }
    std::vector<bool> radios() const {
        std::vector<bool> all;
        for (const UINT id : {FirstRadio, SecondRadio, ThirdRadio, OtherRadio})
            all.push_back(control(id).GetCheck() != 0);
        return all;
    }

    kota::test::WatchedScreen screen;
    ExchangeBox dialog;
};

TEST_F(DataExchange, ShowsTheMembers) {
    EXPECT_EQ(control(NameEdit).GetWindowText(), "Platte");
    EXPECT_EQ(control(AgeEdit).GetWindowText(), "-7");
    EXPECT_TRUE(control(Box).GetCheck());
    EXPECT_EQ(control(Combo).State()->chosen, 1);
    EXPECT_THAT(radios(), ElementsAre(false, false, true, false));
}

TEST_F(DataExchange, ReadsTheControls) {
    kota::input::typeText(control(NameEdit), "Missouri");
    kota::input::typeText(control(AgeEdit), "42");
    kota::input::click(control(Box));
    kota::input::choose(control(Combo), 0);
    kota::input::click(control(SecondRadio));
    kota::input::click(control(OtherRadio));

    EXPECT_TRUE(dialog.UpdateData());

    EXPECT_EQ(dialog.name, "Missouri");
    EXPECT_EQ(dialog.age, 42);
    EXPECT_EQ(dialog.checked, 0);
    EXPECT_EQ(dialog.entry, 0);
    EXPECT_EQ(dialog.radio, 1);
    EXPECT_EQ(dialog.other, 0);
}

TEST_F(DataExchange, ShowsThatNothingIsChosen) {
    dialog.entry = -1;
    dialog.radio = -1;
    dialog.checked = 0;

    EXPECT_TRUE(dialog.UpdateData(FALSE));

    EXPECT_EQ(control(Combo).State()->chosen, -1);
    EXPECT_THAT(radios(), ElementsAre(false, false, false, false));
    EXPECT_FALSE(control(Box).GetCheck());
}

TEST_F(DataExchange, ReadsThatNothingIsChosen) {
    dialog.entry = -1;
    dialog.radio = -1;
    dialog.UpdateData(FALSE);
    dialog.entry = 1;
    dialog.radio = 1;

    EXPECT_TRUE(dialog.UpdateData());

    EXPECT_EQ(dialog.entry, -1);
    EXPECT_EQ(dialog.radio, -1);
}

TEST_F(DataExchange, KeepsTheRadioButtonsOfTwoGroupsApart) {
    kota::input::click(control(OtherRadio));
    EXPECT_THAT(radios(), ElementsAre(false, false, true, true));

    kota::input::click(control(FirstRadio));
    EXPECT_THAT(radios(), ElementsAre(true, false, false, true));
}

TEST_F(DataExchange, TellsTheUserOfATextThatIsNoIntegerAndStopsThere) {
    for (const char* text : {"", "many", "4.5", "4 ", " 4", "99999999999", "0x10"}) {
        const std::size_t boxes = screen.boxes().size();
        screen.answerBox(IDOK);
        control(AgeEdit).SetWindowText(text);
        control(Box).SetCheck(FALSE);

        EXPECT_FALSE(dialog.UpdateData()) << text;

        EXPECT_EQ(screen.boxes().size(), boxes + 1) << text;
        EXPECT_EQ(screen.boxes().back().owner, dialog.GetSafeHwnd());
        EXPECT_EQ(dialog.age, -7);
        EXPECT_EQ(dialog.checked, 1);
    }
}

TEST_F(DataExchange, GivesAControlToItsObjectOnce) {
    const HWND handle = dialog.nameEdit.GetSafeHwnd();
    ASSERT_NE(handle, nullptr);
    EXPECT_EQ(dialog.GetDlgItem(NameEdit), &dialog.nameEdit);

    dialog.UpdateData(FALSE);

    EXPECT_EQ(dialog.nameEdit.GetSafeHwnd(), handle);
}

TEST_F(DataExchange, LeavesOutAControlThatIsNotThere) {
    CString text = "kept";
    int number = 5;
    CEdit edit;
    for (const bool saveAndValidate : {false, true}) {
        CDataExchange exchange{.dialog = &dialog, .saveAndValidate = saveAndValidate};
        DDX_Control(&exchange, Nowhere, edit);
        DDX_Text(&exchange, Nowhere, text);
        DDX_Text(&exchange, Nowhere, number);
        DDX_Check(&exchange, Nowhere, number);
        DDX_Radio(&exchange, Nowhere, number);
        DDX_CBIndex(&exchange, Nowhere, number);
    }
    EXPECT_EQ(text, "kept");
    EXPECT_EQ(number, 5);
    EXPECT_EQ(edit.GetSafeHwnd(), nullptr);
}

TEST_F(DataExchange, DoesNothingWithoutAWindow) {
    ExchangeBox closed;

    EXPECT_FALSE(closed.UpdateData());

    EXPECT_EQ(closed.name, "Platte");
}

// A dialog that exchanges the data of a dialog inside it along with its own.
class OuterBox : public CDialog {
    DECLARE_DYNAMIC(OuterBox)
public:
    void DoDataExchange(CDataExchange* exchange) override {
        DDX_Text(exchange, NameEdit, name);
        if (part.GetSafeHwnd())
            partResult = part.UpdateData(exchange->saveAndValidate);
        DDX_Text(exchange, AgeEdit, age);
    }

    PartBox part;
    CString name;
    int age = 0;
    BOOL partResult = -1;
};
IMPLEMENT_DYNAMIC(OuterBox, CDialog, exchangeModule)

TEST(NestedDataExchange, GoesOnAfterTheInnerOneFailed) {
    kota::test::WatchedScreen screen;
    OuterBox outer;
    outer.Create(ExchangeDialog, nullptr);
    outer.part.Create(PartDialog, &outer);
    outer.GetDlgItem(AgeEdit)->SetWindowText("8");
    outer.part.GetDlgItem(PartEdit)->SetWindowText("none");
    screen.answerBox(IDOK);

    EXPECT_TRUE(outer.UpdateData());

    EXPECT_EQ(outer.partResult, 0);
    EXPECT_EQ(outer.part.value, 0);
    EXPECT_EQ(outer.age, 8);
    EXPECT_EQ(screen.boxes()[0].owner, outer.part.GetSafeHwnd());
}

TEST(NestedDataExchange, MovesBothData) {
    kota::test::WatchedScreen screen;
    OuterBox outer;
    outer.Create(ExchangeDialog, nullptr);
    outer.part.Create(PartDialog, &outer);
    outer.part.value = 3;
    outer.age = 4;

    EXPECT_TRUE(outer.UpdateData(FALSE));

    EXPECT_EQ(outer.partResult, 1);
    EXPECT_EQ(outer.part.GetDlgItem(PartEdit)->GetWindowText(), "3");
    EXPECT_EQ(outer.GetDlgItem(AgeEdit)->GetWindowText(), "4");
}

} // namespace
