#include "platform/framework/messages.h"
#include "tests/support/document_window.h"

#include <gmock/gmock.h>

using namespace kota::test;

namespace {

using kota::headless::User;
using testing::ElementsAre;
using testing::IsEmpty;

class AnEdit : public DocumentWindow {};

// A value typed into a cell of the decay grid, from the key to the shell and to the other window.
TEST_F(AnEdit, GoesFromTheCellToTheDocumentTheShellAndTheOtherViews) {
    openProject();
    CKota0_adDoc& document = create();
    addComponent(document.compList, 1, "BOD", 0);
    User other(session);
    ASSERT_TRUE(other.selectTab("Decay"));
    ASSERT_TRUE(other.newWindow());
    User user(session);
    ASSERT_TRUE(user.selectTab("Decay"));
    ASSERT_EQ(document.Views().size(), 2U);
    settle(document);

    ASSERT_TRUE(user.putCursor(1, 2));
    EXPECT_TRUE(user.type("0.3x"));
    EXPECT_FALSE(user.putCursor(1, 1)) << "a bad number holds the cell";
    EXPECT_EQ(user.warning(), "Double number required");
    EXPECT_EQ(user.cursor(), std::make_pair(1U, 2U));
    EXPECT_EQ(CWnd::GetFocus(), &user.grid());
    EXPECT_EQ(recordOf(document.decayList).decayConst, 0.0) << "and does not reach the document";

    settle(document);
    EXPECT_TRUE(user.type("0.344"));
    EXPECT_EQ(recordOf(document.decayList).decayConst, 0.0) << "nothing is stored at a key";
    EXPECT_TRUE(user.putCursor(1, 1));

    ASSERT_EQ(document.decayList.GetCount(), 1);
    EXPECT_EQ(recordOf(document.decayList).decayConst, 0.344);
    EXPECT_TRUE(document.IsModified());
    EXPECT_THAT(told(), ElementsAre("523")) << "the cell entered stands in column 1";
    EXPECT_EQ(other.held(1, 2), "0.344000") << "the other window shows the record";
    EXPECT_EQ(user.held(1, 2), "0.344") << "this one keeps what was typed";
    EXPECT_EQ(CWnd::GetFocus(), &user.grid());
    EXPECT_THAT(boxes(), IsEmpty());
}

TEST_F(AnEdit, IsConvertedFromTheUsersUnitOnItsWayToTheDocument) {
    const UnitChoice perDay(100149, 1);
    CKota0_adDoc& document = create();
    User user(session);
    user.selectTab("Decay");

    user.putCursor(1, 2);
    user.type("24");
    user.putCursor(1, 1);

    EXPECT_EQ(recordOf(document.decayList).decayConst, 1.0);
}

TEST_F(AnEdit, IsDoneWhenAnotherLineBecomesCurrentWhichTheShellIsTold) {
    openProject();
    CKota0_adDoc& document = createDispersion();
    User user(session);
    ASSERT_EQ(user.cursor(), std::make_pair(1U, 1U));

    user.putCursor(1, 3);
    user.type("7");
    user.putCursor(2, 2);

    EXPECT_EQ(recordOf(document.dispersList).dispFactor, 7.0);
    EXPECT_THAT(told(), ElementsAre("523", "503")) << "first the change, then the line";
    EXPECT_EQ(shell().received(503).at(0).location->riverName, "PLATTE");
    EXPECT_EQ(shell().received(503).at(0).location->chainage, 2000.0);
}

TEST_F(AnEdit, IsToldOnceForAChangeOfSeveralKeys) {
    openProject();
    createDispersion();
    User user(session);

    user.putCursor(1, 3);
    user.type("1");
    user.type("12");
    user.type("12.5");
    user.putCursor(1, 1);

    EXPECT_THAT(told(), ElementsAre("523"));
}

TEST_F(AnEdit, IsNoneWhereACellIsOnlyVisited) {
    openProject();
    CKota0_adDoc& document = createDispersion();
    User user(session);

    for (ROWCOL col = 1; col <= 6; ++col)
        user.putCursor(1, col);

    EXPECT_FALSE(document.IsModified());
    EXPECT_THAT(told(), IsEmpty());
}

// The cell counts as edited from the first key on, whatever the validation says of the text.
TEST_F(AnEdit, ThatIsRefusedIsToldWithTheValuesFromBefore) {
    openProject();
    CKota0_adDoc& document = createDispersion();
    User user(session);
    user.putCursor(1, 3);
    user.type("x");

    EXPECT_FALSE(user.putCursor(1, 1));
    EXPECT_THAT(told(), ElementsAre("523"));
    EXPECT_TRUE(document.IsModified());
    EXPECT_EQ(recordOf(document.dispersList).dispFactor, 0.0);

    settle(document);
    EXPECT_FALSE(user.putCursor(1, 1)) << "it stays refused";
    EXPECT_THAT(told(), IsEmpty()) << "and is not told again before another key";
}

TEST_F(AnEdit, IsCommittedWhenTheTabIsLeft) {
    CKota0_adDoc& document = createDispersion();
    User user(session);
    user.putCursor(2, 3);
    user.type("7");

    EXPECT_TRUE(user.selectTab("Decay"));

    EXPECT_EQ(recordOf(document.dispersList, 2).dispFactor, 7.0);
    EXPECT_TRUE(document.IsModified());
}

} // namespace
