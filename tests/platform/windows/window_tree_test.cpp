#include "tests/platform/windows/test_windows.h"

#include "platform/framework/controls.h"
#include "platform/framework/dialog.h"

#include <memory>

namespace {

using kota::WindowKind;
using kota::test::TestWindow;
using testing::ElementsAre;

enum : UINT { FormId = 100, NameEdit, InnerEdit, KindCombo, Note };

constexpr kota::DialogItem inner[] = {kota::field("Inner", InnerEdit)};
constexpr kota::DialogItem rowItems[] = {kota::group("Group", inner)};
constexpr kota::DialogItem items[] = {
    {.kind = WindowKind::Edit, .id = NameEdit, .caption = "Name", .enabled = false},
    kota::row(rowItems),
    {.kind = WindowKind::ComboBox, .id = KindCombo, .caption = "Kind", .choices = "One\nTwo"},
    kota::control(WindowKind::Label, Note, "A note"),
};
constexpr kota::DialogTemplate forms[] = {{.id = FormId, .caption = "Form", .items = items}};

// A window with the controls of a form.
class WindowTree : public testing::Test {
protected:
    WindowTree() { kota::createDialogItems(form.GetSafeHwnd(), forms[0]); }

    kota::test::WatchedScreen screen;
    TestWindow form;
};

TEST_F(WindowTree, DestroysTheWindowsInsideWithTheirParent) {
    TestWindow parent;
    TestWindow child(&parent);
    TestWindow grandchild(&child);
    const std::vector<HWND> handles{parent.GetSafeHwnd(), child.GetSafeHwnd(), grandchild.GetSafeHwnd()};

    EXPECT_TRUE(parent.DestroyWindow());

    for (const HWND handle : handles) {
        EXPECT_FALSE(IsWindow(handle));
        EXPECT_EQ(CWnd::FromHandle(handle), nullptr);
    }
    EXPECT_EQ(grandchild.GetSafeHwnd(), nullptr);
    EXPECT_EQ(grandchild.GetParent(), nullptr);
    EXPECT_FALSE(child.DestroyWindow());
}

TEST_F(WindowTree, TakesTheFocusAwayWithAWindowAroundIt) {
    form.GetDlgItem(InnerEdit)->SetFocus();
    ASSERT_EQ(CWnd::GetFocus(), form.GetDlgItem(InnerEdit));

    form.DestroyWindow();

    EXPECT_EQ(GetFocus(), nullptr);
}

TEST_F(WindowTree, MayBeClosedByAChildOnItsWayOut) {
    class Closer : public TestWindow {
    public:
        using TestWindow::TestWindow;
        BOOL DestroyWindow() override {
            const BOOL destroyed = TestWindow::DestroyWindow();
            if (toClose)
                std::exchange(toClose, nullptr)->DestroyWindow();
            return destroyed;
        }
        CWnd* toClose = nullptr;
    };
    TestWindow parent;
    TestWindow first(&parent);
    Closer second(&parent);
    second.toClose = &parent;

    parent.DestroyWindow();

    EXPECT_EQ(parent.GetSafeHwnd(), nullptr);
    EXPECT_EQ(first.GetSafeHwnd(), nullptr);
}

TEST_F(WindowTree, ForgetsAChildThatIsGone) {
    TestWindow parent;
    auto child = std::make_unique<TestWindow>(&parent, WindowKind::Plain, 7);
    ASSERT_EQ(parent.GetDlgItem(7), child.get());

    child.reset();

    EXPECT_EQ(parent.GetDlgItem(7), nullptr);
    EXPECT_THAT(parent.State()->children, ElementsAre());
}

TEST_F(WindowTree, FindsAControlAtAnyDepth) {
    CWnd* const control = form.GetDlgItem(InnerEdit);

    ASSERT_NE(control, nullptr);
    EXPECT_EQ(control->GetDlgCtrlID(), InnerEdit);
    EXPECT_NE(control->GetParent(), &form);
    EXPECT_TRUE(form.IsChild(control));
    EXPECT_FALSE(control->IsChild(&form));
    EXPECT_FALSE(form.IsChild(&form));
    EXPECT_FALSE(form.IsChild(nullptr));
}

TEST_F(WindowTree, HasNoControlOfNumberZeroOrOfAnUnknownOne) {
    EXPECT_EQ(form.GetDlgItem(0), nullptr);
    EXPECT_EQ(form.GetDlgItem(4711), nullptr);
}

TEST_F(WindowTree, GivesAControlWithoutObjectOneAndTheSamePlainObject) {
    CWnd* const control = form.GetDlgItem(Note);

    EXPECT_EQ(form.GetDlgItem(Note), control);
    EXPECT_EQ(CWnd::FromHandle(control->GetSafeHwnd()), control);
    EXPECT_EQ(control->GetRuntimeClass(), RUNTIME_CLASS(CWnd));
}

TEST_F(WindowTree, HandsAControlToAnObjectWithItsState) {
    form.GetDlgItem(NameEdit)->SetWindowText("Platte");
    const HWND handle = form.GetDlgItem(NameEdit)->GetSafeHwnd();
    CEdit edit;

    EXPECT_TRUE(edit.SubclassDlgItem(NameEdit, &form));

    EXPECT_EQ(edit.GetSafeHwnd(), handle);
    EXPECT_EQ(form.GetDlgItem(NameEdit), &edit);
    EXPECT_EQ(edit.GetWindowText(), "Platte");
    EXPECT_EQ(edit.State()->label, "Name");
    EXPECT_FALSE(edit.IsWindowEnabled());
}

TEST_F(WindowTree, LeavesThePlainObjectWithoutAWindowOnceAnotherTookItOver) {
    const kota::Turn turn;
    CWnd* const plain = form.GetDlgItem(NameEdit);
    CEdit edit;

    edit.SubclassDlgItem(NameEdit, &form);

    EXPECT_EQ(plain->GetSafeHwnd(), nullptr);
}

TEST_F(WindowTree, HandsOutNoControlThatIsNotThere) {
    CEdit edit;

    EXPECT_FALSE(edit.SubclassDlgItem(4711, &form));
    EXPECT_FALSE(edit.SubclassDlgItem(NameEdit, nullptr));

    EXPECT_EQ(edit.GetSafeHwnd(), nullptr);
}

TEST_F(WindowTree, HandsAControlToOneObjectAlone) {
    CEdit edit;
    CWnd plain;
    CEdit late;
    edit.SubclassDlgItem(NameEdit, &form);
    plain.SubclassDlgItem(Note, &form);

    EXPECT_FALSE(late.SubclassDlgItem(NameEdit, &form));
    EXPECT_FALSE(late.SubclassDlgItem(Note, &form));
    EXPECT_FALSE(edit.SubclassDlgItem(InnerEdit, &form));

    EXPECT_EQ(form.GetDlgItem(NameEdit), &edit);
    EXPECT_EQ(form.GetDlgItem(Note), &plain);
}

TEST_F(WindowTree, KeepsAWindowAliveThatItsObjectLetsGo) {
    CEdit edit;
    edit.SubclassDlgItem(NameEdit, &form);

    const HWND handle = edit.Detach();

    EXPECT_EQ(edit.GetSafeHwnd(), nullptr);
    EXPECT_TRUE(IsWindow(handle));
    EXPECT_NE(form.GetDlgItem(NameEdit), &edit);
    EXPECT_EQ(form.GetDlgItem(NameEdit)->State()->label, "Name");
}

TEST_F(WindowTree, DisablesWhatStandsInADisabledWindow) {
    const CWnd& control = *form.GetDlgItem(InnerEdit);
    EXPECT_TRUE(control.IsWindowEnabled());

    EXPECT_FALSE(form.EnableWindow(FALSE));
    EXPECT_FALSE(control.IsWindowEnabled());
    EXPECT_TRUE(control.State()->enabled);

    EXPECT_TRUE(form.EnableWindow(TRUE));
    EXPECT_TRUE(control.IsWindowEnabled());
}

TEST_F(WindowTree, HidesWhatStandsInAHiddenWindow) {
    const CWnd& control = *form.GetDlgItem(InnerEdit);
    EXPECT_TRUE(control.IsWindowVisible());

    control.GetParent()->ShowWindow(FALSE);

    EXPECT_FALSE(control.IsWindowVisible());
    EXPECT_TRUE(form.IsWindowVisible());
}

TEST_F(WindowTree, ChoosesAnEntryOfAComboBoxOrNone) {
    CComboBox combo;
    combo.SubclassDlgItem(KindCombo, &form);
    EXPECT_EQ(combo.GetCurSel(), -1);

    EXPECT_EQ(combo.SetCurSel(1), 1);
    EXPECT_EQ(combo.GetCurSel(), 1);

    EXPECT_EQ(combo.SetCurSel(2), -1);
    EXPECT_EQ(combo.GetCurSel(), -1);
}

TEST_F(WindowTree, AnswersNothingForAnObjectWithoutWindow) {
    CWnd window;

    EXPECT_FALSE(window.IsWindowEnabled());
    EXPECT_FALSE(window.IsWindowVisible());
    EXPECT_FALSE(window.EnableWindow());
    EXPECT_EQ(window.GetDlgItem(NameEdit), nullptr);
    EXPECT_EQ(window.SendMessage(WM_COMMAND), 0);
    EXPECT_FALSE(window.PostMessage(WM_COMMAND));
    window.SetWindowText("nowhere");
    EXPECT_EQ(window.GetWindowText(), "");
    EXPECT_EQ(window.State(), nullptr);
}

} // namespace
