#include "document/records/decay.h"
#include "tests/support/editor.h"

#include <gmock/gmock.h>

namespace {

using kota::headless::User;
using testing::ElementsAre;
using testing::IsEmpty;

class AnEdit : public kota::test::Editor {};

TEST_F(AnEdit, ReachesTheDocumentWhenTheCellIsLeft) {
    openProject();
    CKota0_adDoc& document = create();
    User user(session);
    ASSERT_TRUE(user.selectTab("Decay"));
    document.SetModifiedFlag(FALSE);
    shell().forgetReceived();

    ASSERT_TRUE(user.putCursor(1, 2));
    EXPECT_TRUE(user.type("0.3x"));
    EXPECT_FALSE(user.putCursor(1, 1)) << "a bad number holds the cell";
    EXPECT_EQ(user.warning(), "Double number required");
    EXPECT_EQ(user.cursor(), std::make_pair(1U, 2U));
    EXPECT_TRUE(user.type("0.344"));
    EXPECT_TRUE(user.putCursor(1, 1));

    ASSERT_EQ(document.decayList.GetCount(), 1);
    EXPECT_EQ(static_cast<AD_Decay*>(document.decayList.GetHead())->decayConst, 0.344);
    EXPECT_TRUE(document.IsModified());
    EXPECT_FALSE(shell().received(523).empty()) << "the cell entered stands in column 1";
    EXPECT_THAT(boxes(), IsEmpty());
}

} // namespace
