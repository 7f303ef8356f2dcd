#include "tests/platform/windows/test_sheet.h"

#include "platform/framework/input.h"
#include "platform/framework/message_box.h"

namespace {

using kota::test::ValueEdit;
using kota::test::WithSheet;
using testing::ElementsAre;

class Sheet : public WithSheet {};

TEST_F(Sheet, StartsWithItsFirstPageAndMakesNoOther) {
    EXPECT_TRUE(sheet.Create(&owner, 5, 7));

    EXPECT_THAT(told, ElementsAre("First made", "First entered"));
    EXPECT_EQ(sheet.GetActivePage(), &first);
    EXPECT_EQ(first.GetParent(), &sheet);
    EXPECT_EQ(second.GetSafeHwnd(), nullptr);
    EXPECT_EQ(sheet.GetWindowText(), "Pages");
    EXPECT_EQ(sheet.GetStyle(), 5U);
    EXPECT_EQ(sheet.GetExStyle(), 7U);
    EXPECT_THAT(tabs().State()->choices, ElementsAre(CString("First"), CString("Second"), CString("Empty")));
    expectFirstPage();
}

TEST_F(Sheet, MakesAPageWhenItIsFirstShown) {
    create();

    EXPECT_TRUE(sheet.SetActivePage(1));
    EXPECT_THAT(told, ElementsAre("First left", "Second made", "Second entered"));
    EXPECT_FALSE(first.IsWindowVisible());
    EXPECT_TRUE(second.IsWindowVisible());
    EXPECT_EQ(tabs().State()->chosen, 1);
    told.clear();

    EXPECT_TRUE(sheet.SetActivePage(&first));
    EXPECT_TRUE(sheet.SetActivePage(&second));
    EXPECT_THAT(told, ElementsAre("Second left", "First entered", "First left", "Second entered"));
}

TEST_F(Sheet, KnowsItsPages) {
    create();

    EXPECT_EQ(sheet.GetPageCount(), 3);
    EXPECT_EQ(sheet.GetPage(2), &empty);
    EXPECT_EQ(sheet.GetPage(3), nullptr);
    EXPECT_EQ(sheet.GetPage(-1), nullptr);
    EXPECT_EQ(sheet.GetPageIndex(&second), 1);
    EXPECT_EQ(sheet.GetPageIndex(&stranger), -1);
}

TEST_F(Sheet, DoesNothingForThePageInFront) {
    create();

    EXPECT_TRUE(sheet.SetActivePage(0));

    EXPECT_THAT(told, ElementsAre());
}

TEST_F(Sheet, DoesNothingForAPageThatIsNotInIt) {
    create();

    EXPECT_FALSE(sheet.SetActivePage(&stranger));
    EXPECT_FALSE(sheet.SetActivePage(nullptr));
    EXPECT_FALSE(sheet.SetActivePage(3));
    EXPECT_FALSE(sheet.SetActivePage(-1));

    EXPECT_THAT(told, ElementsAre());
    expectFirstPage();
}

TEST_F(Sheet, DoesNothingWithoutAWindow) {
    EXPECT_FALSE(sheet.SetActivePage(1));

    EXPECT_EQ(sheet.GetActiveIndex(), -1);
}

TEST_F(Sheet, StaysOnAPageThatRefuses) {
    create();
    first.onLeave = [] { return false; };

    EXPECT_FALSE(sheet.SetActivePage(1));

    EXPECT_THAT(told, ElementsAre("First left"));
    expectFirstPage();
}

TEST_F(Sheet, StaysOnAPageWhoseControlsCannotBeRead) {
    create();
    first.GetDlgItem(ValueEdit)->SetWindowText("none");
    screen.answerBox(IDOK);

    EXPECT_FALSE(sheet.SetActivePage(1));

    expectFirstPage();
}

TEST_F(Sheet, ReadsTheControlsOfThePageThatIsLeft) {
    create();
    first.GetDlgItem(ValueEdit)->SetWindowText("12");

    sheet.SetActivePage(1);

    EXPECT_EQ(first.value, 12);
}

TEST_F(Sheet, TakesNoOtherChoiceWhileAPageIsLeftOrEntered) {
    create();
    std::vector<BOOL> results;
    first.onLeave = [&] {
        results.push_back(sheet.SetActivePage(2));
        results.push_back(sheet.SetActivePage(0));
        return true;
    };
    second.onEnter = [&] { results.push_back(sheet.SetActivePage(2)); };

    EXPECT_TRUE(sheet.SetActivePage(1));

    EXPECT_THAT(results, ElementsAre(0, 0, 0));
    EXPECT_EQ(sheet.GetActiveIndex(), 1);
    EXPECT_EQ(empty.GetSafeHwnd(), nullptr);
}

TEST_F(Sheet, TakesNoOtherChoiceWhileItsFirstPageIsEntered) {
    first.onEnter = [&] { EXPECT_FALSE(sheet.SetActivePage(1)); };

    sheet.Create(&owner, 0, 0);

    expectFirstPage();
}

TEST_F(Sheet, ChangesAgainAfterAPageRefused) {
    create();
    first.onLeave = [] { return false; };
    sheet.SetActivePage(1);
    first.onLeave = nullptr;

    EXPECT_TRUE(sheet.SetActivePage(1));
}

TEST_F(Sheet, TellsTheScreenThatItShowsAnotherPage) {
    create();
    kota::tellScreen();
    screen.told.clear();

    kota::input::selectTab(sheet, 1);

    bool contents = false;
    for (const auto& telling : screen.told)
        for (const kota::WindowChange& change : telling)
            contents =
                contents || (change.window == sheet.GetSafeHwnd() && change.has(kota::Change::Contents));
    EXPECT_TRUE(contents);
}

} // namespace
