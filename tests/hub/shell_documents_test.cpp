#include "document/records/decay.h"
#include "tests/hub/shown_shell.h"

namespace {

using kota::test::ShownShell;

class AShell : public ShownShell {};

TEST_F(AShell, MakesANewDocument) {
    createDocument();
    ASSERT_EQ(frames().size(), 1U);
    EXPECT_EQ(frontTitle(), "ADPar1");
    EXPECT_EQ(front().windowTitle(), "ADPar1[*]");
    EXPECT_TRUE(front().isVisible());
    EXPECT_FALSE(front().isWindowModified());
}

TEST_F(AShell, MakesANewDocumentByTheKeyboardAlone) {
    press(Qt::Key_N, Qt::ControlModifier);
    EXPECT_EQ(frames().size(), 1U);
    press(Qt::Key_N, Qt::ControlModifier);
    EXPECT_EQ(frames().size(), 2U);
}

TEST_F(AShell, OpensAFile) {
    open(copyExample());
    ASSERT_EQ(frames().size(), 1U);
    EXPECT_EQ(frontTitle(), "river.AD31");
    EXPECT_FALSE(front().isWindowModified());
    EXPECT_TRUE(front().isMaximized());
    EXPECT_GT(document().compList.GetCount(), 0);
}

TEST_F(AShell, AsksForTheFilesToOpen) {
    answerName(copyExample());
    choose("File", "Open...");
    EXPECT_EQ(boxes().size(), 1U);
    EXPECT_EQ(frontTitle(), "river.AD31");
}

TEST_F(AShell, OpensNothingWhenTheUserAskedForNames) {
    onBox([](QWidget& dialog) { QTest::keyClick(&dialog, Qt::Key_Escape); });
    choose("File", "Open...");
    EXPECT_EQ(boxes().size(), 1U);
    EXPECT_TRUE(frames().empty());
}

TEST_F(AShell, BringsAFileThatIsOpenToTheFront) {
    const std::string path = copyExample();
    open(path);
    createDocument();
    ASSERT_EQ(frontTitle(), "ADPar1");
    open(path);
    EXPECT_EQ(frames().size(), 2U);
    EXPECT_EQ(frontTitle(), "river.AD31");
    EXPECT_TRUE(front().isAncestorOf(QApplication::focusWidget()));
}

TEST_F(AShell, MarksADocumentThatIsChanged) {
    open(copyExample());
    changeDecay("0.25");
    EXPECT_TRUE(front().isWindowModified());
    EXPECT_TRUE(shell.window->isWindowModified()) << "it names the document that fills it";
}

TEST_F(AShell, SavesAChangeUnderItsName) {
    const std::string path = copyExample();
    open(path);
    const double before = storedDecay();
    changeDecay("0.25");
    press(Qt::Key_S, Qt::ControlModifier);
    EXPECT_NE(decayIn(path), before);
    EXPECT_EQ(decayIn(path), storedDecay());
    EXPECT_FALSE(front().isWindowModified());
    EXPECT_TRUE(boxes().empty());
}

TEST_F(AShell, SavesATextThatIsStillBeingTyped) {
    const std::string path = copyExample();
    open(path);
    const double before = decayIn(path);
    clickTab("Decay");
    clickCell(1, 2);
    type("0.125");
    press(Qt::Key_S, Qt::ControlModifier);
    EXPECT_NE(decayIn(path), before);
    EXPECT_EQ(decayIn(path), storedDecay());
}

TEST_F(AShell, AsksForTheNameOfADocumentThatHasNone) {
    createDocument();
    nameComponent("nitrate");
    answerName(folder.file("first.AD31"));
    choose("File", "Save");
    EXPECT_EQ(frontTitle(), "first.AD31");
    EXPECT_EQ(componentIn(folder.file("first.AD31")), "NITRATE");
    EXPECT_FALSE(front().isWindowModified());
}

TEST_F(AShell, SavesUnderAnotherNameAndKeepsTheFileBefore) {
    const std::string path = copyExample();
    const std::string before = kota::test::readFile(path);
    open(path);
    changeDecay("0.25");
    answerName(folder.file("copy.AD31"));
    choose("File", "Save As...");
    EXPECT_EQ(frontTitle(), "copy.AD31");
    EXPECT_EQ(kota::test::readFile(path), before);
    EXPECT_EQ(decayIn(folder.file("copy.AD31")), storedDecay());
}

TEST_F(AShell, SavesNothingWhenTheUserGivesNoName) {
    createDocument();
    nameComponent("nitrate");
    onBox([](QWidget& dialog) { QTest::keyClick(&dialog, Qt::Key_Escape); });
    choose("File", "Save");
    EXPECT_EQ(boxes().size(), 1U);
    EXPECT_TRUE(front().isWindowModified());
    EXPECT_EQ(frontTitle(), "ADPar1");
}

TEST_F(AShell, ProposesNameAndEndingOfADocumentToBeSaved) {
    open(copyExample());
    QString proposed;
    onBox([&](QWidget& dialog) {
        proposed = dialog.findChild<QLineEdit*>("fileNameEdit")->text();
        QTest::keyClick(&dialog, Qt::Key_Escape);
    });
    choose("File", "Save As...");
    EXPECT_EQ(QFileInfo(proposed).fileName(), "river.AD31");
}

TEST_F(AShell, AsksBeforeItWritesOverAnotherFile) {
    const std::string other = folder.write("other.AD31", "kept");
    open(copyExample());
    onBox([&](QWidget& dialog) {
        dialog.findChild<QLineEdit*>("fileNameEdit")->setText(QString::fromStdString(other));
        answer(QMessageBox::No);
        onBox([](QWidget& again) { QTest::keyClick(&again, Qt::Key_Escape); });
        QTest::keyClick(dialog.findChild<QLineEdit*>("fileNameEdit"), Qt::Key_Return);
    });
    choose("File", "Save As...");
    EXPECT_EQ(kota::test::readFile(other), "kept");
    EXPECT_EQ(frontTitle(), "river.AD31");
}

TEST_F(AShell, ShowsADocumentInTwoWindowsWithNumbers) {
    open(copyExample());
    choose("Window", "New Window");
    ASSERT_EQ(frames().size(), 2U);
    EXPECT_EQ(windowOf(frames()[0])->windowTitle(), "river.AD31:1[*]");
    EXPECT_EQ(windowOf(frames()[1])->windowTitle(), "river.AD31:2[*]");
    EXPECT_EQ(frontTitle(), "river.AD31:2");

    changeDecay("0.25");
    EXPECT_TRUE(windowOf(frames()[0])->isWindowModified());
    EXPECT_TRUE(windowOf(frames()[1])->isWindowModified());
}

TEST_F(AShell, TakesTheNumberOffTheLastWindowOfADocument) {
    open(copyExample());
    choose("Window", "New Window");
    changeDecay("0.25");
    front().close();
    settle();
    ASSERT_EQ(frames().size(), 1U);
    EXPECT_EQ(front().windowTitle(), "river.AD31[*]");
    EXPECT_TRUE(boxes().empty()) << "another window keeps the document";
}

TEST_F(AShell, ClosesAllWindowsOfADocument) {
    open(copyExample());
    choose("Window", "New Window");
    choose("File", "Close");
    EXPECT_TRUE(frames().empty());
    EXPECT_TRUE(shell.window->findChildren<QMdiSubWindow*>().empty());
}

} // namespace
