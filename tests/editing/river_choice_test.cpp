#include "platform/framework/messages.h"
#include "tests/support/document_window.h"

#include <gmock/gmock.h>

using namespace kota::test;

namespace {

using kota::headless::User;
using testing::IsEmpty;

class RiverChoice : public DocumentWindow {
protected:
    RiverChoice() {
        openProject();
        shell().project().rivers = {"MISSOURI", "PLATTE", "JAMES"};
    }

    static CGXStyle styleOf(const User& user, ROWCOL row, ROWCOL col) {
        CGXStyle style;
        user.grid().ComposeStyleRowCol(row, col, &style);
        return style;
    }
};

TEST_F(RiverChoice, OffersTheProjectsRiversInTheirColumn) {
    CKota0_adDoc& document = createDispersion();
    User user(session);
    EXPECT_EQ(styleOf(user, 1, 1).GetControl(), GX_IDS_CTRL_TEXTFIT);
    EXPECT_EQ(times(52), 0U) << "nobody is asked before an edit begins";

    user.putCursor(2, 1);
    EXPECT_TRUE(user.choose("JAMES"));
    user.putCursor(2, 2);

    EXPECT_EQ(times(52), 1U);
    EXPECT_EQ(shell().received(52).at(0).project, projectHandle);
    EXPECT_EQ(styleOf(user, 1, 1).GetChoiceList(), "MISSOURI\nPLATTE\nJAMES");
    EXPECT_EQ(recordOf(document.dispersList, 2).riverName, "JAMES");
}

TEST_F(RiverChoice, TakesFreeTextToo) {
    CKota0_adDoc& document = createDispersion();
    User user(session);

    user.putCursor(1, 1);
    EXPECT_TRUE(user.type("ELSEWHERE"));
    EXPECT_TRUE(user.putCursor(1, 2));

    EXPECT_EQ(recordOf(document.dispersList).riverName, "ELSEWHERE");
}

TEST_F(RiverChoice, IsAskedForOnceAView) {
    createDispersion();
    User user(session);
    for (const ROWCOL line : {1U, 2U, 1U}) {
        user.putCursor(line, 1);
        user.type("PLATTE");
    }
    shell().project().rivers = {"NEW RIVER"};
    user.selectTab("Decay");
    user.clickBox(1, 3);
    user.putCursor(1, 4);
    user.type("JAMES");
    EXPECT_EQ(times(52), 1U);
    EXPECT_EQ(styleOf(user, 1, 4).GetChoiceList(), "MISSOURI\nPLATTE\nJAMES") << "later changes are not seen";

    user.putCursor(1, 1);
    user.newWindow();
    User second(session);
    second.selectTab("Dispersion");
    second.putCursor(1, 1);
    second.type("J");
    EXPECT_EQ(times(52), 2U) << "another view asks for itself";
    EXPECT_EQ(styleOf(second, 1, 1).GetChoiceList(), "NEW RIVER");
}

TEST_F(RiverChoice, IsAskedForInItsColumnAlone) {
    createDispersion();
    User user(session);

    for (ROWCOL col = 2; col <= 6; ++col) {
        user.putCursor(1, col);
        user.type("1");
    }

    EXPECT_EQ(times(52), 0U);
}

TEST_F(RiverChoice, IsNoneWhereTheShellKnowsNoRivers) {
    shell().project().rivers.clear();
    CKota0_adDoc& document = createDispersion();
    User user(session);

    user.putCursor(1, 1);
    EXPECT_TRUE(user.type("ELSEWHERE"));
    EXPECT_TRUE(user.putCursor(1, 2));

    EXPECT_EQ(recordOf(document.dispersList).riverName, "ELSEWHERE");
    EXPECT_EQ(styleOf(user, 1, 1).GetChoiceList(), "");
    EXPECT_EQ(times(52), 1U);
    user.putCursor(2, 1);
    user.type("J");
    EXPECT_EQ(times(52), 2U) << "what was not answered is asked again";
}

TEST_F(RiverChoice, IsGivenToWhoAsksTheView) {
    CKota0_adDoc& document = create();
    CString rivers = "before";

    viewOf(document).GetRiverChoiceList(rivers);
    viewOf(document).GetRiverChoiceList(rivers);

    EXPECT_EQ(rivers, "MISSOURI\nPLATTE\nJAMES");
    EXPECT_EQ(times(52), 1U);
}

TEST_F(RiverChoice, IsEmptyAndNotAskedForOutsideAProject) {
    shell().openProject(0);
    CKota0_adDoc& document = createDispersion();
    User user(session);
    CString rivers = "before";

    viewOf(document).GetRiverChoiceList(rivers);
    user.putCursor(1, 1);
    user.type("j");
    user.putCursor(1, 2);

    EXPECT_EQ(rivers, "");
    EXPECT_EQ(times(52), 0U);
    EXPECT_EQ(styleOf(user, 1, 1).GetControl(), 4788U) << "the column is of upper-case text";
    EXPECT_EQ(user.held(1, 1), "J");
}

TEST_F(RiverChoice, ReachesEveryTabThatIsShownLater) {
    create();
    User user(session);

    user.selectTab("Dispersion");
    EXPECT_EQ(styleOf(user, 1, 1).GetControl(), GX_IDS_CTRL_TEXTFIT);
    user.selectTab("Decay");
    EXPECT_EQ(styleOf(user, 1, 4).GetControl(), GX_IDS_CTRL_TEXTFIT);
    user.selectTab("Components");
    EXPECT_EQ(styleOf(user, 1, 1).GetControl(), 4788U);
    EXPECT_THAT(boxes(), IsEmpty());
}

} // namespace
