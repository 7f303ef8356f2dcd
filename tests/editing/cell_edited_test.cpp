#include "platform/framework/messages.h"
#include "tests/support/document_window.h"

#include <gmock/gmock.h>

#include <array>

using namespace kota::test;

namespace {

using kota::headless::User;
using testing::ElementsAre;
using testing::IsEmpty;

class ACellEdited : public DocumentWindow {
protected:
    ACellEdited() { openProject(); }
};

TEST_F(ACellEdited, OnDispersionTellsTheShellByTheColumnEnteredNext) {
    CKota0_adDoc& document = createDispersion();
    User user(session);
    for (ROWCOL entered = 1; entered <= 6; ++entered) {
        const ROWCOL edited = entered == 4 ? 5 : 4;
        ASSERT_TRUE(user.putCursor(1, edited));
        settle(document);
        ASSERT_TRUE(user.type(std::to_string(entered)));

        ASSERT_TRUE(user.putCursor(1, entered));

        EXPECT_EQ(times(523), entered <= 2 ? 1U : 0U) << entered;
        EXPECT_TRUE(document.IsModified()) << entered;
    }
}

TEST_F(ACellEdited, OnDecayTellsTheShellByTheColumnEnteredNext) {
    CKota0_adDoc& document = create();
    User user(session);
    user.selectTab("Decay");
    for (ROWCOL entered = 1; entered <= 5; ++entered) {
        ASSERT_TRUE(user.putCursor(1, 2));
        settle(document);
        ASSERT_TRUE(user.type(std::to_string(entered)));

        ASSERT_TRUE(user.grid().SetCurrentCell(1, entered));

        EXPECT_EQ(times(523), entered <= 2 ? 1U : 0U) << entered;
        EXPECT_TRUE(document.IsModified()) << entered;
    }
}

TEST_F(ACellEdited, OnComponentsTellsTheShellInTheFirstTwoColumnsAlone) {
    CKota0_adDoc& document = create();
    User user(session);
    ASSERT_TRUE(user.putCursor(1, 1));
    settle(document);
    user.type("BOD");
    user.putCursor(1, 3);
    EXPECT_THAT(told(), IsEmpty());
    EXPECT_TRUE(document.IsModified());
    EXPECT_EQ(recordOf(document.compList).name, "BOD");

    settle(document);
    user.choose("Multi Layer Cohesive");
    user.putCursor(1, 2);
    EXPECT_THAT(told(), ElementsAre("523"));
    EXPECT_EQ(recordOf(document.compList).kind, 2);
}

// On every tab, whatever stands on it.
TEST_F(ACellEdited, TellsTheShellByColumnAndTab) {
    CKota0_adDoc& document = create();
    User user(session);
    constexpr std::array<bool, 9> tabTells = {false, false, true, true, false, true, true, true, false};

    for (std::size_t tab = 0; tab < tabTells.size(); ++tab) {
        ASSERT_TRUE(user.selectTab(tabCaptions[tab]));
        for (ROWCOL column = 0; column <= 12; ++column) {
            settle(document);

            viewOf(document).OnGridCellEdited(column);

            const bool tells = tabTells[tab] || column == 1 || column == 2;
            EXPECT_EQ(times(523), tells ? 1U : 0U) << tabCaptions[tab] << ", column " << column;
            EXPECT_TRUE(document.IsModified()) << tabCaptions[tab] << ", column " << column;
        }
    }
}

TEST_F(ACellEdited, IsToldWithTheDocumentAndTheProject) {
    CKota0_adDoc& document = createDispersion();

    viewOf(document).OnGridCellEdited(1);

    const kota::headless::Received change = shell().received(523).at(0);
    EXPECT_EQ(change.message, communicationMessage());
    EXPECT_EQ(change.sender, nullptr);
    EXPECT_EQ(change.documentName, document.GetTitle());
    EXPECT_EQ(change.packageKind, 5);
    EXPECT_EQ(change.project, projectHandle);
    EXPECT_EQ(change.items, nullptr);
}

TEST_F(ACellEdited, InAnEditOfAPageMarksTheDocumentAndTellsNobody) {
    CKota0_adDoc& document = createDispersion();
    User user(session);

    user.enterInto(1008, "0.75");

    EXPECT_EQ(document.globalVar.G_disp_factor, 0.75);
    EXPECT_TRUE(document.IsModified());
    EXPECT_THAT(told(), IsEmpty());
}

class OutsideAProject : public DocumentWindow {};

TEST_F(OutsideAProject, NothingIsToldButTheRequestForALocation) {
    CKota0_adDoc& document = createDispersion();
    User user(session);

    user.putCursor(2, 3);
    user.type("1");
    user.putCursor(1, 1);
    EXPECT_TRUE(document.IsModified());
    user.type("JAMES");
    user.putCursor(1, 2);
    user.selectLines(1, 1);
    user.command(42562);
    EXPECT_THAT(riversOf(document), ElementsAre("PLATTE"));
    EXPECT_THAT(told(), IsEmpty());

    user.command(42561);
    EXPECT_THAT(told(), ElementsAre("200")) << "a location is asked for all the same";
    EXPECT_EQ(shell().received(200).at(0).project, 0);
    EXPECT_EQ(user.grid().GetRowCount(), 2U) << "and a default line comes where none is offered";

    settle(document);
    user.closeWindow();
    EXPECT_THAT(told(), ElementsAre("hide", "503"));
}

TEST_F(OutsideAProject, OnlyTheProjectIsAskedForAtTheStart) {
    create();

    EXPECT_THAT(told(), ElementsAre("25", "show"));
}

} // namespace
