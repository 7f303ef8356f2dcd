#include "platform/framework/dialog.h"
#include "platform/framework/message_box.h"
#include "platform/framework/messages.h"
#include "platform/framework/template.h"
#include "platform/framework/turn.h"
#include "resources/ids.h"
#include "tests/support/document_window.h"
#include "tests/support/temp_folder.h"

#include <gtest/gtest.h>

#include <stdexcept>

using namespace kota::test;

namespace {

using kota::headless::Received;
using kota::headless::User;

// A shell that does something to the editor from within a message.
struct CallBack {
    const char* name;
    void (*act)(User& user, kota::headless::Session& session);
};

void selectAnotherTab(User& user, const char* away) {
    user.selectTab(user.tab() == away ? "Dispersion" : away);
}

constexpr CallBack callBacks[] = {
    {"SelectsATab", [](User& user, auto&) { selectAnotherTab(user, "Decay"); }},
    {"SetsTheActivePage",
     [](User& user, auto&) { user.sheet().SetActivePage(user.sheet().GetActiveIndex() == 0 ? 4 : 0); }},
    {"InsertsALine", [](User& user, auto&) { user.command(CommandId::InsertLine); }},
    {"InsertsALineAtAnOffer",
     [](User& user, auto& session) {
         session.mainWindow().project().offers.push_back({"JAMES", 125.0, 0.0, 5});
         user.command(CommandId::InsertLine);
     }},
    {"DeletesTheSelectedLines", [](User& user, auto&) { user.command(CommandId::DeleteLine); }},
    {"DeletesAllLines",
     [](User& user, auto&) {
         user.selectLines(1, user.grid().GetRowCount());
         user.command(CommandId::DeleteLine);
     }},
    {"MovesTheCursor", [](User& user, auto&) { user.putCursor(user.grid().GetRowCount(), 2); }},
    {"Edits",
     [](User& user, auto&) {
         user.putCursor(1, 2);
         user.type("77");
         user.putCursor(1, 1);
     }},
    {"Saves", [](User& user, auto&) { user.command(ID_FILE_SAVE); }},
    {"FillsAnew",
     [](User& user, auto&) { user.view().GetDocument()->UpdateAllViews(nullptr, UpdateHint::Fill); }},
    {"OpensAWindow", [](User& user, auto&) { user.newWindow(); }},
    {"ClosesTheWindow", [](User& user, auto&) { user.closeWindow(); }},
    {"ClosesTheDocument", [](User& user, auto&) { user.command(ID_FILE_CLOSE); }},
    {"ClosesAll",
     [](User&, auto& session) {
         const kota::Turn turn;
         for (CMDIChildWnd* frame : session.mainWindow().Children())
             frame->DestroyWindow();
     }},
    {"ClosesTheMainWindow", [](User&, auto& session) { session.closeMainWindow(); }},
    {"OpensAnotherDocument", [](User&, auto& session) { session.create(); }},
};

struct Moment {
    const char* name;
    UINT (*message)();
    WPARAM code;
};

constexpr Moment moments[] = {
    {"Code24", switchBoardMessage, 24},         {"Code25", switchBoardMessage, 25},
    {"Code52", switchBoardMessage, 52},         {"Code200", switchBoardMessage, 200},
    {"Code503", communicationMessage, 503},     {"Code523", communicationMessage, 523},
    {"ShowToolbar", showToolbarMessage, 42550}, {"HideToolbar", hideToolbarMessage, 42550},
};

class AShellThatCallsBackIn : public DocumentWindow,
                              public testing::WithParamInterface<std::tuple<Moment, CallBack>> {
protected:
    AShellThatCallsBackIn() {
        openProject();
        shell().project().rivers = {"MISSOURI", "PLATTE"};
        shell().project().offers = {{"KANSAS", 5.0, 0.0, 5}};
        session.screen().onBox = [this] { session.screen().answerBox(IDNO); };
    }
    // Calls back in the first times that the message comes, never from within itself.
    void listen() {
        shell().onMessage = [this](const Received& message) {
            const auto& [moment, callBack] = GetParam();
            const bool isIt = message.message == moment.message() && message.code == moment.code;
            if (!isIt || inside || calls == 3)
                return;
            inside = true;
            ++calls;
            attempt([&] {
                User user(session);
                callBack.act(user, session);
            });
            inside = false;
        };
    }

    // Somebody's action, who gives up when there is no window any more.
    template <class Action>
    static void attempt(Action action) {
        try {
            action();
        } catch (const std::runtime_error&) {
        }
    }
    // The same with the window in front.
    template <class Action>
    void withWindow(Action action) {
        attempt([&] {
            User user(session);
            action(user);
        });
    }

    // One of everything that sends a message, each with the window that is in front by then.
    void work() {
        session.open(folder.write("river.ad31", content));
        withWindow([](User& user) { user.selectTab("Dispersion"); });
        withWindow([](User& user) {
            user.putCursor(2, 1);
            user.type("JAMES");
            user.putCursor(1, 2);
        });
        withWindow([](User& user) { user.command(CommandId::InsertLine); });
        withWindow([](User& user) { user.command(CommandId::InsertLine); });
        withWindow([](User& user) {
            user.putCursor(1, 6);
            user.type("3");
            user.selectLines(1, 1);
            user.command(CommandId::DeleteLine);
        });
        withWindow([](User& user) { user.newWindow(); });
        withWindow([](User& user) {
            user.selectTab("Dispersion");
            user.putCursor(1, 3);
            user.type("4");
            user.selectTab("Components");
        });
        withWindow([](User& user) {
            if (!user.view().GetDocument()->GetPathName().IsEmpty())
                user.command(ID_FILE_SAVE);
        });
    }

    // The document is what its windows show, on the tab in front of each.
    void expectConsistent() {
        for (CMDIChildWnd* const frame : shell().Children()) {
            auto& document = static_cast<CKota0_adDoc&>(*frame->GetActiveDocument());
            User user(*frame->GetActiveView());
            user.selectTab("Dispersion");
            viewOf(document).OnUpdate(nullptr, UpdateHint::Store, nullptr);
            document.UpdateAllViews(nullptr, UpdateHint::Fill);
            EXPECT_EQ(user.grid().GetRowCount(), static_cast<ROWCOL>(document.dispersList.GetCount()));
            ROWCOL line = 0;
            for (const std::string& river : riversOf(document))
                EXPECT_EQ(user.held(++line, 1), river);
        }
    }

    static constexpr const char* content = "target KOTA0_AD { section DispersList {\n"
                                           "DATA = \"MISSOURI\", 1000.0, 0.5, 0.0, 0.0, 100.0\n"
                                           "DATA = \"PLATTE\", 2000.0, 0.5, 0.0, 0.0, 100.0\n"
                                           "DATA = \"OSAGE\", 3000.0, 0.5, 0.0, 0.0, 100.0\n"
                                           "} }\n";
    TempFolder folder;
    bool inside = false;
    int calls = 0;
};

TEST_P(AShellThatCallsBackIn, LeavesTheEditorWhole) {
    listen();

    work();

    attempt([&] { expectConsistent(); });
    for (int window = 0; window < 4; ++window)
        withWindow([](User& user) { user.closeWindow(); });
    EXPECT_GT(calls, 0);
    session.closeMainWindow();
    for (const CDocTemplate* docTemplate : session.application().Templates())
        EXPECT_TRUE(docTemplate->Documents().empty());
}

INSTANTIATE_TEST_SUITE_P(FromAnyMessage, AShellThatCallsBackIn,
                         testing::Combine(testing::ValuesIn(moments), testing::ValuesIn(callBacks)),
                         [](const auto& given) {
                             return std::string(std::get<0>(given.param).name) +
                                    std::get<1>(given.param).name;
                         });

TEST_F(DocumentWindow, APasteGoesToNoPageThatTheShellHasPutAway) {
    openProject();
    CKota0_adDoc& document = createDispersion();
    User user(session);
    user.putCursor(1, 1);
    user.type("JAMES");
    session.screen().setClipboardText("OHIO\t1\nNILE\t2\n");
    shell().onMessage = [&](const Received& message) {
        if (message.code == 523)
            user.selectTab("Decay");
    };

    user.command(ID_EDIT_PASTE);

    EXPECT_EQ(user.tab(), "Decay");
    EXPECT_EQ(recordOf(document.dispersList, 1).riverName, "JAMES");
    EXPECT_EQ(recordOf(document.dispersList, 2).riverName, "PLATTE");
    user.selectTab("Dispersion");
    EXPECT_EQ(user.held(2, 1), "PLATTE");
}

// What a shell may do to a document whose last view is on its way out.
class TheLastMessagesOfAView : public DocumentWindow {
protected:
    TheLastMessagesOfAView() { openProject(); }

