#include "platform/framework/messages.h"
#include "platform/framework/turn.h"
#include "tests/support/document_window.h"

#include <gmock/gmock.h>

using namespace kota::test;

namespace {

using kota::headless::User;
using testing::ElementsAre;
using testing::IsEmpty;

// A view of another editor, as a frame makes it.
class ForeignView : public CView {
    DECLARE_DYNCREATE(ForeignView)
public:
    ForeignView() = default;
};

const kota::Module& testModule() {
    static const kota::Module module("test", {});
    return module;
}
IMPLEMENT_DYNCREATE(ForeignView, CView, testModule)

class ToolbarMessages : public DocumentWindow {
protected:
    // A frame of another editor, behind the others.
    CMDIChildWnd& foreignFrame() {
        auto* const frame = new CMDIChildWnd;
        frame->LoadFrame(&shell(), {.viewClass = RUNTIME_CLASS(ForeignView), .document = nullptr});
        return *frame;
    }
    static CMDIChildWnd& frameOf(CView& view) { return static_cast<CMDIChildWnd&>(*view.GetParentFrame()); }
    void bringToFront(CMDIChildWnd& frame) {
        shell().forgetReceived();
        const kota::Turn turn;
        frame.ActivateFrame();
    }
};

TEST_F(ToolbarMessages, FollowFromWhichViewIsActivatedAndWhichIsLeft) {
    CKota0_adDoc& document = create();
    CKota0_adView& self = viewOf(document);
    CKota0_adView& sibling = viewOf(create());
    ForeignView foreign;
    const struct {
        BOOL activate;
        CView* activated;
        CView* left;
        std::vector<std::string> messages;
    } cases[] = {
        {TRUE, &self, &self, {"show"}},
        {TRUE, &self, nullptr, {"show"}},
        {TRUE, &self, &foreign, {"show"}},
        {TRUE, nullptr, nullptr, {"show"}},
        {FALSE, nullptr, nullptr, {}},
        {FALSE, nullptr, &self, {}},
        {FALSE, &self, &self, {"hide"}},
        {FALSE, &sibling, &sibling, {"hide"}},
        {FALSE, &foreign, &foreign, {"hide", "hide"}},
        {FALSE, &foreign, &self, {"hide"}},
        {FALSE, &foreign, nullptr, {"hide"}},
        {FALSE, &sibling, &self, {}},
        {FALSE, &self, &sibling, {}},
    };

    for (const auto& given : cases) {
        shell().forgetReceived();
        self.OnActivateView(given.activate, given.activated, given.left);
        EXPECT_EQ(told(), given.messages) << "case " << &given - cases;
    }
}

TEST_F(ToolbarMessages, NameTheFirstCommandOfTheToolbar) {
    create();

    const auto shown = shell().received(42550);
    ASSERT_EQ(shown.size(), 1U);
    EXPECT_EQ(shown[0].message, RegisterWindowMessage("KOTAHubShowToolbar"));
    EXPECT_FALSE(shown[0].hasPackage);
}

TEST_F(ToolbarMessages, GoFromOneWindowOfThisEditorToTheOther) {
    CKota0_adDoc& document = create();
    CKota0_adDoc& another = create();

    bringToFront(frameOf(viewOf(document)));
    EXPECT_THAT(told(), ElementsAre("hide", "show"));
    bringToFront(frameOf(viewOf(document)));
    EXPECT_THAT(told(), IsEmpty()) << "it was in front already";
    bringToFront(frameOf(viewOf(another)));
    EXPECT_THAT(told(), ElementsAre("hide", "show"));
}

TEST_F(ToolbarMessages, HideTheToolbarForAForeignWindowAndShowItAfterwards) {
    CKota0_adDoc& document = create();
    CMDIChildWnd& foreign = foreignFrame();

    bringToFront(foreign);
    EXPECT_THAT(told(), ElementsAre("hide"));
    bringToFront(frameOf(viewOf(document)));
    EXPECT_THAT(told(), ElementsAre("show"));
}

TEST_F(ToolbarMessages, HideTheToolbarForAForeignViewInTheSameFrame) {
    CKota0_adDoc& document = create();
    CMDIChildWnd& frame = frameOf(viewOf(document));
    ForeignView foreign;
    foreign.Create({.parent = frame.GetSafeHwnd()});
    shell().forgetReceived();

    frame.SetActiveView(&foreign);
    EXPECT_THAT(told(), ElementsAre("hide"));
    shell().forgetReceived();
    frame.SetActiveView(&viewOf(document));
    EXPECT_THAT(told(), ElementsAre("show"));
    shell().forgetReceived();
    frame.SetActiveView(nullptr);
    EXPECT_THAT(told(), IsEmpty()) << "nobody else is there to hide it for";
}

class Leaving : public DocumentWindow {};

TEST_F(Leaving, TellsTheShellInItsOrderAndThenNothingMore) {
    openProject();
    CKota0_adDoc& document = createDispersion();
    const CString title = document.GetTitle();
    CView* const view = &viewOf(document);

    EXPECT_TRUE(User(session).closeWindow());

    ASSERT_THAT(told(), ElementsAre("hide", "24", "503", "523"));
    const auto& messages = shell().received();
    EXPECT_EQ(messages[1].message, switchBoardMessage());
    EXPECT_EQ(messages[1].sender, view);
    EXPECT_EQ(messages[1].documentName, title);
    EXPECT_EQ(messages[1].packageKind, 5);
    EXPECT_EQ(messages[1].project, projectHandle);
    EXPECT_EQ(messages[2].message, communicationMessage());
    EXPECT_FALSE(messages[2].hasPackage) << "no location is current any more";
    EXPECT_EQ(messages[3].documentName, title);
    EXPECT_EQ(messages[3].project, projectHandle);
    session.closeMainWindow();
    EXPECT_EQ(shell().received().size(), 4U);
}

TEST_F(Leaving, OfOneOfTwoViewsIsToldWhileTheOtherStays) {
    openProject();
    CKota0_adDoc& document = createDispersion();
    User(session).newWindow();
    settle(document);

    EXPECT_TRUE(User(session).closeWindow());

    EXPECT_THAT(told(), ElementsAre("hide", "show", "24", "503", "523"));
    EXPECT_EQ(document.Views().size(), 1U);
    EXPECT_EQ(document.projectHandle, projectHandle);
}

TEST_F(Leaving, WithTheMainWindowTellsNobody) {
    openProject();
    createDispersion();

    session.closeMainWindow();

    EXPECT_EQ(shell().GetSafeHwnd(), nullptr);
    EXPECT_EQ(times(523), 0U);
}

class Printing : public DocumentWindow {};

TEST_F(Printing, IsToldNotToBeAvailable) {
    create();
    User user(session);

    for (const UINT command : {57607U, 57608U, 57609U}) {
        session.screen().answerBox(1);
        EXPECT_TRUE(user.command(command));
    }

    EXPECT_THAT(boxes(), ElementsAre("Printing is not available.", "Printing is not available.",
                                     "Printing is not available."));
}

} // namespace
