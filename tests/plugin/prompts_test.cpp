#include "tests/support/editor.h"

#include "platform/framework/input.h"

namespace {

using kota::headless::User;

class Prompts : public kota::test::Editor {
protected:
    CString promptOf(UINT command) { return shell().GetMessageString(command); }
};

TEST_F(Prompts, AreTheDocumentsInFront) {
    create();

    EXPECT_EQ(promptOf(42550), "Search for river name/topo ID.\nSearch");
    EXPECT_EQ(promptOf(42551), "Search for next occurence of river name/ topo ID.\nFind Next");
    EXPECT_EQ(promptOf(42561), "Insert line into local variable grid.");
    EXPECT_EQ(promptOf(42562), "Delete line from grid.");
    EXPECT_EQ(promptOf(42563), "Go to line with specified number.");
}

TEST_F(Prompts, OfADocumentsCommandsAreEmptyWithoutADocument) {
    EXPECT_EQ(promptOf(42550), "");

    create();
    User(session).closeWindow();

    EXPECT_EQ(promptOf(42550), "");
}

TEST_F(Prompts, AreEmptyForACommandThatNobodyKnows) {
    create();

    EXPECT_EQ(promptOf(41999), "");
}

constexpr kota::StringResource ownPrompts[] = {{57600, "Own prompt.\nOwn tip"}, {42550, "Own search."}};

const kota::Module& ownModule() {
    static const kota::Module module("shell with prompts", {.strings = ownPrompts});
    return module;
}

// A main window with prompts of its own.
class PromptingWindow : public CKhMDIFrameWnd {
    DECLARE_DYNAMIC(PromptingWindow)
public:
    PromptingWindow() { CWnd::Create({.kind = kota::WindowKind::Frame}); }
};
IMPLEMENT_DYNAMIC(PromptingWindow, CKhMDIFrameWnd, ownModule)

class PromptsOfAShell : public kota::test::Editor {
protected:
    PromptsOfAShell() { session.application().SetMainWnd(&window); }
    ~PromptsOfAShell() override {
        kota::input::close(window);
        session.application().SetMainWnd(&session.mainWindow());
    }

    PromptingWindow window;
};

TEST_F(PromptsOfAShell, AreItsOwnWithoutADocument) {
    EXPECT_EQ(window.GetMessageString(57600), "Own prompt.\nOwn tip");
    EXPECT_EQ(window.GetMessageString(42550), "Own search.");
}

TEST_F(PromptsOfAShell, AreItsOwnForWhatTheDocumentInFrontDoesNotSay) {
    create();
    ASSERT_NE(window.MDIGetActive(), nullptr);

    EXPECT_EQ(window.GetMessageString(57600), "Own prompt.\nOwn tip");
}

TEST_F(PromptsOfAShell, GiveWayToTheDocumentInFront) {
    create();

    EXPECT_EQ(window.GetMessageString(42550), "Search for river name/topo ID.\nSearch");
}

} // namespace
