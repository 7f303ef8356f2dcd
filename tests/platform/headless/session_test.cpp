#include "platform/headless/session.h"

#include "platform/framework/message_box.h"
#include "platform/framework/view.h"

#include <gmock/gmock.h>

namespace {

using kota::headless::Session;
using testing::ElementsAre;
using testing::HasSubstr;

class ScriptedSession : public testing::Test {
protected:
    std::vector<std::string> failures;
    std::unique_ptr<Session> session =
        std::make_unique<Session>([this](const std::string& text) { failures.push_back(text); });

    LRESULT send(UINT message, WPARAM code, CKHComm_Package* package) {
        return session->mainWindow().SendMessage(message, code, reinterpret_cast<LPARAM>(package));
    }
};

TEST_F(ScriptedSession, AnswersABoxFromItsScriptAndRecordsIt) {
    session->screen().answerBox(IDNO);

    EXPECT_EQ(MessageBox(nullptr, "Really?", "Caption", MB_YESNOCANCEL), IDNO);

    const auto& box = session->screen().boxes().at(0);
    EXPECT_EQ(box.text, "Really?");
    EXPECT_EQ(box.caption.value(), "Caption");
    EXPECT_EQ(box.type, MB_YESNOCANCEL);
    EXPECT_EQ(box.owner, nullptr);
    EXPECT_THAT(failures, ElementsAre());
}

TEST_F(ScriptedSession, GivesAFrameworkBoxTheMainWindowAndNoCaption) {
    session->screen().answerBox(IDOK);

    EXPECT_EQ(AfxMessageBox("Told"), IDOK);

    const auto& box = session->screen().boxes().at(0);
    EXPECT_EQ(box.owner, session->mainWindow().GetSafeHwnd());
    EXPECT_FALSE(box.caption.has_value());
}

TEST_F(ScriptedSession, FailsOnABoxWithoutAnAnswer) {
    EXPECT_EQ(AfxMessageBox("Unexpected words"), IDCANCEL);

    EXPECT_THAT(failures, ElementsAre(HasSubstr("Unexpected words")));
}

TEST_F(ScriptedSession, FailsOnAnAnswerThatNothingAskedFor) {
    session->screen().answerBox(IDOK);

    session.reset();

    EXPECT_EQ(failures.size(), 1U);
}

TEST_F(ScriptedSession, FailsOnAQuestionForANameWithoutAnAnswer) {
    EXPECT_EQ(session->screen().askSaveName("proposal"), std::nullopt);

    EXPECT_THAT(failures, ElementsAre(HasSubstr("proposal")));
}

TEST_F(ScriptedSession, LeavesNoScreenBehind) {
    session.reset();

    EXPECT_EQ(MessageBox(nullptr, "to nobody", nullptr, MB_OK), 0);
    EXPECT_EQ(AfxGetApp(), nullptr);
    EXPECT_EQ(AfxGetMainWnd(), nullptr);
}

TEST_F(ScriptedSession, AnswersTheRequestForTheProject) {
    CKHComm_Package package;
    EXPECT_EQ(send(switchBoardMessage(), SwitchBoardCode::JoinProject, &package), 0);

    session->mainWindow().openProject(4711);

    EXPECT_EQ(send(switchBoardMessage(), SwitchBoardCode::JoinProject, &package), 4711);
    EXPECT_EQ(send(switchBoardMessage(), SwitchBoardCode::LeaveProject, &package), 0);
    EXPECT_EQ(send(communicationMessage(), SwitchBoardCode::JoinProject, &package), 0);
}

TEST_F(ScriptedSession, RecordsWhatAPackageHeldWhenItCame) {
    CView view;
    CKHComm_Package package;
    package.sender = &view;
    package.documentName = "missouri.AD31";
    package.project = 7;

    send(communicationMessage(), CommunicationCode::DataChanged, &package);
    package.documentName = "changed since";
    send(communicationMessage(), CommunicationCode::LocationChanged, nullptr);

    const auto changes = session->mainWindow().received(CommunicationCode::DataChanged);
    ASSERT_EQ(changes.size(), 1U);
    EXPECT_EQ(changes[0].message, communicationMessage());
    EXPECT_EQ(changes[0].sender, &view);
    EXPECT_EQ(changes[0].documentName, "missouri.AD31");
    EXPECT_EQ(changes[0].packageKind, 5);
    EXPECT_EQ(changes[0].project, 7);
    EXPECT_FALSE(session->mainWindow().received(CommunicationCode::LocationChanged).at(0).hasPackage);
}

TEST_F(ScriptedSession, MayCallBackFromAMessage) {
    CKHComm_Package package;
    int calls = 0;
    session->mainWindow().onMessage = [&](const auto&) {
        if (++calls == 1)
            send(communicationMessage(), CommunicationCode::DataChanged, &package);
    };

    send(switchBoardMessage(), SwitchBoardCode::LeaveProject, &package);

    EXPECT_EQ(calls, 2);
    EXPECT_EQ(session->mainWindow().received().size(), 2U);
}

TEST_F(ScriptedSession, GoesOnWithoutItsMainWindow) {
    session->closeMainWindow();

    EXPECT_EQ(AfxGetMainWnd(), nullptr);
    EXPECT_NE(AfxGetThread(), nullptr);
}

} // namespace
