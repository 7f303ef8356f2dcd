#include "tests/platform/windows/test_windows.h"

#include "platform/framework/document.h"
#include "platform/framework/frame.h"
#include "platform/framework/input.h"

namespace {

using testing::ElementsAre;

enum : UINT {
    ViewCommand = 40001,
    DocumentCommand,
    FrameCommand,
    MainCommand,
    NobodysCommand,
    EverybodysCommand
};

const kota::Module& commandModule() {
    static const kota::Module module("command test", kota::Resources{});
    return module;
}

// Who was asked for a command, in order.
std::vector<std::string>& asked() {
    static std::vector<std::string> names;
    return names;
}

class CommandedDocument : public CDocument {
public:
    BOOL OnOpenDocument(const char* /*path*/) override { return TRUE; }
    BOOL OnSaveDocument(const char* /*path*/) override { return TRUE; }
    BOOL DoSave(const char* path) override {
        asked().push_back("save as \"" + std::string(path) + "\"");
        return TRUE;
    }
    BOOL OnCmdMsg(UINT id, int notification) override {
        asked().emplace_back("document");
        return (id == DocumentCommand && notification == 0) || CDocument::OnCmdMsg(id, notification);
    }
};

class CommandedView : public CView {
    DECLARE_DYNCREATE(CommandedView)
public:
    BOOL OnCmdMsg(UINT id, int notification) override {
        static constexpr auto commands = kota::commandMap<CommandedView>({
            {ViewCommand, 0, &CommandedView::OnCommand},
            {ViewCommand, EN_CHANGE, &CommandedView::OnChange},
        });
        asked().emplace_back("view");
        return kota::runCommand(*this, commands, id, notification) || CView::OnCmdMsg(id, notification);
    }

private:
    void OnCommand() { asked().emplace_back("view's command"); }
    void OnChange() { asked().emplace_back("view's change"); }
};
IMPLEMENT_DYNCREATE(CommandedView, CView, commandModule)

class CommandedFrame : public CMDIChildWnd {
public:
    BOOL OnCmdMsg(UINT id, int notification) override {
        if (CMDIChildWnd::OnCmdMsg(id, notification))
            return TRUE;
        asked().emplace_back("frame");
        return id == FrameCommand;
    }
};

class CommandedMain : public CMDIFrameWnd {
public:
    CommandedMain() { Create({.kind = kota::WindowKind::Frame}); }
    BOOL OnCmdMsg(UINT id, int notification) override {
        if (CMDIFrameWnd::OnCmdMsg(id, notification))
            return TRUE;
        asked().emplace_back("main");
        return id == MainCommand;
    }
};

// A main window with one document's frame in front.
class ACommand : public testing::Test {
protected:
    ACommand() {
        application.SetMainWnd(&main);
        auto* const frame = new CommandedFrame;
        frame->LoadFrame(&main, {.viewClass = RUNTIME_CLASS(CommandedView), .document = &document});
        frame->InitialUpdateFrame(&document, TRUE);
        asked().clear();
    }

    kota::test::WatchedScreen screen;
    CommandedDocument document;
    kota::headless::Application application;
    CommandedMain main;
};

TEST_F(ACommand, GoesToTheActiveViewFirst) {
    EXPECT_TRUE(kota::input::command(ViewCommand));

    EXPECT_THAT(asked(), ElementsAre("view", "view's command"));
}

TEST_F(ACommand, OfTheDocumentPassesTheView) {
    EXPECT_TRUE(kota::input::command(DocumentCommand));

    EXPECT_THAT(asked(), ElementsAre("view", "document"));
}

TEST_F(ACommand, OfTheFramePassesViewAndDocument) {
    EXPECT_TRUE(kota::input::command(FrameCommand));

    EXPECT_THAT(asked(), ElementsAre("view", "document", "frame"));
}

TEST_F(ACommand, OfTheMainWindowPassesAllOthers) {
    EXPECT_TRUE(kota::input::command(MainCommand));

    EXPECT_THAT(asked(), ElementsAre("view", "document", "frame", "main"));
}

TEST_F(ACommand, ThatNobodyKnowsIsNotTaken) {
    EXPECT_FALSE(kota::input::command(NobodysCommand));

    EXPECT_THAT(asked(), ElementsAre("view", "document", "frame", "main"));
}

TEST_F(ACommand, IsNotMixedUpWithANotificationOfTheSameNumber) {
    EXPECT_TRUE(main.SendMessage(WM_COMMAND, commandParam(ViewCommand, EN_CHANGE)));
    EXPECT_THAT(asked(), ElementsAre("view", "view's change"));

    asked().clear();
    EXPECT_FALSE(main.SendMessage(WM_COMMAND, commandParam(ViewCommand, EN_KILLFOCUS)));
    EXPECT_THAT(asked(), ElementsAre("view", "document", "frame", "main"));
}

TEST_F(ACommand, SavesTheDocumentUnderItsNameOrAsksForOne) {
    document.SetPathName("/rivers/platte.tst");

    EXPECT_TRUE(kota::input::command(ID_FILE_SAVE));
    EXPECT_TRUE(kota::input::command(ID_FILE_SAVE_AS));

    EXPECT_THAT(asked(), ElementsAre("view", "document", "save as \"/rivers/platte.tst\"", "view", "document",
                                     "save as \"\""));
}

TEST_F(ACommand, GoesToTheMainWindowAloneWhenNoFrameIsInFront) {
    main.MDIActivate(nullptr);

    EXPECT_TRUE(kota::input::command(MainCommand));
    EXPECT_FALSE(kota::input::command(ViewCommand));

    EXPECT_THAT(asked(), ElementsAre("main", "main"));
}

TEST_F(ACommand, ThatIsGreyedInTheMenuIsNotTaken) {
    CMenu& popup = main.GetMenu()->AppendPopup("&Edit").AppendPopup("&More");
    popup.AppendMenu(ViewCommand, "&View");
    EXPECT_TRUE(kota::input::command(ViewCommand));
    asked().clear();

    main.GetMenu()->EnableMenuItem(ViewCommand, MF_BYCOMMAND | MF_GRAYED);

    EXPECT_FALSE(kota::input::command(ViewCommand));
    EXPECT_THAT(asked(), ElementsAre());
}

TEST_F(ACommand, BehindAGreyedMenuIsNotTaken) {
    main.GetMenu()->AppendPopup("&Edit").AppendMenu(ViewCommand, "&View");
    main.GetMenu()->EnableMenuItem(0, MF_BYPOSITION | MF_GRAYED);

    EXPECT_FALSE(kota::input::command(ViewCommand));

    EXPECT_THAT(asked(), ElementsAre());
}

TEST_F(ACommand, OfNobodyIsNotTakenWithoutAMainWindow) {
    application.SetMainWnd(nullptr);

    EXPECT_FALSE(kota::input::command(MainCommand));

    EXPECT_THAT(asked(), ElementsAre());
}

} // namespace
