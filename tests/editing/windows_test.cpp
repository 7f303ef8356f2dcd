#include "platform/framework/message_box.h"
#include "platform/framework/messages.h"
#include "resources/ids.h"
#include "tests/support/document_window.h"
#include "tests/support/temp_folder.h"

#include <gmock/gmock.h>

using namespace kota::test;

namespace {

using kota::headless::User;
using testing::ElementsAre;
using testing::HasSubstr;
using testing::IsEmpty;

class TwoWindows : public DocumentWindow {
protected:
    // A document with three lines, its dispersion shown in two windows, the second in front.
    CKota0_adDoc& createTwice() {
        CKota0_adDoc& document = create();
        for (const char* river : {"MISSOURI", "PLATTE", "JAMES"})
            addDispersion(document, river, 1000.0);
        User user(session);
        user.selectTab("Dispersion");
        user.newWindow();
        User(session).selectTab("Dispersion");
        settle(document);
        return document;
    }
};

TEST_F(TwoWindows, ShowAnEditOfEitherOne) {
    CKota0_adDoc& document = createTwice();
    User first(viewOf(document, 1));
    User second(viewOf(document, 2));

    second.putCursor(2, 3);
    second.type("0.25");
    second.putCursor(1, 3);
    EXPECT_EQ(first.held(2, 3), "0.250000");

    first.view().GetParentFrame()->ActivateFrame();
    first.putCursor(3, 1);
    first.type("KANSAS");
    first.putCursor(1, 1);
    EXPECT_EQ(second.held(3, 1), "KANSAS");
    EXPECT_EQ(second.cursor(), std::make_pair(1U, 3U)) << "each keeps its cursor";
    EXPECT_THAT(riversOf(document), ElementsAre("MISSOURI", "PLATTE", "KANSAS"));
}

TEST_F(TwoWindows, ShowAnEditOfAPagesEdit) {
    CKota0_adDoc& document = createTwice();
    User second(viewOf(document, 2));

    second.enterInto(ControlId::DispersionFactor, "0.5");

    EXPECT_EQ(User(viewOf(document, 1)).textOf(ControlId::DispersionFactor), "0.500");
}

TEST_F(TwoWindows, MoveTheOthersCursorToTheLastLineWhenItsOwnIsDeleted) {
    CKota0_adDoc& document = createTwice();
    User first(viewOf(document, 1));
    first.putCursor(3, 4);
    User second(viewOf(document, 2));
    second.view().GetParentFrame()->ActivateFrame();

    second.selectLines(2, 3);
    second.command(CommandId::DeleteLine);

    EXPECT_THAT(riversOf(document), ElementsAre("MISSOURI"));
    EXPECT_EQ(first.grid().GetRowCount(), 1U);
    EXPECT_EQ(first.cursor(), std::make_pair(1U, 4U));
    first.view().GetParentFrame()->ActivateFrame();
    first.type("1.25");
    first.putCursor(1, 5);
    EXPECT_EQ(recordOf(document.dispersList).exponent, 1.25) << "the user can go on there";
}

TEST_F(TwoWindows, StayOnTheTabsThatTheyShow) {
    CKota0_adDoc& document = createTwice();
    User first(viewOf(document, 1));
    User second(viewOf(document, 2));
    first.selectTab("Components");

    second.view().GetParentFrame()->ActivateFrame();
    second.putCursor(1, 1);
    second.type("KANSAS");
    second.putCursor(1, 2);

    EXPECT_EQ(first.tab(), "Components");
    first.selectTab("Dispersion");
    EXPECT_EQ(first.held(1, 1), "KANSAS") << "what changed meanwhile is shown with the tab";
}

TEST_F(TwoWindows, OfferANewComponentInTheOthersChoice) {
    CKota0_adDoc& document = create();
    User(session).newWindow();
    User second(viewOf(document, 2));
    second.selectTab("Decay");
    User first(viewOf(document, 1));
    first.view().GetParentFrame()->ActivateFrame();

    first.putCursor(1, 1);
    first.type("BOD");
    first.putCursor(1, 2);
    second.view().GetParentFrame()->ActivateFrame();
    second.putCursor(1, 1);

    EXPECT_TRUE(second.choose("BOD"));
}

TEST_F(TwoWindows, LeaveOneToGoOnInWhenTheOtherIsClosed) {
    CKota0_adDoc& document = createTwice();
    User first(viewOf(document, 1));
    User second(viewOf(document, 2));
    second.putCursor(1, 3);
    second.type("0.25");
    second.putCursor(2, 3);
    ASSERT_TRUE(document.IsModified());

    EXPECT_TRUE(second.closeWindow()) << "nothing is asked while another window stays";

    EXPECT_EQ(shell().MDIGetActive(), first.view().GetParentFrame());
    EXPECT_EQ(document.Views().size(), 1U);
    first.putCursor(1, 4);
    first.type("1.5");
    first.putCursor(1, 5);
    EXPECT_EQ(recordOf(document.dispersList).exponent, 1.5);
    EXPECT_EQ(recordOf(document.dispersList).dispFactor, 0.25);
    EXPECT_TRUE(document.IsModified());
}

class ClosingAWindow : public DocumentWindow {
protected:
    TempFolder folder;

