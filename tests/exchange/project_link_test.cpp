#include "exchange/packages/packages.h"
#include "platform/headless/session.h"
#include "tests/support/owned.h"
#include "tests/support/recording_view.h"

#include <gtest/gtest.h>

using namespace kota::test;
using kota::headless::Received;

namespace {

// Needs all the bits of a pointer.
constexpr auto project = static_cast<std::intptr_t>(0x7654321089ABCDEF);

class ProjectLink : public testing::Test {
protected:
    std::vector<Received> received() { return session.mainWindow().received(); }

    kota::headless::Session session{[](const std::string& text) { ADD_FAILURE() << text; }};
    OwnedDocument document;
    RecordingView view{document};
};

TEST_F(ProjectLink, AsksTheShellForTheProject) {
    session.mainWindow().openProject(project);

    EXPECT_EQ(document.GetProjectInfo(&view, "river.ad31"), 1);

    EXPECT_EQ(document.projectHandle, project);
    ASSERT_EQ(received().size(), 1U);
    const Received request = received()[0];
    EXPECT_EQ(request.message, RegisterWindowMessage("KOTAHubSwitchBoardSevice"));
    EXPECT_EQ(request.code, 25U);
    ASSERT_TRUE(request.hasPackage);
    EXPECT_EQ(request.sender, &view);
    EXPECT_EQ(request.documentName, "river.ad31");
    EXPECT_EQ(request.packageKind, 5);
    EXPECT_EQ(request.items, nullptr);
}

TEST_F(ProjectLink, IsNoneWhereTheShellHasNoProject) {
    EXPECT_EQ(document.GetProjectInfo(&view, "river.ad31"), 0);

    EXPECT_EQ(document.projectHandle, 0);
    EXPECT_EQ(received().size(), 1U);
}

TEST_F(ProjectLink, TakesTheLastAnswer) {
    session.mainWindow().openProject(project);
    document.GetProjectInfo(&view, "river.ad31");
    session.mainWindow().openProject(0);

    EXPECT_EQ(document.GetProjectInfo(&view, "river.ad31"), 0);

    EXPECT_EQ(document.projectHandle, 0);
}

TEST_F(ProjectLink, TellsTheShellThatTheViewLeaves) {
    document.projectHandle = project;

    document.LeaveProject(&view, "river.ad31");

    ASSERT_EQ(received().size(), 1U);
    const Received message = received()[0];
    EXPECT_EQ(message.message, RegisterWindowMessage("KOTAHubSwitchBoardSevice"));
    EXPECT_EQ(message.code, 24U);
    ASSERT_TRUE(message.hasPackage);
    EXPECT_EQ(message.sender, &view);
    EXPECT_EQ(message.documentName, "river.ad31");
    EXPECT_EQ(message.packageKind, 5);
    EXPECT_EQ(message.project, project);
    EXPECT_EQ(message.items, nullptr);
}

TEST_F(ProjectLink, KeepsTheHandleAfterTheViewLeft) {
    document.projectHandle = project;

    document.LeaveProject(&view, "river.ad31");
    document.DataChange("river.ad31");

    EXPECT_EQ(document.projectHandle, project);
    EXPECT_EQ(received().size(), 2U);
}

TEST_F(ProjectLink, TellsTheShellThatTheDataChanged) {
    document.projectHandle = project;

    document.DataChange("river.ad31");

    ASSERT_EQ(received().size(), 1U);
    const Received message = received()[0];
    EXPECT_EQ(message.message, RegisterWindowMessage("KOTAHubCommunicationBetweenEditors"));
    EXPECT_EQ(message.code, 523U);
    ASSERT_TRUE(message.hasPackage);
    EXPECT_EQ(message.sender, nullptr);
    EXPECT_EQ(message.documentName, "river.ad31");
    EXPECT_EQ(message.packageKind, 5);
    EXPECT_EQ(message.project, project);
    EXPECT_EQ(message.items, nullptr);
}

TEST_F(ProjectLink, SendsNothingOutsideAProject) {
    document.LeaveProject(&view, "river.ad31");
    document.DataChange("river.ad31");

    EXPECT_EQ(received().size(), 0U);
    EXPECT_EQ(document.projectHandle, 0);
}

TEST_F(ProjectLink, SendsNothingAfterTheShellSaidThatThereIsNoProject) {
    document.GetProjectInfo(&view, "river.ad31");

    document.LeaveProject(&view, "river.ad31");
    document.DataChange("river.ad31");

    EXPECT_EQ(received().size(), 1U);
}

TEST_F(ProjectLink, IsNoneWithoutAMainWindow) {
    session.closeMainWindow();
    document.projectHandle = project;

    EXPECT_EQ(document.GetProjectInfo(&view, "river.ad31"), 0);

    EXPECT_EQ(document.projectHandle, 0);
}

TEST_F(ProjectLink, SendsToNobodyWithoutAMainWindow) {
    document.projectHandle = project;
    session.closeMainWindow();

    document.LeaveProject(&view, "river.ad31");
    document.DataChange("river.ad31");

    EXPECT_EQ(received().size(), 0U);
    EXPECT_EQ(document.projectHandle, project);
}

TEST_F(ProjectLink, WaitsForTheShellWhichMayCallBackIn) {
    session.mainWindow().openProject(project);
    int answered = -1;
    session.mainWindow().onMessage = [&](const Received& message) {
        if (message.code == 25)
            answered = document.GetCompNum("SILT");
    };
    addComponent(document.compList, 4, "SILT", 1);

    document.GetProjectInfo(&view, "river.ad31");

    EXPECT_EQ(answered, 4);
}

TEST(ProjectLinkWithoutAnApplication, IsNone) {
    OwnedDocument document;

    EXPECT_EQ(document.GetProjectInfo(nullptr, "river.ad31"), 0);
    document.projectHandle = project;
    document.LeaveProject(nullptr, "river.ad31");
    document.DataChange("river.ad31");

    EXPECT_EQ(document.projectHandle, project);
}

} // namespace
