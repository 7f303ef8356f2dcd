#include "document/records/component.h"
#include "document/records/decay.h"
#include "platform/framework/frame.h"
#include "platform/framework/message_box.h"
#include "platform/framework/property_sheet.h"
#include "platform/framework/turn.h"
#include "tests/support/editor.h"
#include "tests/support/owned.h"

#include <gmock/gmock.h>

namespace {

using kota::headless::User;
using testing::ElementsAre;
using testing::HasSubstr;
using testing::IsEmpty;

class NothingIsLost : public kota::test::Editor {
protected:
    NothingIsLost() { openProject(); }

    static constexpr UINT minimumEdit = 1012;
};

TEST_F(NothingIsLost, OfACheckBoxThatIsClickedBeforeTheTabIsLeft) {
    CKota0_adDoc& document = create();
    User user(session);
    user.selectTab("Decay");
    document.SetModifiedFlag(FALSE);

    user.clickBox(1, 3);
    user.selectTab("Components");

    EXPECT_TRUE(document.IsModified());
    EXPECT_EQ(static_cast<AD_Decay*>(document.decayList.GetHead())->isGlobal, 0);
}

TEST_F(NothingIsLost, OfATextThatIsTypedWhenTheWindowIsClosed) {
    create();
    User user(session);
    user.putCursor(1, 1);
    user.type("BOD");
    session.screen().answerBox(IDCANCEL);

    EXPECT_FALSE(user.closeWindow());

    EXPECT_THAT(boxes(), ElementsAre(HasSubstr("Save changes")));
    EXPECT_EQ(user.held(1, 1), "BOD");
}

TEST_F(NothingIsLost, OfAnEditThatIsTypedIntoWhenTheDocumentIsSaved) {
    CKota0_adDoc& document = create();
    User user(session);
    user.putCursor(1, 1);
    user.type("bod");

    document.TakePendingInput();

    ASSERT_EQ(document.compList.GetCount(), 1);
    EXPECT_EQ(static_cast<AD_Component*>(document.compList.GetHead())->name, "BOD");
}

TEST_F(NothingIsLost, WhereARefusedTextStopsTheWindowFromClosing) {
    create();
    User user(session);
    user.selectTab("Decay");
    user.putCursor(1, 2);
    user.type("x");

    EXPECT_FALSE(user.closeWindow());

    EXPECT_EQ(user.warning(), "Double number required");
    EXPECT_THAT(boxes(), IsEmpty());
}

TEST_F(NothingIsLost, OfANewerRecordWhenAWindowWasClosedWhileABoxStandsOpen) {
    CKota0_adDoc& document = create();
    User closed(session);
    closed.selectTab("Decay");
    closed.newWindow();
    session.screen().answerBox(IDOK);
    session.screen().onBox = [&] {
        closed.view().GetParentFrame()->DestroyWindow();
        static_cast<AD_Decay*>(document.decayList.GetHead())->decayConst = 7.0;
        document.UpdateAllViews(nullptr, UpdateHint::Store);
        session.screen().onBox = nullptr;
    };

    {
        const kota::Turn turn;
        AfxMessageBox("Wait");
    }

    EXPECT_EQ(static_cast<AD_Decay*>(document.decayList.GetHead())->decayConst, 7.0);
}

TEST_F(NothingIsLost, OfANewerRecordWhenTheShellClosesAWindowWhileItsTabIsFirstShown) {
    CKota0_adDoc& document = create();
    kota::test::addLocal(document.dispersList, 0, "MISSOURI", 1000.0);
    User newer(session);
    newer.selectTab("Dispersion");
    newer.newWindow();
    User closed(session);
    bool isClosed = false;
    shell().onMessage = [&](const kota::headless::Received& received) {
        if (received.code != 503 || isClosed)
            return;
        isClosed = true;
        closed.view().GetParentFrame()->DestroyWindow();
        newer.putCursor(1, 3);
        newer.type("0.75");
        newer.putCursor(1, 4);
    };

    closed.selectTab("Dispersion");
    shell().onMessage = nullptr;

    ASSERT_TRUE(isClosed);
    ASSERT_EQ(document.dispersList.GetCount(), 1);
    EXPECT_EQ(kota::test::recordOf(document.dispersList).dispFactor, 0.75);
}

TEST_F(NothingIsLost, WhenTheShellClosesTheWindowAndThenOffersALocation) {
    CKota0_adDoc& document = create();
    User kept(session);
    kept.newWindow();
    User user(session);
    user.selectTab("Decay");
    document.SetModifiedFlag(FALSE);
    shell().project().offers.push_back({.riverName = "MISSOURI", .chainage = 5.0});
    shell().onMessage = [&](const kota::headless::Received& received) {
        if (received.code == 200)
            user.view().GetParentFrame()->DestroyWindow();
    };

    user.command(42561);
    shell().onMessage = nullptr;

    EXPECT_EQ(document.Views().size(), 1U);
    EXPECT_FALSE(document.IsModified());
    ASSERT_EQ(document.decayList.GetCount(), 1);
    EXPECT_EQ(static_cast<AD_Decay*>(document.decayList.GetHead())->riverName, "");
}

TEST_F(NothingIsLost, OfTheKeyboardWhenASecondDocumentOpens) {
    create();
    create();
    User second(session);

    EXPECT_TRUE(second.key(VK_INSERT));

    EXPECT_EQ(second.grid().GetRowCount(), 2U);
}

TEST_F(NothingIsLost, WhenTheMainWindowIsClosedWithChanges) {
    CKota0_adDoc& document = create();
    document.SetModifiedFlag(TRUE);
    session.screen().answerBox(IDCANCEL);

    shell().SendMessage(WM_CLOSE);

    EXPECT_TRUE(IsWindow(shell().GetSafeHwnd()));
    EXPECT_THAT(boxes(), ElementsAre(HasSubstr("Save changes")));
}

TEST_F(NothingIsLost, WhenTheBoundsOfAnEditAreTypedAndTheTabIsLeftByAProgram) {
    CKota0_adDoc& document = create();
    User user(session);
    user.selectTab("Dispersion");
    user.typeInto(minimumEdit, "200");
    session.screen().answerBox(IDOK);

    EXPECT_FALSE(user.sheet().SetActivePage(0));

    EXPECT_EQ(document.globalVar.G_min_disp_coef, 200.0);
    EXPECT_THAT(boxes(), ElementsAre("Maximum disp. coef. must be greater than minimum disp. coef."));
}

} // namespace
