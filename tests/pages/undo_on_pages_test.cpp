#include "platform/framework/frame.h"
#include "platform/framework/message_box.h"
#include "platform/framework/messages.h"
#include "platform/framework/property_sheet.h"
#include "tests/pages/tabs.h"

namespace {

using kota::test::recordOf;
using testing::ElementsAre;
using testing::IsEmpty;

// The decay tab with three local lines.
class AnUndo : public kota::test::OnThreeLines {
protected:
    std::string storedRivers() {
        std::string all;
        for (POSITION position = document().decayList.GetHeadPosition(); position;)
            all += std::string(document().decayList.NextRecord(position)->riverName.View());
        return all;
    }
    bool undo() { return user->command(ID_EDIT_UNDO); }
    bool redo() { return user->key('Y', {.control = true}); }
    bool canUndo() { return kota::input::canCommand(ID_EDIT_UNDO); }
};

TEST_F(AnUndo, OfAnEditReachesTheDocument) {
    put(2, 2, "5");
    ASSERT_EQ(recordOf(document().decayList, 2).decayConst, 5.0);
    document().SetModifiedFlag(FALSE);

    EXPECT_TRUE(undo());

    EXPECT_EQ(recordOf(document().decayList, 2).decayConst, 0.0);
    EXPECT_TRUE(document().IsModified());
    EXPECT_EQ(user->cursor(), (std::pair<ROWCOL, ROWCOL>(2, 2)));
    EXPECT_TRUE(redo());
    EXPECT_EQ(recordOf(document().decayList, 2).decayConst, 5.0);
}

TEST_F(AnUndo, IsSeenInTheOtherWindowsOfTheDocument) {
    put(2, 2, "5");
    kota::headless::User first = *user;
    ASSERT_TRUE(user->newWindow());
    kota::headless::User second(session);
    ASSERT_TRUE(second.selectTab("Decay"));
    ASSERT_EQ(second.held(2, 2), "5.000000");
    ASSERT_TRUE(kota::input::activate(static_cast<CMDIChildWnd&>(*first.view().GetParentFrame())));
    ASSERT_TRUE(first.putCursor(2, 2));

    EXPECT_TRUE(first.key('Z', {.control = true}));

    EXPECT_EQ(second.held(2, 2), "0.000000");
}

TEST_F(AnUndo, OfAnInsertedLineTakesItAwayAgain) {
    ASSERT_TRUE(user->putCursor(1, 1));
    ASSERT_TRUE(user->key(VK_INSERT));
    ASSERT_EQ(rivers(), "ABC-");

    EXPECT_TRUE(undo());
    EXPECT_EQ(rivers(), "ABC");
    EXPECT_EQ(storedRivers(), "ABC");
    EXPECT_FALSE(canUndo());
    EXPECT_TRUE(redo());
    EXPECT_EQ(rivers(), "ABC-");
    EXPECT_EQ(document().decayList.GetCount(), 4);
    EXPECT_TRUE(user->isReadOnly(4, 4)) << "the line is global";
}

TEST_F(AnUndo, OfDeletedLinesBringsThemBack) {
    ASSERT_TRUE(user->selectLines(1, 2));
    ASSERT_TRUE(user->key(VK_DELETE));
    ASSERT_EQ(storedRivers(), "C");

    EXPECT_TRUE(user->key(VK_BACK, {.alt = true}));

    EXPECT_EQ(rivers(), "ABC");
    EXPECT_EQ(storedRivers(), "ABC");
    EXPECT_FALSE(user->isReadOnly(1, 4));
}

TEST_F(AnUndo, OfAllLinesDeletedBringsThemBackForTheOneThatStoodForThem) {
    ASSERT_TRUE(user->selectLines(1, 3));
    ASSERT_TRUE(user->key(VK_DELETE));
    ASSERT_EQ(rivers(), "-");

    EXPECT_TRUE(undo());

    EXPECT_EQ(rivers(), "ABC");
    EXPECT_EQ(storedRivers(), "ABC");
}

TEST_F(AnUndo, OfAGlobalBoxBringsThePlaceBack) {
    ASSERT_TRUE(user->clickBox(2, 3));
    ASSERT_EQ(rivers(), "A-C");

    EXPECT_TRUE(undo());

    EXPECT_THAT(line(2), ElementsAre("0", "0.000000", "0", "B", "1.000000"));
    EXPECT_FALSE(user->isReadOnly(2, 4));
    EXPECT_EQ(recordOf(document().decayList, 2).isGlobal, 0);
    EXPECT_TRUE(redo());
    EXPECT_EQ(rivers(), "A-C");
    EXPECT_TRUE(user->isReadOnly(2, 5));
}

TEST_F(AnUndo, OfAnEditThatEndedInANewLineTakesBothBack) {
    ASSERT_TRUE(user->putCursor(3, 5));
    ASSERT_TRUE(user->type("77"));
    ASSERT_TRUE(user->key(VK_TAB));
    ASSERT_EQ(rivers(), "ABC-");

    EXPECT_TRUE(undo());

    EXPECT_EQ(rivers(), "ABC");
    EXPECT_EQ(recordOf(document().decayList, 3).chainage, 1.0);
    EXPECT_FALSE(canUndo());
}

TEST_F(AnUndo, OfALineAtAPickedPlaceTakesItAway) {
    shell().project().offers.push_back({.riverName = "D"});
    ASSERT_TRUE(user->putCursor(1, 1));
    ASSERT_TRUE(user->key(VK_INSERT));
    ASSERT_EQ(storedRivers(), "ABCD");

    EXPECT_TRUE(undo());

    EXPECT_EQ(storedRivers(), "ABC");
}

TEST_F(AnUndo, GoesBackNoFurtherThanTheLastFill) {
    put(2, 2, "5");
    fill();
    EXPECT_FALSE(canUndo());
    EXPECT_FALSE(undo());

    put(2, 2, "6");
    EXPECT_TRUE(undo());
    EXPECT_EQ(user->held(2, 2), "5.000000");
    EXPECT_FALSE(canUndo());
}

TEST_F(AnUndo, DoesNotGoBeyondTheReturnToItsTab) {
    put(2, 2, "5");
    leaveTab();
    ASSERT_TRUE(user->selectTab("Decay"));
    EXPECT_FALSE(canUndo());
}

TEST_F(AnUndo, IsNotOfferedBeforeAnythingWasDone) {
    ASSERT_TRUE(user->putCursor(1, 1));
    EXPECT_FALSE(canUndo());
}

TEST_F(AnUndo, IsNotOfferedWhileTheFocusIsElsewhere) {
    put(2, 2, "5");
    ASSERT_TRUE(canUndo());
    user->sheet().GetTabControl()->SetFocus();
    EXPECT_FALSE(canUndo());
}

// Pasting and cutting on the same tab.
class APaste : public AnUndo {
protected:
    bool paste(const std::string& text) {
        session.screen().setClipboardText(text.c_str());
        return user->key('V', {.control = true});
    }
};

TEST_F(APaste, ReachesTheDocumentInOneStep) {
    ASSERT_TRUE(user->putCursor(2, 1));
    EXPECT_TRUE(paste("Undefined\t0.5\t0\tOhio\t12.5\r\nUndefined\t0.25\t1\t\t\r\n"));
    EXPECT_EQ(storedRivers(), "AOHIO");
    EXPECT_EQ(recordOf(document().decayList, 2).decayConst, 0.5);
    EXPECT_EQ(recordOf(document().decayList, 2).chainage, 12.5);
    EXPECT_EQ(recordOf(document().decayList, 3).isGlobal, 1);
    EXPECT_TRUE(document().IsModified());

    EXPECT_TRUE(undo());
    EXPECT_EQ(storedRivers(), "ABC");
    EXPECT_FALSE(canUndo());
}

TEST_F(APaste, AddsLinesAsThePageDoes) {
    ASSERT_TRUE(user->putCursor(3, 2));
    EXPECT_TRUE(paste("0.1\n0.2\n0.3\n"));
    EXPECT_EQ(rivers(), "ABC--");
    EXPECT_THAT(line(5), ElementsAre("0", "0.3", "1", "", ""));
    EXPECT_EQ(document().decayList.GetCount(), 5);
    EXPECT_EQ(user->cursor(), (std::pair<ROWCOL, ROWCOL>(3, 2)));
}

TEST_F(APaste, OfCopiedLinesIntoNewOnesGivesTheSameLines) {
    ASSERT_TRUE(user->selectLines(1, 3));
    ASSERT_TRUE(user->key(VK_INSERT, {.control = true}));
    ASSERT_TRUE(user->putCursor(3, 1));
    ASSERT_TRUE(user->key(VK_INSERT));
    ASSERT_TRUE(user->putCursor(4, 1));
    EXPECT_TRUE(user->key(VK_INSERT, {.shift = true}));
    EXPECT_EQ(storedRivers(), "ABCABC");
    EXPECT_THAT(boxes(), IsEmpty());
}

TEST_F(APaste, TellsWhatItCouldNotTake) {
    ASSERT_TRUE(user->putCursor(1, 2));
    session.screen().answerBox(IDOK);
    EXPECT_TRUE(paste("0.5\t1\tNILE\n1e\n"));
    EXPECT_EQ(recordOf(document().decayList, 1).decayConst, 0.5);
    EXPECT_THAT(boxes(), ElementsAre("2 values could not be pasted:\n"
                                     "\nLine 1, column 4: \"NILE\" - the cell cannot be changed"
                                     "\nLine 2, column 2: \"1e\" - Double number required"));
}

TEST_F(APaste, IsToldToTheShellOnceAsAnEditIs) {
    document().projectHandle = projectHandle;
    ASSERT_TRUE(user->putCursor(1, 1));
    shell().forgetReceived();
    EXPECT_TRUE(paste("Undefined\t0.5\nUndefined\t0.25\n"));
    EXPECT_EQ(document().decayList.GetCount(), 3);
    EXPECT_EQ(shell().received(523).size(), 1U);
}

TEST_F(APaste, OfCutLinesMovesThem) {
    ASSERT_TRUE(user->selectLines(1, 1));
    ASSERT_TRUE(user->key(VK_DELETE, {.shift = true}));
    ASSERT_EQ(storedRivers(), "BC");
    ASSERT_TRUE(user->key(VK_INSERT));
    ASSERT_TRUE(user->putCursor(3, 1));
    EXPECT_TRUE(user->key('V', {.control = true}));
    EXPECT_EQ(storedRivers(), "BCA");
}

TEST_F(APaste, OfNothingLeavesTheLinesAlone) {
    ASSERT_TRUE(user->putCursor(1, 1));
    EXPECT_TRUE(user->key(VK_INSERT, {.shift = true})) << "the key means pasting, and no line";
    EXPECT_TRUE(user->key(VK_DELETE, {.shift = true}));
    EXPECT_EQ(rivers(), "ABC");
}

TEST_F(APaste, TakesTenThousandLines) {
    std::string text;
    for (int i = 0; i < 10'000; ++i)
        text += "Undefined\t0.5\t0\tRIVER" + std::to_string(i) + "\t" + std::to_string(i) + "\n";
    ASSERT_TRUE(user->putCursor(1, 1));
    EXPECT_TRUE(paste(text));
    ASSERT_EQ(document().decayList.GetCount(), 10'000);
    EXPECT_EQ(recordOf(document().decayList, 10'000).riverName, "RIVER9999");
    EXPECT_TRUE(undo());
    EXPECT_EQ(storedRivers(), "ABC");
}

} // namespace