    // Closes the window, and acts when the code comes.
    template <class Act>
    void closeAndAt(WPARAM code, Act act) {
        int calls = 0;
        shell().onMessage = [&](const Received& message) {
            if (message.code == code && calls++ == 0)
                act();
        };
        EXPECT_TRUE(User(session).closeWindow());
        shell().onMessage = nullptr;
        EXPECT_GT(calls, 0);
    }
    TempFolder folder;
};

TEST_F(TheLastMessagesOfAView, LeaveTheDocumentWholeForASave) {
    for (const WPARAM code : {24U, 503U, 523U}) {
        CKota0_adDoc& document = createDispersion();
        const std::string name = "code" + std::to_string(code);

        closeAndAt(code, [&] { EXPECT_TRUE(session.saveAs(document, folder.file(name + ".ad31"))); });

        const std::string text = folder.read(name + ".AD31");
        EXPECT_NE(text.find("MISSOURI"), std::string::npos) << code;
        EXPECT_NE(text.find("PLATTE"), std::string::npos) << code;
    }
}

TEST_F(TheLastMessagesOfAView, MayBringTheDocumentAnotherOne) {
    for (const WPARAM code : {24U, 503U, 523U}) {
        CKota0_adDoc& document = createDispersion();
        closeAndAt(code, [&] {
            CDocTemplate* const docTemplate = document.GetDocTemplate();
            docTemplate->InitialUpdateFrame(docTemplate->CreateNewFrame(&document, nullptr), &document, TRUE);
        });

        ASSERT_EQ(document.Views().size(), 1U) << "the document goes on";
        User user(session);
        user.selectTab("Dispersion");
        EXPECT_EQ(user.held(2, 1), "PLATTE");
        user.closeWindow();
    }
    EXPECT_TRUE(session.application().Templates().front()->Documents().empty());
}

TEST_F(TheLastMessagesOfAView, FindNoPagesInFrontAnyMore) {
    createDispersion();
    for (const WPARAM code : {24U, 503U, 523U}) {
        CKota0_adDoc& document = createDispersion();
        CKota0_adView* const view = &viewOf(document);
        closeAndAt(code, [&] {
            document.UpdateAllViews(nullptr, UpdateHint::Store);
            document.UpdateAllViews(nullptr, UpdateHint::Fill);
            EXPECT_EQ(view->GetSafeHwnd(), nullptr);
            EXPECT_EQ(document.dispersList.GetCount(), 2);
        });
    }
}

class AModalQuestion : public DocumentWindow {};

TEST_F(AModalQuestion, MaySeeItsWindowClosed) {
    for (const UINT command : {CommandId::Search, CommandId::GotoLine}) {
        createDispersion();
        User user(session);
        session.screen().answerDialog([&](CDialog& dialog) {
            user.closeWindow();
            EXPECT_EQ(dialog.GetSafeHwnd(), nullptr) << "the dialog goes with the window that asked";
        });

        user.command(command);

        EXPECT_EQ(shell().MDIGetActive(), nullptr);
    }
}

TEST_F(AModalQuestion, OfARefusedTabMaySeeItsWindowClosed) {
    CKota0_adDoc& document = createDispersion();
    User user(session);
    document.globalVar.G_min_disp_coef = 200.0;
    session.screen().onBox = [&] { user.closeWindow(); };
    session.screen().answerBox(IDOK);

    EXPECT_FALSE(user.selectTab("Decay"));

    EXPECT_EQ(shell().MDIGetActive(), nullptr);
}

} // namespace
