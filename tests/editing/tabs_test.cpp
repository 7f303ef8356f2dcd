#include "platform/framework/message_box.h"
#include "platform/framework/messages.h"
#include "resources/ids.h"
#include "tests/support/document_window.h"

#include <gmock/gmock.h>

#include <array>

using namespace kota::test;

namespace {

using kota::headless::User;
using testing::Contains;
using testing::ElementsAre;
using testing::IsEmpty;
using testing::Not;

class Tabs : public DocumentWindow {
protected:
    static std::vector<std::string> captionsOf(const User& user) {
        std::vector<std::string> captions;
        for (int index = 0; index < user.sheet().GetPageCount(); ++index)
            captions.emplace_back(user.sheet().GetPage(index)->GetCaption().View());
        return captions;
    }
};

TEST_F(Tabs, AreNineInTheirOrderWhateverTheDocumentHolds) {
    CKota0_adDoc& document = create();
    const User user(session);
    EXPECT_EQ(captionsOf(user), tabCaptions);

    addComponent(document.compList, 1, "SAND", 3);
    addGlobal(document.nonCohesList, 1);
    addLocal(document.boundList, 1, "MISSOURI", 1.0);
    document.UpdateAllViews(nullptr, UpdateHint::Fill);

    EXPECT_EQ(captionsOf(user), tabCaptions);
}

TEST_F(Tabs, AreShownByTheTabControl) {
    create();
    const User user(session);

    std::vector<std::string> shown;
    for (const CString& caption : user.sheet().GetTabControl()->State()->choices)
        shown.emplace_back(caption.View());
    EXPECT_EQ(shown, tabCaptions);
    EXPECT_EQ(user.sheet().GetTabControl()->State()->chosen, 0);
}

TEST_F(Tabs, CanAllBeVisitedAndNeverLeadToABoundaryOrANonCohesivePage) {
    create();
    User user(session);

    for (int round = 0; round < 2; ++round)
        for (int index = 0; index < 9; ++index) {
            EXPECT_TRUE(user.selectTab(tabCaptions[static_cast<std::size_t>(index)]));
            EXPECT_EQ(user.sheet().GetActiveIndex(), index);
            for (const UINT hidden : {DialogId::Boundary, DialogId::K32Boundary, DialogId::NonCohesive})
                EXPECT_EQ(user.sheet().GetDlgItem(hidden), nullptr);
        }
    EXPECT_EQ(captionsOf(user), tabCaptions);
    EXPECT_FALSE(user.sheet().SetActivePage(9));
    EXPECT_FALSE(user.sheet().SetActivePage(-1));
}

TEST_F(Tabs, StandInPlaceOfTheFormsPlaceholder) {
    CKota0_adDoc& document = create();
    const User user(session);
    CKota0_adView& view = viewOf(document);
    constexpr unsigned controlParent = 0x10000;

    EXPECT_EQ(view.GetDlgItem(ControlId::SheetPlaceholder), nullptr) << "the placeholder is gone";
    EXPECT_EQ(user.sheet().GetParent(), &view);
    EXPECT_EQ(user.sheet().GetWindowText(), "Kota0 AD");
    EXPECT_EQ(user.sheet().GetStyle(), 0x50000000U);
    EXPECT_EQ(user.sheet().GetExStyle(), controlParent);
    EXPECT_EQ(view.GetExStyle() & controlParent, controlParent);
}

TEST_F(Tabs, GiveHalfOfTheirWidthAway) {
    create();
    const CPropertySheet& sheet = User(session).sheet();

    const int tabs = sheet.GetTabControl()->GetWindowRect().Width();
    EXPECT_GT(tabs, 0);
    // A sheet that keeps its width, of the same pages.
    CPropertySheet plain;
    ASSERT_TRUE(plain.Create(nullptr, 0, 0));
    EXPECT_EQ(tabs, plain.GetTabControl()->GetWindowRect().Width() / 2);
    EXPECT_EQ(sheet.GetWindowRect().Width(), plain.GetWindowRect().Width() - tabs);
    EXPECT_EQ(sheet.GetWindowRect().Height(), plain.GetWindowRect().Height());
}

TEST_F(Tabs, HaveHelpOfTheirOwnByF1) {
    create();
    User user(session);
    constexpr UINT dialogHelp = 0x20000;
    const std::array<UINT, 9> dialogs = {4773, 4771, 4797, 4775, 4776, 4772, 4778, 4794, 4795};

    for (const std::string& caption : tabCaptions) {
        user.selectTab(caption);
        EXPECT_TRUE(user.key(VK_F1)) << caption;
    }

    std::vector<UINT> expected;
    for (const UINT dialog : dialogs)
        expected.push_back(dialogHelp + dialog);
    EXPECT_EQ(session.application().helpContexts, expected);
}

TEST_F(Tabs, HaveTheHelpOfThePageInFrontWhoeverIsAsked) {
    CKota0_adDoc& document = create();
    User user(session);
    user.selectTab("Decay");

    EXPECT_EQ(viewOf(document).SendMessage(WM_HELP), 1);
    EXPECT_EQ(user.sheet().SendMessage(WM_HELP), 1);
    EXPECT_TRUE(user.grid().SendMessage(WM_HELP));
    EXPECT_TRUE(user.page().SendMessage(WM_COMMAND, commandParam(ID_HELP, 0)));

    EXPECT_THAT(session.application().helpContexts, ElementsAre(135848U, 135848U, 135848U, 135848U));
}

class LeavingATab : public DocumentWindow {
protected:
    static constexpr const char* boundsWords = "Maximum disp. coef. must be greater than minimum disp. coef.";
};

TEST_F(LeavingATab, IsRefusedWhileTheBoundsAreBreached) {
    CKota0_adDoc& document = createDispersion();
    User user(session);
    session.screen().answerBox(IDOK);
    user.goTo(ControlId::MinimumDispersion);
    user.typeInto(ControlId::MinimumDispersion, "100.5");

    EXPECT_FALSE(user.selectTab("Decay"));

    EXPECT_EQ(user.tab(), "Dispersion");
    EXPECT_EQ(user.sheet().GetTabControl()->State()->chosen, 1);
    EXPECT_TRUE(user.page().IsWindowVisible());
    EXPECT_EQ(CWnd::GetFocus(), &user.control(ControlId::MinimumDispersion));
    EXPECT_THAT(boxes(), ElementsAre(boundsWords));
    EXPECT_EQ(document.globalVar.G_min_disp_coef, 100.5);
    EXPECT_TRUE(document.decayList.IsEmpty()) << "the other page was not made";

    EXPECT_TRUE(user.enterInto(ControlId::MinimumDispersion, "100"));
    EXPECT_TRUE(user.selectTab("Decay")) << "equal bounds pass";
}

TEST_F(LeavingATab, IsRefusedToTheProgramToo) {
    CKota0_adDoc& document = createDispersion();
    const User user(session);
    document.globalVar.G_min_disp_coef = 2.0;
    document.globalVar.G_max_disp_coef = 1.0;
    session.screen().answerBox(IDOK);
    session.screen().answerBox(IDOK);

    EXPECT_FALSE(user.sheet().SetActivePage(4));
    EXPECT_FALSE(user.sheet().SetActivePage(user.sheet().GetPage(0)));

    EXPECT_EQ(user.sheet().GetActiveIndex(), 1);
    EXPECT_THAT(boxes(), ElementsAre(boundsWords, boundsWords));
}

TEST_F(LeavingATab, IsRefusedByACellThatHoldsABadNumber) {
    CKota0_adDoc& document = createDispersion();
    User user(session);
    user.putCursor(2, 4);
    user.type("1.");

    EXPECT_FALSE(user.selectTab("Components"));
    EXPECT_FALSE(user.sheet().SetActivePage(0));

    EXPECT_EQ(user.tab(), "Dispersion");
    EXPECT_EQ(user.cursor(), std::make_pair(2U, 4U));
    EXPECT_EQ(CWnd::GetFocus(), &user.grid());
    EXPECT_EQ(user.warning(), "Double number required");
    EXPECT_EQ(user.shown(2, 4), "1.") << "the text stays";
    EXPECT_EQ(recordOf(document.dispersList, 2).exponent, 0.0);
    EXPECT_THAT(boxes(), IsEmpty());

    EXPECT_TRUE(user.type("1.5"));
    EXPECT_TRUE(user.selectTab("Components"));
    EXPECT_EQ(recordOf(document.dispersList, 2).exponent, 1.5);
}

TEST_F(LeavingATab, ShowsTheDocumentsPresentStateInTheNext) {
    CKota0_adDoc& document = createDispersion();
    User user(session);
    user.selectTab("Components");
    addDispersion(document, "JAMES", 3000.0);

    user.selectTab("Dispersion");

    EXPECT_EQ(user.held(3, 1), "JAMES");
}

} // namespace
