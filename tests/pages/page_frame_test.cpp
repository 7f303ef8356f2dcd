#include "tests/pages/tabs.h"

namespace {

using testing::ElementsAre;

struct TabHelp {
    const char* tab;
    UINT context;
};

class EveryTab : public kota::test::Editor, public testing::WithParamInterface<TabHelp> {};

TEST_P(EveryTab, HasHelpOfItsOwn) {
    create();
    kota::headless::User user(session);
    ASSERT_TRUE(user.selectTab(GetParam().tab));
    EXPECT_TRUE(user.key(VK_F1));
    user.page().SendMessage(WM_COMMAND, commandParam(57670, 0));
    EXPECT_THAT(session.application().helpContexts, ElementsAre(GetParam().context, GetParam().context));
}

INSTANTIATE_TEST_SUITE_P(InTheirOrder, EveryTab,
                         testing::Values(TabHelp{"Components", 135845}, TabHelp{"Dispersion", 135843},
                                         TabHelp{"KOTA 32 Dispersion", 0x20000 + 4797},
                                         TabHelp{"Init.Cond.", 0x20000 + 4775}, TabHelp{"Decay", 135848},
                                         TabHelp{"Cohesive ST", 0x20000 + 4772},
                                         TabHelp{"Sediment Layers", 0x20000 + 4778},
                                         TabHelp{"Additional output", 0x20000 + 4794},
                                         TabHelp{"KOTA 32 Additional output", 0x20000 + 4795}),
                         [](const auto& tab) { return std::to_string(tab.param.context); });

class TheMainMenu : public kota::test::Editor {
protected:
    TheMainMenu() {
        create();
        user.emplace(session);
    }

    CMenu& menu() { return *session.mainWindow().GetMenu(); }
    bool gridIsEnabledOn(const char* tab) {
        EXPECT_TRUE(user->selectTab(tab));
        return menu().Entries().at(2).enabled;
    }

    std::optional<kota::headless::User> user;
};

TEST_F(TheMainMenu, HasItsThirdEntryEnabledOnTabsWithAGridAndGreyedOnTheAdditionalOutput) {
    for (const char* tab : {"Dispersion", "Components", "Decay", "KOTA 32 Dispersion"}) {
        EXPECT_FALSE(gridIsEnabledOn("Additional output"));
        EXPECT_TRUE(gridIsEnabledOn(tab)) << tab;
    }
}

TEST_F(TheMainMenu, StaysAsItIsOnTheSecondAdditionalOutput) {
    EXPECT_TRUE(gridIsEnabledOn("Decay"));
    EXPECT_TRUE(gridIsEnabledOn("KOTA 32 Additional output"));
    EXPECT_FALSE(gridIsEnabledOn("Additional output"));
    EXPECT_FALSE(gridIsEnabledOn("KOTA 32 Additional output"));
}

TEST_F(TheMainMenu, KeepsItsOtherEntriesEnabled) {
    EXPECT_FALSE(gridIsEnabledOn("Additional output"));
    for (std::size_t entry = 0; entry < menu().Entries().size(); ++entry)
        EXPECT_EQ(menu().Entries()[entry].enabled, entry != 2) << entry;
}

} // namespace
