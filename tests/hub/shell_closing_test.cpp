#include "document/records/decay.h"
#include "tests/hub/shown_shell.h"

namespace {

using kota::test::ShownShell;
using testing::ElementsAre;

// A shell with a document that has a change which is not saved.
class AShellWithChanges : public ShownShell {
protected:
    AShellWithChanges() {
        open(path);
        changeDecay("0.25");
        changed_ = storedDecay();
    }
    bool isWritten() const { return decayIn(path) == changed_; }
    bool isAsBefore() const { return kota::test::readFile(path) == before; }

    const std::string path = copyExample();
    const std::string before = kota::test::readFile(path);

private:
    double changed_ = 0;
};

TEST_F(AShellWithChanges, WritesThemWhenTheUserSaysYes) {
    answer(QMessageBox::Yes);
    choose("File", "Close");
    EXPECT_THAT(boxes(), ElementsAre("Save changes to river.AD31?"));
    EXPECT_TRUE(frames().empty());
    EXPECT_TRUE(isWritten());
}

TEST_F(AShellWithChanges, LeavesTheFileWhenTheUserSaysNo) {
    answer(QMessageBox::No);
    choose("File", "Close");
    EXPECT_TRUE(frames().empty());
    EXPECT_TRUE(isAsBefore());
}

TEST_F(AShellWithChanges, StaysOpenWhenTheUserCancels) {
    answer(QMessageBox::Cancel);
    choose("File", "Close");
    ASSERT_EQ(frames().size(), 1U);
    EXPECT_TRUE(front().isVisible());
    EXPECT_TRUE(front().isWindowModified());
    EXPECT_TRUE(isAsBefore());
}

TEST_F(AShellWithChanges, StaysOpenWhenTheQuestionIsLeftByEscape) {
    onBox([](QWidget& box) { QTest::keyClick(&box, Qt::Key_Escape); });
    choose("File", "Close");
    EXPECT_EQ(frames().size(), 1U);
    EXPECT_TRUE(isAsBefore());
}

TEST_F(AShellWithChanges, AsksWhenTheFrameIsClosed) {
    answer(QMessageBox::Yes);
    front().close();
    settle();
    EXPECT_EQ(boxes().size(), 1U);
    EXPECT_TRUE(frames().empty());
    EXPECT_TRUE(isWritten());
}

TEST_F(AShellWithChanges, AsksWhenTheProgramIsToEnd) {
    answer(QMessageBox::Cancel);
    choose("File", "Exit");
    ASSERT_TRUE(shell.window);
    EXPECT_TRUE(shell.window->isVisible());
    EXPECT_EQ(frames().size(), 1U);

    answer(QMessageBox::No);
    choose("File", "Exit");
    EXPECT_EQ(boxes().size(), 2U);
    EXPECT_FALSE(shell.window && shell.window->isVisible());
    EXPECT_TRUE(isAsBefore());
}

TEST_F(AShellWithChanges, KeepsTheDocumentWhoseQuestionWasCancelledAsTheProgramEnds) {
    createDocument();
    nameComponent("nitrate");
    answer(QMessageBox::Yes);
    answer(QMessageBox::Cancel);
    shell.window->close();
    settle();
    EXPECT_THAT(boxes(), ElementsAre("Save changes to river.AD31?", "Save changes to ADPar1?"));
    ASSERT_TRUE(shell.window);
    EXPECT_TRUE(shell.window->isVisible());
    EXPECT_TRUE(isWritten());
    ASSERT_EQ(frames().size(), 2U);
    EXPECT_EQ(frontTitle(), "ADPar1");
    EXPECT_TRUE(front().isWindowModified());
}

TEST_F(AShellWithChanges, ClosesWithoutAQuestionOnceTheyAreSaved) {
    choose("File", "Save");
    press(Qt::Key_Q, Qt::ControlModifier);
    EXPECT_TRUE(boxes().empty());
    EXPECT_FALSE(shell.window && shell.window->isVisible());
}

TEST_F(AShellWithChanges, DoesNotCloseOverABadNumber) {
    clickCell(1, 2);
    type("0.3x");
    choose("File", "Close");
    ASSERT_EQ(frames().size(), 1U);
    EXPECT_TRUE(front().isVisible());
    EXPECT_TRUE(boxes().empty());
    EXPECT_TRUE(grid().isAncestorOf(QApplication::focusWidget()));
}

TEST_F(AShellWithChanges, AsksForANameBeforeItClosesADocumentThatHasNone) {
    createDocument();
    nameComponent("nitrate");
    answer(QMessageBox::Yes);
    answerName(folder.file("second.AD31"));
    choose("File", "Close");
    EXPECT_EQ(frames().size(), 1U);
    EXPECT_EQ(componentIn(folder.file("second.AD31")), "NITRATE");
}

} // namespace
