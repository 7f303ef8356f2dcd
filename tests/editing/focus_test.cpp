#include "platform/framework/messages.h"
#include "resources/ids.h"
#include "tests/support/document_window.h"
#include "tests/support/temp_folder.h"

#include <gmock/gmock.h>

using namespace kota::test;

namespace {

using kota::headless::Received;
using kota::headless::User;
using testing::ElementsAre;

class TheFocusAfterASave : public DocumentWindow {
protected:
    // A document of a file, with two lines of which the second one does not outlive a save.
    CKota0_adDoc& openWithAnIncompleteLine() {
        CKota0_adDoc& document = open(folder.write("river.ad31", "target KOTA0_AD {\n}\n"));
        addDispersion(document, "MISSOURI", 1000.0);
        addDispersion(document, "PLATTE", notGiven);
        return document;
    }

    TempFolder folder;
};

TEST_F(TheFocusAfterASave, IsInTheGridInWhichTheUserTypes) {
    openWithAnIncompleteLine();
    User user(session);
    user.selectTab("Dispersion");
    user.putCursor(1, 3);
    user.type("0.25");

    ASSERT_TRUE(user.command(ID_FILE_SAVE));

    EXPECT_EQ(CWnd::GetFocus(), &user.grid(ControlId::DispersionGrid));
    EXPECT_TRUE(user.key(VK_RIGHT));
    EXPECT_EQ(user.cursor(), std::make_pair(1U, 4U)) << "the keys go to the grid";
}

TEST_F(TheFocusAfterASave, IsInTheEditInWhichTheUserTypes) {
    openWithAnIncompleteLine();
    User user(session);
    user.selectTab("Dispersion");
    user.typeInto(ControlId::DispersionExponent, "1.5");

    ASSERT_TRUE(user.command(ID_FILE_SAVE));

    EXPECT_EQ(CWnd::GetFocus(), &user.control(ControlId::DispersionExponent));
}

TEST_F(TheFocusAfterASave, StaysOutOfTheWindowBehind) {
    CKota0_adDoc& document = openWithAnIncompleteLine();
    User behind(session);
    behind.selectTab("Dispersion");
    behind.putCursor(2, 3);
    behind.newWindow();
    User front(session);
    front.selectTab("Dispersion");
    front.putCursor(1, 3);

    ASSERT_TRUE(front.command(ID_FILE_SAVE));

    ASSERT_THAT(riversOf(document), ElementsAre("MISSOURI"));
    EXPECT_EQ(behind.cursor(), std::make_pair(1U, 3U)) << "its line was dropped";
    EXPECT_EQ(CWnd::GetFocus(), &front.grid(ControlId::DispersionGrid));
    EXPECT_EQ(shell().MDIGetActive(), front.view().GetParentFrame());
}

class AShellThatBringsAnotherTabToTheFront : public DocumentWindow {
protected:
    AShellThatBringsAnotherTabToTheFront() { openProject(); }

    static constexpr int decayTab = 4;

    // Shows the decay tab when the code comes for the first time.
    void showDecayAt(WPARAM code) {
        shell().onMessage = [this, code](const Received& received) {
            if (received.code != code || shown)
                return;
            shown = true;
            EXPECT_TRUE(User(session).sheet().SetActivePage(decayTab));
        };
    }
    // Types into a cell and leaves it for another line, at which the shell acts.
    void leaveAnEditedCell(User& user) {
        user.putCursor(1, 1);
        user.type("JAMES");
        showDecayAt(523);
        user.putCursor(2, 1);
        ASSERT_TRUE(shown);
    }
    void expectTheFocusInDecay(User& user) {
        EXPECT_EQ(user.tab(), "Decay");
        EXPECT_TRUE(user.page().IsChild(CWnd::GetFocus()));
        EXPECT_EQ(CWnd::GetFocus(), &user.grid(ControlId::DecayGrid));
    }

