#include "platform/framework/input.h"
#include "resources/ids.h"
#include "tests/support/document_window.h"

#include <gmock/gmock.h>

using namespace kota::test;

namespace {

using kota::headless::User;
using testing::ElementsAre;
using testing::SizeIs;

class MainMenu : public DocumentWindow {
protected:
    const std::vector<CMenu::Entry>& bar() { return shell().GetMenu()->Entries(); }
    std::vector<std::string> texts() {
        std::vector<std::string> all;
        for (const CMenu::Entry& entry : bar())
            all.emplace_back(entry.text.View());
        return all;
    }
    bool gridIsEnabled() { return bar().at(2).enabled; }
    static bool bringToFront(CView& view) {
        return kota::input::activate(static_cast<CMDIChildWnd&>(*view.GetParentFrame()));
    }
    // A document whose window shows a tab.
    CKota0_adDoc& createOn(const char* tab) {
        CKota0_adDoc& document = create();
        User(session).selectTab(tab);
        return document;
    }
};

TEST_F(MainMenu, HasTheGridMenuThirdWithADocumentInFront) {
    create();

    EXPECT_THAT(texts(), ElementsAre("&File", "&Edit", "&Grid", "&View", "&Window", "&Help"));
    ASSERT_NE(bar()[2].submenu, nullptr);
    EXPECT_THAT(bar()[2].submenu->Entries(), SizeIs(6));
    EXPECT_EQ(bar()[2].submenu->Entries()[0].id, CommandId::InsertLine);
    EXPECT_TRUE(gridIsEnabled());
}

TEST_F(MainMenu, HasNoGridMenuWithoutADocument) {
    EXPECT_THAT(texts(), ElementsAre("&File", "&Edit", "&View", "&Window", "&Help"));

    create();
    User(session).closeWindow();

    EXPECT_THAT(texts(), ElementsAre("&File", "&Edit", "&View", "&Window", "&Help"));
}

TEST_F(MainMenu, HasTheGridMenuOnceForAnyNumberOfWindows) {
    create();
    create();
    User(session).newWindow();

    EXPECT_THAT(texts(), ElementsAre("&File", "&Edit", "&Grid", "&View", "&Window", "&Help"));

    User(session).closeWindow();
    EXPECT_THAT(texts(), ElementsAre("&File", "&Edit", "&Grid", "&View", "&Window", "&Help"));
}

TEST_F(MainMenu, IsGreyedForTheWindowThatShowsTheAdditionalOutputAlone) {
    CKota0_adDoc& output = createOn("Additional output");
    ASSERT_FALSE(gridIsEnabled());

    CKota0_adDoc& other = create();
    EXPECT_TRUE(gridIsEnabled());

    EXPECT_TRUE(bringToFront(viewOf(output)));
    EXPECT_FALSE(gridIsEnabled());
    EXPECT_TRUE(bringToFront(viewOf(other)));
    EXPECT_TRUE(gridIsEnabled());
}

TEST_F(MainMenu, IsGreyedForOneOfTwoWindowsOfADocument) {
    CKota0_adDoc& document = createOn("Additional output");
    User(session).newWindow();
    EXPECT_TRUE(gridIsEnabled());

    EXPECT_TRUE(bringToFront(viewOf(document, 1)));
    EXPECT_FALSE(gridIsEnabled());
    EXPECT_TRUE(bringToFront(viewOf(document, 2)));
    EXPECT_TRUE(gridIsEnabled());
}

TEST_F(MainMenu, IsGreyedAgainWhenAnotherWindowIsClosed) {
    createOn("Additional output");
    create();

    EXPECT_TRUE(User(session).closeWindow());

    EXPECT_FALSE(gridIsEnabled());
}

TEST_F(MainMenu, IsEnabledAgainWhenTheWindowThatShowsTheAdditionalOutputIsClosed) {
    create();
    createOn("Additional output");

    EXPECT_TRUE(User(session).closeWindow());

    EXPECT_TRUE(gridIsEnabled());
}

TEST_F(MainMenu, IsEnabledForANewDocumentAfterTheLastOneLeftItGreyed) {
    createOn("Additional output");
    User(session).closeWindow();
    EXPECT_TRUE(gridIsEnabled()) << "another menu stands there now";

    create();

    EXPECT_TRUE(gridIsEnabled());
}

TEST_F(MainMenu, FollowsTheTabOfItsWindow) {
    createOn("Additional output");
    create();
    User(session).selectTab("Additional output");
    EXPECT_FALSE(gridIsEnabled());
    User(session).selectTab("Decay");
    EXPECT_TRUE(gridIsEnabled());
}

class TheGridMenusCommands : public MainMenu {
protected:
    static constexpr UINT commands[] = {CommandId::InsertLine, CommandId::DeleteLine, CommandId::Search,
                                        CommandId::FindNext, CommandId::GotoLine};
};

TEST_F(TheGridMenusCommands, AreStoppedWhileItIsGreyed) {
    createOn("Additional output");
    User user(session);

    for (const UINT command : commands) {
        EXPECT_FALSE(kota::input::canCommand(command)) << command;
        EXPECT_FALSE(user.command(command)) << command;
    }
    EXPECT_THAT(boxes(), ElementsAre());
}

TEST_F(TheGridMenusCommands, CanBeRunWhileItIsEnabled) {
    createOn("Decay");

    for (const UINT command : commands)
        EXPECT_TRUE(kota::input::canCommand(command)) << command;
}

TEST_F(TheGridMenusCommands, CanBeRunAgainInAnotherWindow) {
    createOn("Additional output");
    CKota0_adDoc& document = createDispersion();
    User user(session);
    user.selectLines(2, 2);

    EXPECT_TRUE(user.command(CommandId::DeleteLine));

    EXPECT_THAT(riversOf(document), ElementsAre("MISSOURI"));
}

TEST_F(TheGridMenusCommands, CannotBeRunWithoutADocument) {
    for (const UINT command : commands) {
        EXPECT_FALSE(kota::input::canCommand(command)) << command;
        EXPECT_FALSE(kota::input::command(command)) << command;
    }
}

TEST_F(TheGridMenusCommands, LeaveTheCommandsOfFilesAloneWhenGreyed) {
    createOn("Additional output");

    EXPECT_TRUE(kota::input::canCommand(ID_FILE_SAVE));
    EXPECT_TRUE(User(session).newWindow());
}

} // namespace