    CKota0_adDoc& createChanged() {
        CKota0_adDoc& document = createDispersion();
        User user(session);
        user.putCursor(1, 3);
        user.type("0.25");
        user.putCursor(1, 4);
        return document;
    }
    bool isOpen() { return shell().MDIGetActive() != nullptr; }
};

TEST_F(ClosingAWindow, AsksAboutChangesAndMayBeTakenBack) {
    CKota0_adDoc& document = createChanged();
    const std::string question = "Save changes to " + std::string(document.GetTitle().View()) + "?";
    session.screen().answerBox(IDCANCEL);

    EXPECT_FALSE(User(session).closeWindow());

    EXPECT_TRUE(isOpen());
    EXPECT_THAT(boxes(), ElementsAre(question));
    EXPECT_EQ(session.screen().boxes().at(0).type, MB_YESNOCANCEL);
    EXPECT_TRUE(document.IsModified());
    EXPECT_EQ(recordOf(document.dispersList).dispFactor, 0.25);
}

TEST_F(ClosingAWindow, AsksAboutAnEditThatIsUnderWay) {
    CKota0_adDoc& document = createDispersion();
    User user(session);
    user.putCursor(1, 3);
    user.type("0.25");
    session.screen().answerBox(IDCANCEL);

    EXPECT_FALSE(user.closeWindow());

    EXPECT_EQ(boxes().size(), 1U);
    EXPECT_EQ(recordOf(document.dispersList).dispFactor, 0.25);
}

TEST_F(ClosingAWindow, SavesTheChangesOrNot) {
    createChanged();
    session.screen().answerBox(IDYES);
    session.screen().answerSaveName(folder.file("river.ad31").c_str());
    EXPECT_TRUE(User(session).closeWindow());
    EXPECT_THAT(folder.read("river.AD31"), HasSubstr("\"MISSOURI\", 1000.0, 0.25"));

    createChanged();
    session.screen().answerBox(IDNO);
    EXPECT_TRUE(User(session).closeWindow());
    EXPECT_FALSE(isOpen());
}

TEST_F(ClosingAWindow, StaysWhenTheSaveFails) {
    createChanged();
    session.screen().answerBox(IDYES);
    session.screen().answerSaveName(std::nullopt);

    EXPECT_FALSE(User(session).closeWindow());

    EXPECT_TRUE(isOpen());
}

TEST_F(ClosingAWindow, AsksNothingWithoutChanges) {
    createDispersion();

    EXPECT_TRUE(User(session).closeWindow());

    EXPECT_FALSE(isOpen());
    EXPECT_THAT(boxes(), IsEmpty());
}

TEST_F(ClosingAWindow, IsDoneByControlF4InAGrid) {
    createDispersion();
    User user(session);
    user.putCursor(1, 1);

    EXPECT_TRUE(user.key(VK_F4, {.control = true}));

    EXPECT_FALSE(isOpen());
}

TEST_F(ClosingAWindow, ByControlF4AsksAboutChanges) {
    CKota0_adDoc& document = createChanged();
    session.screen().answerBox(IDCANCEL);

    EXPECT_TRUE(User(session).key(VK_F4, {.control = true}));

    EXPECT_TRUE(isOpen());
    EXPECT_EQ(boxes().size(), 1U);
    EXPECT_TRUE(document.IsModified());
}

TEST_F(ClosingAWindow, IsNotDoneByF4Alone) {
    createDispersion();
    User user(session);
    user.putCursor(1, 1);

    user.key(VK_F4);

    EXPECT_TRUE(isOpen());
}

TEST_F(ClosingAWindow, ByControlF4ReachesTheViewFromEveryTab) {
    for (const std::string& caption : tabCaptions) {
        create();
        User user(session);
        user.selectTab(caption);
        EXPECT_TRUE(user.key(VK_F4, {.control = true})) << caption;
        EXPECT_FALSE(isOpen()) << caption;
    }
}

} // namespace
