#include "platform/framework/messages.h"
#include "tests/support/document_window.h"

#include <gmock/gmock.h>

using namespace kota::test;

namespace {

using kota::headless::Received;
using kota::headless::User;
using testing::ElementsAre;
using testing::IsEmpty;

class TheCurrentLocation : public DocumentWindow {
protected:
    TheCurrentLocation() { openProject(); }
};

TEST_F(TheCurrentLocation, IsToldWhenAnotherLineOfDispersionBecomesCurrent) {
    CKota0_adDoc& document = createDispersion();
    User user(session);

    user.putCursor(2, 4);

    ASSERT_THAT(told(), ElementsAre("503"));
    const Received message = shell().received(503).at(0);
    EXPECT_EQ(message.message, communicationMessage());
    EXPECT_EQ(message.sender, &viewOf(document));
    EXPECT_EQ(message.documentName, document.GetTitle());
    EXPECT_EQ(message.packageKind, 5);
    EXPECT_EQ(message.project, projectHandle);
    ASSERT_TRUE(message.location);
    EXPECT_EQ(message.location->riverName, "PLATTE");
    EXPECT_EQ(message.location->chainage, 2000.0);
    EXPECT_EQ(message.location->chainage2, 0.0);
    EXPECT_EQ(message.location->dataType, 5);
    EXPECT_FALSE(document.IsModified());
}

TEST_F(TheCurrentLocation, IsOneItemAndNoList) {
    createDispersion();
    bool isItem = false;
    shell().onMessage = [&](const Received& message) {
        isItem = dynamic_cast<CK31_CBE_ModelDataItem*>(message.items) != nullptr;
    };

    User(session).putCursor(2, 1);

    EXPECT_TRUE(isItem);
}

TEST_F(TheCurrentLocation, IsNotToldWithinALine) {
    createDispersion();
    User user(session);
    user.putCursor(2, 1);
    shell().forgetReceived();

    user.putCursor(2, 5);
    user.key(VK_LEFT);

    EXPECT_THAT(told(), IsEmpty());
}

TEST_F(TheCurrentLocation, IsToldByEveryWayToALine) {
    createDispersion();
    User user(session);

    user.key(VK_DOWN);
    user.key(VK_UP);
    user.selectLines(2, 2);

    EXPECT_THAT(told(), ElementsAre("503", "503", "503"));
    EXPECT_EQ(shell().received(503).at(1).location->riverName, "MISSOURI");
}

TEST_F(TheCurrentLocation, IsNotToldOfALineWithoutARiver) {
    CKota0_adDoc& document = create();
    addDispersion(document, "MISSOURI", 1000.0);
    addDispersion(document, "", 2000.0);
    User user(session);
    user.selectTab("Dispersion");
    shell().forgetReceived();

    user.putCursor(2, 1);

    EXPECT_THAT(told(), IsEmpty());
}

TEST_F(TheCurrentLocation, HasTheChainageZeroForABlankOne) {
    CKota0_adDoc& document = create();
    addDispersion(document, "MISSOURI", 1000.0);
    addDispersion(document, "PLATTE", notGiven);
    User user(session);
    user.selectTab("Dispersion");
    shell().forgetReceived();

    user.putCursor(2, 1);

    ASSERT_THAT(told(), ElementsAre("503"));
    EXPECT_EQ(shell().received(503).at(0).location->chainage, 0.0);
}

TEST_F(TheCurrentLocation, IsInMetresWhateverTheUserSees) {
    const UnitChoice feet(100143, 1);
    createDispersion();
    User user(session);
    user.putCursor(1, 2);
    user.type("1000");
    user.putCursor(2, 2);

    user.putCursor(1, 2);

    EXPECT_DOUBLE_EQ(shell().received(503).back().location->chainage, 304.8);
}

TEST_F(TheCurrentLocation, IsNeverToldByDecay) {
    CKota0_adDoc& document = create();
    addGlobal(document.decayList, 1);
    addLocal(document.decayList, 1, "MISSOURI", 1000.0);
    addLocal(document.decayList, 1, "PLATTE", 2000.0);
    User user(session);
    user.selectTab("Decay");

    for (const ROWCOL line : {2U, 3U, 1U})
        EXPECT_TRUE(user.putCursor(line, 1));

    EXPECT_EQ(times(503), 0U);
}

TEST_F(TheCurrentLocation, IsNeverToldByComponents) {
    CKota0_adDoc& document = create();
    addComponent(document.compList, 1, "BOD", 0);
    addComponent(document.compList, 2, "DO", 0);
    document.UpdateAllViews(nullptr, UpdateHint::Fill);
    User user(session);

    EXPECT_TRUE(user.putCursor(2, 1));
    EXPECT_TRUE(user.putCursor(1, 1));

    EXPECT_EQ(times(503), 0U);
}

TEST_F(TheCurrentLocation, IsNotToldByPagesWithoutPlaces) {
    CKota0_adDoc& document = createDispersion();
    User user(session);

    for (const char* caption : {"KOTA 32 Dispersion", "Cohesive ST", "Additional output"}) {
        user.selectTab(caption);
        viewOf(document).OnGridRowChanged(1);
    }

    EXPECT_EQ(times(503), 0U);
}

TEST_F(TheCurrentLocation, IsNotToldOutsideAProject) {
    shell().openProject(0);
    CKota0_adDoc& document = createDispersion();

    User(session).putCursor(2, 1);
    viewOf(document).OnGridRowChanged(1);

    EXPECT_THAT(told(), IsEmpty());
}

TEST_F(TheCurrentLocation, IsTheLineAsTheCellsHaveItNow) {
    createDispersion();
    User user(session);
    user.putCursor(2, 1);
    user.type("JAMES");
    user.putCursor(1, 1);
    shell().forgetReceived();

    user.putCursor(2, 1);

    EXPECT_EQ(shell().received(503).at(0).location->riverName, "JAMES");
}

} // namespace
