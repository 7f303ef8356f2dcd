#include "platform/framework/menu.h"

#include <gtest/gtest.h>

namespace {

// "File" with two commands and a separator, "Edit" with a menu inside.
class AMenu : public testing::Test {
protected:
    AMenu() {
        CMenu& file = menu.AppendPopup("&File");
        file.AppendMenu(101, "&New\tCtrl+N");
        file.AppendSeparator();
        file.AppendMenu(102, "E&xit");
        menu.AppendPopup("&Edit").AppendPopup("&More").AppendMenu(103, "&Deep");
    }

    const CMenu& file() const { return *menu.Entries()[0].submenu; }
    const CMenu& more() const { return *menu.Entries()[1].submenu->Entries()[0].submenu; }

    CMenu menu;
};

TEST_F(AMenu, KeepsItsEntriesInTheirOrder) {
    EXPECT_EQ(menu.GetMenuItemCount(), 2);
    ASSERT_EQ(file().GetMenuItemCount(), 3);
    EXPECT_EQ(file().Entries()[0].text, "&New\tCtrl+N");
    EXPECT_EQ(file().Entries()[1].text, "");
    EXPECT_EQ(file().Entries()[1].id, 0U);
    EXPECT_EQ(file().Entries()[2].id, 102U);
    EXPECT_EQ(more().Entries()[0].id, 103U);
    EXPECT_EQ(CMenu().GetMenuItemCount(), 0);
}

TEST_F(AMenu, GreysAnEntryByItsPlace) {
    EXPECT_EQ(menu.EnableMenuItem(1, MF_BYPOSITION | MF_GRAYED), static_cast<int>(MF_ENABLED));

    EXPECT_FALSE(menu.Entries()[1].enabled);
    EXPECT_TRUE(menu.Entries()[0].enabled);
}

TEST_F(AMenu, GreysACommandAtAnyDepth) {
    EXPECT_EQ(menu.EnableMenuItem(103, MF_BYCOMMAND | MF_GRAYED), static_cast<int>(MF_ENABLED));

    EXPECT_FALSE(more().Entries()[0].enabled);
    EXPECT_TRUE(file().Entries()[0].enabled);
}

TEST_F(AMenu, GivesTheStateBefore) {
    menu.EnableMenuItem(101, MF_GRAYED);

    EXPECT_EQ(menu.EnableMenuItem(101, MF_GRAYED), static_cast<int>(MF_GRAYED));
    EXPECT_EQ(menu.EnableMenuItem(101, MF_ENABLED), static_cast<int>(MF_GRAYED));
    EXPECT_EQ(menu.EnableMenuItem(101, MF_ENABLED), static_cast<int>(MF_ENABLED));
    EXPECT_TRUE(file().Entries()[0].enabled);
}

TEST_F(AMenu, HasNoEntryAtAPlaceBeyondItsLast) {
    EXPECT_EQ(menu.EnableMenuItem(2, MF_BYPOSITION | MF_GRAYED), -1);
    EXPECT_EQ(menu.EnableMenuItem(101, MF_BYPOSITION | MF_GRAYED), -1);
    EXPECT_EQ(menu.EnableMenuItem(0xFFFFFFFF, MF_BYPOSITION | MF_GRAYED), -1);
}

TEST_F(AMenu, HasNoEntryOfAnUnknownCommandOrOfZero) {
    EXPECT_EQ(menu.EnableMenuItem(104, MF_GRAYED), -1);
    EXPECT_EQ(menu.EnableMenuItem(0, MF_BYCOMMAND | MF_GRAYED), -1);

    EXPECT_TRUE(menu.Entries()[0].enabled);
    EXPECT_TRUE(file().Entries()[1].enabled);
}

} // namespace