    bool shown = false;
};

TEST_F(AShellThatBringsAnotherTabToTheFront, WhenACellIsLeftTakesTheFocusThere) {
    CKota0_adDoc& document = createDispersion();
    User user(session);

    leaveAnEditedCell(user);

    expectTheFocusInDecay(user);
    EXPECT_THAT(riversOf(document), ElementsAre("JAMES", "PLATTE"));
}

TEST_F(AShellThatBringsAnotherTabToTheFront, WhenACellIsLeftGetsTheInsertKeyThere) {
    CKota0_adDoc& document = createDispersion();
    User user(session);
    leaveAnEditedCell(user);

    EXPECT_TRUE(user.key(VK_INSERT));
    EXPECT_TRUE(user.key(VK_RIGHT));

    EXPECT_EQ(user.grid(ControlId::DecayGrid).GetRowCount(), 2U);
    EXPECT_EQ(user.cursor(), std::make_pair(2U, 2U));
    EXPECT_THAT(riversOf(document), ElementsAre("JAMES", "PLATTE"));
}

TEST_F(AShellThatBringsAnotherTabToTheFront, WhenACellIsLeftGetsTheDeleteKeyThere) {
    CKota0_adDoc& document = create();
    addDispersion(document, "MISSOURI", 1000.0);
    addDispersion(document, "PLATTE", 2000.0);
    addGlobal(document.decayList, 1);
    addGlobal(document.decayList, 2);
    User user(session);
    user.selectTab("Decay");
    user.selectLines(2, 2);
    user.selectTab("Dispersion");
    user.selectLines(1, 1);
    leaveAnEditedCell(user);

    EXPECT_TRUE(user.key(VK_DELETE));

    ASSERT_EQ(document.decayList.GetCount(), 1);
    EXPECT_EQ(recordOf(document.decayList).componentNum, 1);
    EXPECT_THAT(riversOf(document), ElementsAre("JAMES", "PLATTE"));
}

TEST_F(AShellThatBringsAnotherTabToTheFront, WhenItIsAskedForALocationTakesTheFocusThere) {
    createDispersion();
    User user(session);
    user.putCursor(2, 1);
    showDecayAt(200);

    EXPECT_TRUE(user.key(VK_INSERT));

    ASSERT_TRUE(shown);
    expectTheFocusInDecay(user);
}

TEST_F(AShellThatBringsAnotherTabToTheFront, WhenTheTabKeyAsksForALocationTakesTheKeysThere) {
    CKota0_adDoc& document = createDispersion();
    User user(session);
    user.putCursor(2, 6);
    showDecayAt(200);

    EXPECT_TRUE(user.key(VK_TAB)); // behind the last cell: another line

    ASSERT_TRUE(shown);
    expectTheFocusInDecay(user);
    const ROWCOL lines = user.grid(ControlId::DecayGrid).GetRowCount();
    EXPECT_TRUE(user.key(VK_INSERT));
    EXPECT_EQ(user.grid(ControlId::DecayGrid).GetRowCount(), lines + 1);
    EXPECT_THAT(riversOf(document), ElementsAre("MISSOURI", "PLATTE"));
    user.selectTab("Dispersion");
    EXPECT_EQ(user.cursor(), std::make_pair(2U, 6U)) << "the grid behind has taken no step";
}

class AShellThatOpensAnotherDocument : public DocumentWindow {
protected:
    AShellThatOpensAnotherDocument() { openProject(); }

    // Opens it when the code comes for the first time.
    void openAt(WPARAM code) {
        shell().onMessage = [this, code](const Received& received) {
            if (received.code != code || opened)
                return;
            opened = true;
            session.create();
        };
    }
    // The keys go to the document in front.
    void expectTheFocusInFront() {
        ASSERT_TRUE(opened);
        CWnd* const focus = CWnd::GetFocus();
        ASSERT_NE(focus, nullptr);
        EXPECT_EQ(focus->GetParentFrame(), shell().MDIGetActive());
    }

    bool opened = false;
};

TEST_F(AShellThatOpensAnotherDocument, WhenItIsAskedForALocationKeepsTheFocusThere) {
    CKota0_adDoc& document = createDispersion();
    User user(session);
    shell().project().offers.push_back({"JAMES", 125.0, 0.0, 5});
    openAt(200);

    user.command(CommandId::InsertLine);

    expectTheFocusInFront();
    EXPECT_THAT(riversOf(document), ElementsAre("MISSOURI", "PLATTE", "JAMES"));
}

TEST_F(AShellThatOpensAnotherDocument, WhenAnEditIsLeftForTheTabsKeepsTheFocusThere) {
    CKota0_adDoc& document = createDispersion();
    User user(session);
    user.putCursor(1, 1);
    user.type("JAMES");
    openAt(523);

    EXPECT_FALSE(kota::input::focus(*user.sheet().GetTabControl()));

    expectTheFocusInFront();
    EXPECT_THAT(riversOf(document), ElementsAre("JAMES", "PLATTE"));
}

TEST_F(AShellThatOpensAnotherDocument, WhenATabIsShownKeepsTheFocusThere) {
    addDispersion(create(), "MISSOURI", 1000.0);
    User user(session);
    openAt(503);

    user.selectTab("Dispersion");

    expectTheFocusInFront();
    EXPECT_EQ(user.tab(), "Dispersion");
}

} // namespace
