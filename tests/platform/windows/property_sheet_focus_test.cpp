#include "tests/platform/windows/test_sheet.h"

#include "platform/framework/input.h"

namespace {

using kota::WindowKind;
using kota::test::OtherEdit;
using kota::test::TestWindow;
using kota::test::ValueEdit;
using kota::test::WithSheet;
using testing::ElementsAre;

class SheetWithFocus : public WithSheet {};

// Keeps the focus while it holds "bad".
class CheckedEdit : public CWnd {
public:
    bool LetFocusGo() override { return !(GetWindowText() == "bad"); }
};

TEST_F(SheetWithFocus, StaysWhileAnEditKeepsTheFocus) {
    create();
    CheckedEdit edit;
    edit.SubclassDlgItem(OtherEdit, &first);
    kota::input::typeText(edit, "bad");

    EXPECT_FALSE(sheet.SetActivePage(1));
    EXPECT_FALSE(kota::input::selectTab(sheet, 1));

    EXPECT_THAT(told, ElementsAre());
    EXPECT_EQ(CWnd::GetFocus(), &edit);
    expectFirstPage();
}

TEST_F(SheetWithFocus, GivesTheFocusBackWhenThePageRefuses) {
    create();
    CWnd* const edit = first.GetDlgItem(OtherEdit);
    edit->SetFocus();
    first.onLeave = [] { return false; };

    EXPECT_FALSE(sheet.SetActivePage(1));
    EXPECT_EQ(CWnd::GetFocus(), edit);

    EXPECT_FALSE(kota::input::selectTab(sheet, 1));
    EXPECT_EQ(CWnd::GetFocus(), edit);
    expectFirstPage();
}

TEST_F(SheetWithFocus, TakesTheFocusIntoTheNewPage) {
    create();
    first.GetDlgItem(OtherEdit)->SetFocus();

    EXPECT_TRUE(sheet.SetActivePage(1));
    EXPECT_EQ(CWnd::GetFocus(), second.GetDlgItem(ValueEdit));

    EXPECT_TRUE(kota::input::selectTab(sheet, 0));
    EXPECT_EQ(CWnd::GetFocus(), first.GetDlgItem(ValueEdit));
}

TEST_F(SheetWithFocus, LeavesTheFocusOnTheTabsWhereAPageHasNothingToEnter) {
    create();
    first.GetDlgItem(OtherEdit)->SetFocus();

    EXPECT_TRUE(kota::input::selectTab(sheet, 2));

    EXPECT_EQ(CWnd::GetFocus(), &tabs());
}

TEST_F(SheetWithFocus, LeavesTheFocusOfAnotherWindowAlone) {
    create();
    TestWindow elsewhere;
    elsewhere.SetFocus();

    EXPECT_TRUE(sheet.SetActivePage(1));

    EXPECT_EQ(CWnd::GetFocus(), &elsewhere);
}

TEST_F(SheetWithFocus, SurvivesThatItIsClosedWhileAPageIsLeft) {
    create();
    first.GetDlgItem(OtherEdit)->SetFocus();
    first.onLeave = [&] { return owner.DestroyWindow() != 0; };

    EXPECT_FALSE(kota::input::selectTab(sheet, 1));

    EXPECT_EQ(sheet.GetSafeHwnd(), nullptr);
    EXPECT_EQ(second.GetSafeHwnd(), nullptr);
}

TEST_F(SheetWithFocus, SurvivesThatItIsClosedWhileTheFocusLeaves) {
    create();
    TestWindow edit(&first, WindowKind::Edit);
    edit.SetFocus();
    edit.letsGo = [&] { return owner.DestroyWindow() != 0; };

    EXPECT_FALSE(sheet.SetActivePage(1));

    EXPECT_EQ(sheet.GetSafeHwnd(), nullptr);
    EXPECT_THAT(told, ElementsAre());
}

TEST_F(SheetWithFocus, SurvivesThatItIsClosedWhileAPageIsEntered) {
    create();
    first.GetDlgItem(OtherEdit)->SetFocus();
    second.onEnter = [&] { owner.DestroyWindow(); };

    kota::input::selectTab(sheet, 1);

    EXPECT_EQ(sheet.GetSafeHwnd(), nullptr);
    EXPECT_EQ(GetFocus(), nullptr);
}

} // namespace
