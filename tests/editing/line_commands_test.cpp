#include "platform/framework/messages.h"
#include "resources/ids.h"
#include "tests/support/document_window.h"

#include <gmock/gmock.h>

#include <utility>

using namespace kota::test;

namespace {

using kota::headless::User;
using testing::ElementsAre;
using testing::IsEmpty;

class Insertion : public DocumentWindow {
protected:
    Insertion() { openProject(); }

    void offer(const char* river, double chainage, double chainage2, int dataType) {
        shell().project().offers.push_back({river, chainage, chainage2, dataType});
    }
};

TEST_F(Insertion, TakesTheLocationThatTheShellOffers) {
    CKota0_adDoc& document = createDispersion();
    document.globalVar.G_exponent = 1.5;
    User user(session);
    offer("JAMES", 125.0, 999.0, 5);

    EXPECT_TRUE(user.command(CommandId::InsertLine));

    EXPECT_THAT(told(), ElementsAre("200", "523"));
    ASSERT_EQ(user.grid().GetRowCount(), 3U);
    EXPECT_EQ(user.held(3, 1), "JAMES");
    EXPECT_EQ(user.held(3, 2), "125.000000.3") << "with the tail that no reader of numbers minds";
    EXPECT_EQ(user.held(3, 4), "1.5");
    EXPECT_THAT(riversOf(document), ElementsAre("MISSOURI", "PLATTE", "JAMES"));
    EXPECT_EQ(recordOf(document.dispersList, 3).chainage, 125.0);
    EXPECT_TRUE(document.IsModified());
    EXPECT_EQ(user.cursor(), std::make_pair(0U, 0U));
}

TEST_F(Insertion, TakesTheSecondChainageOfAnOfferForInitialConditions) {
    CKota0_adDoc& document = createDispersion();
    User user(session);
    offer("JAMES", 125.0, 999.5, 0);

    user.command(CommandId::InsertLine);

    EXPECT_EQ(user.held(3, 2), "999.500000.3");
    EXPECT_EQ(recordOf(document.dispersList, 3).chainage, 999.5);
}

TEST_F(Insertion, ShowsTheOfferedChainageInTheUsersUnit) {
    const UnitChoice feet(100143, 1);
    CKota0_adDoc& document = createDispersion();
    User user(session);
    offer("JAMES", 304.8, 0.0, 5);

    user.command(CommandId::InsertLine);

    EXPECT_EQ(user.held(3, 2), "1000.000000.3");
    EXPECT_DOUBLE_EQ(recordOf(document.dispersList, 3).chainage, 304.8);
}

TEST_F(Insertion, AsksWithTheProjectAlone) {
    createDispersion();
    offer("JAMES", 125.0, 0.0, 5);

    User(session).command(CommandId::InsertLine);

    const kota::headless::Received request = shell().received(200).at(0);
    EXPECT_EQ(request.message, switchBoardMessage());
    EXPECT_EQ(request.project, projectHandle);
    EXPECT_EQ(request.sender, nullptr);
    EXPECT_EQ(request.items, nullptr);
}

TEST_F(Insertion, OfALocationIsSeenByTheOtherViews) {
    CKota0_adDoc& document = createDispersion();
    User other(session);
    other.newWindow();
    User user(session);
    user.selectTab("Dispersion");
    ASSERT_NE(&user.view(), &other.view());
    offer("JAMES", 125.0, 0.0, 5);

    user.command(CommandId::InsertLine);

    EXPECT_EQ(other.held(3, 1), "JAMES");
    EXPECT_EQ(other.held(3, 2), "125.000000");
    EXPECT_EQ(document.dispersList.GetCount(), 3);
}

TEST_F(Insertion, WithoutAnOfferAddsADefaultLineThatIsNeitherStoredNorToldNorMarked) {
    CKota0_adDoc& document = createDispersion();
    document.globalVar.G_disp_factor = 0.25;
    User user(session);

    user.command(CommandId::InsertLine);

    EXPECT_THAT(told(), ElementsAre("200"));
    ASSERT_EQ(user.grid().GetRowCount(), 3U);
    EXPECT_EQ(user.held(3, 1), "");
    EXPECT_EQ(user.held(3, 3), "0.25");
    EXPECT_EQ(user.cursor().first, 3U) << "the user goes on in the new line";
    EXPECT_EQ(document.dispersList.GetCount(), 2);
    EXPECT_FALSE(document.IsModified());

    user.putCursor(3, 1);
    user.type("JAMES");
    user.putCursor(3, 2);
    EXPECT_THAT(riversOf(document), ElementsAre("MISSOURI", "PLATTE", "JAMES"));
}

TEST_F(Insertion, OnComponentsAsksNobody) {
    CKota0_adDoc& document = create();
    User user(session);
    settle(document);
    offer("JAMES", 125.0, 0.0, 5);

    user.command(CommandId::InsertLine);

    EXPECT_EQ(user.grid().GetRowCount(), 2U);
    EXPECT_THAT(told(), IsEmpty());
    EXPECT_FALSE(document.IsModified());
    EXPECT_EQ(shell().project().offers.size(), 1U);
}

TEST_F(Insertion, OnDecayTakesALocalLineAtTheOffer) {
    CKota0_adDoc& document = create();
    User user(session);
    user.selectTab("Decay");
    settle(document);
    offer("JAMES", 125.0, 0.0, 4);

    user.key(VK_INSERT);

    EXPECT_THAT(told(), ElementsAre("200", "523"));
    ASSERT_EQ(document.decayList.GetCount(), 2);
    EXPECT_EQ(recordOf(document.decayList, 2).isGlobal, 0);
    EXPECT_EQ(recordOf(document.decayList, 2).riverName, "JAMES");
    EXPECT_EQ(recordOf(document.decayList, 2).chainage, 125.0);
}

TEST_F(Insertion, ByEnterInTheLastCellGoesToTheStartOfTheNewLine) {
    CKota0_adDoc& document = createDispersion();
    User user(session);
    user.putCursor(2, 6);
    settle(document);

    user.key(VK_RETURN);

    EXPECT_EQ(user.grid().GetRowCount(), 3U);
    EXPECT_EQ(user.cursor(), std::make_pair(3U, 1U));
    EXPECT_THAT(told(), ElementsAre("200"));
    EXPECT_FALSE(document.IsModified());
}

TEST_F(Insertion, CommitsTheEditThatIsUnderWay) {
    CKota0_adDoc& document = createDispersion();
    User user(session);
    user.putCursor(1, 3);
    user.type("7");

    user.command(CommandId::InsertLine);

    EXPECT_EQ(user.grid().GetRowCount(), 3U);
    EXPECT_EQ(recordOf(document.dispersList).dispFactor, 7.0);
    EXPECT_TRUE(document.IsModified());
}

TEST_F(Insertion, ThatTheShellUndoesMeanwhileLeavesTheCursorInTheGrid) {
    createDispersion();
    User user(session);
    user.putCursor(2, 3);
    user.type("7");
    bool undone = false;
    shell().onMessage = [&](const kota::headless::Received& received) {
        if (received.code == 523 && !std::exchange(undone, true))
            user.command(ID_EDIT_UNDO);
    };

    user.command(CommandId::InsertLine);

    ASSERT_TRUE(undone);
    EXPECT_EQ(user.grid().GetRowCount(), 2U);
    EXPECT_EQ(user.cursor().first, 2U);
}

TEST_F(Insertion, OfTheProbeDoesNoHarm) {
    CKota0_adDoc& document = createDispersion();

    EXPECT_TRUE(User(session).command(CommandId::InsertProbe));

    EXPECT_EQ(document.dispersList.GetCount(), 2);
}

class Deletion : public DocumentWindow {
protected:
    Deletion() { openProject(); }
};

TEST_F(Deletion, OfTheSelectedLineIsStoredToldAndMarked) {
    CKota0_adDoc& document = createDispersion();
    User user(session);
    user.selectLines(1, 1);

    EXPECT_TRUE(user.command(CommandId::DeleteLine));

    EXPECT_THAT(told(), ElementsAre("523"));
    EXPECT_TRUE(document.IsModified());
    EXPECT_THAT(riversOf(document), ElementsAre("PLATTE"));
    EXPECT_EQ(user.held(1, 1), "PLATTE");
}

TEST_F(Deletion, TellsAndMarksEvenWhereNothingWasDeleted) {
    CKota0_adDoc& document = createDispersion();
    User user(session);

    user.key(VK_DELETE);

    EXPECT_THAT(told(), ElementsAre("523"));
    EXPECT_TRUE(document.IsModified());
    EXPECT_THAT(riversOf(document), ElementsAre("MISSOURI", "PLATTE"));
}

TEST_F(Deletion, OfAllLinesLeavesADefaultOneWhichIsStored) {
    CKota0_adDoc& document = createDispersion();
    User user(session);
    user.selectLines(1, 2);
    settle(document);

    user.command(CommandId::DeleteLine);

    EXPECT_EQ(user.grid().GetRowCount(), 1U);
    EXPECT_THAT(riversOf(document), ElementsAre(""));
    EXPECT_EQ(recordOf(document.dispersList).chainage, notGiven);
    EXPECT_THAT(told(), ElementsAre("523"));
}

TEST_F(Deletion, OfTheLineUnderTheCursorLeavesTheCursorInTheGrid) {
    CKota0_adDoc& document = createDispersion();
    User user(session);
    user.putCursor(1, 3);
    user.selectLines(2, 2);

    user.command(CommandId::DeleteLine);

    EXPECT_EQ(user.cursor(), std::make_pair(1U, 3U));
    EXPECT_TRUE(user.enter("0.25")) << "the user goes on typing";
    EXPECT_EQ(recordOf(document.dispersList).dispFactor, 0.25);
}

TEST_F(Deletion, WorksOnComponentsToo) {
    CKota0_adDoc& document = create();
    addComponent(document.compList, 1, "BOD", 0);
    addComponent(document.compList, 2, "DO", 0);
    document.UpdateAllViews(nullptr, UpdateHint::Fill);
    User user(session);
    settle(document);
    user.selectLines(1, 1);

    user.command(CommandId::DeleteLine);

    ASSERT_EQ(document.compList.GetCount(), 1);
    EXPECT_EQ(recordOf(document.compList).name, "DO");
    EXPECT_EQ(recordOf(document.compList).number, 1);
    EXPECT_THAT(told(), ElementsAre("523"));
}

} // namespace
