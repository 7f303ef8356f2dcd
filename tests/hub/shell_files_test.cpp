#include "tests/hub/shown_shell.h"

#include <filesystem>

namespace {

using kota::test::AnEmptyShell;
using kota::test::ShownShell;
using testing::ElementsAre;
using testing::HasSubstr;
using testing::IsEmpty;

// What the File menu lists of the files used last.
class RecentlyUsedFiles : public ShownShell {
protected:
    std::vector<std::string> listed() const {
        std::vector<std::string> names;
        for (const QAction* const action : menu("File").actions())
            if (const QString text = textOf(*action); text.contains(" - "))
                names.push_back(text.section(" - ", 0, 0).section(' ', 1).toStdString());
        return names;
    }
    void chooseListed(int place) {
        for (QAction* const action : menu("File").actions())
            if (textOf(*action).startsWith(QString("%1 ").arg(place)) && action->isEnabled()) {
                action->trigger();
                settle();
                return;
            }
        throw std::runtime_error("no such file in the menu");
    }
    void openAndClose(const std::string& name) {
        open(copyExample(name));
        choose("File", "Close");
    }
};

TEST_F(RecentlyUsedFiles, AreListedTheLatestFirst) {
    EXPECT_THAT(listed(), IsEmpty());
    openAndClose("a.AD31");
    openAndClose("b.AD31");
    EXPECT_THAT(listed(), ElementsAre("b.AD31", "a.AD31"));
    openAndClose("a.AD31");
    EXPECT_THAT(listed(), ElementsAre("a.AD31", "b.AD31"));
}

TEST_F(RecentlyUsedFiles, AreListedWithADocumentInFrontToo) {
    openAndClose("a.AD31");
    createDocument();
    EXPECT_THAT(listed(), ElementsAre("a.AD31"));
}

TEST_F(RecentlyUsedFiles, AreListedWithoutTheMiddleOfALongPath) {
    const std::string deep = std::string(40, 'a') + "/" + std::string(40, 'b') + "/" + std::string(40, 'c');
    std::filesystem::create_directories(folder.path() / deep);
    open(copyExample(deep + "/river.AD31"));
    QString text;
    for (const QAction* const action : menu("File").actions())
        if (textOf(*action).startsWith("1 "))
            text = textOf(*action);

    EXPECT_TRUE(text.startsWith("1 river.AD31 - " + QString::fromStdString(folder.path().string()).left(5)));
    EXPECT_TRUE(text.contains("..."));
    EXPECT_TRUE(text.endsWith("ccc"));
    EXPECT_LT(text.size(), 90);
}

TEST_F(RecentlyUsedFiles, OpenByTheirEntries) {
    openAndClose("a.AD31");
    openAndClose("b.AD31");
    chooseListed(2);
    EXPECT_EQ(frontTitle(), "a.AD31");
    EXPECT_THAT(listed(), ElementsAre("a.AD31", "b.AD31"));
}

TEST_F(RecentlyUsedFiles, LeaveTheListWhenTheyAreGone) {
    openAndClose("a.AD31");
    openAndClose("b.AD31");
    std::filesystem::remove(folder.file("a.AD31"));
    answer(QMessageBox::Ok);
    chooseListed(2);
    ASSERT_EQ(boxes().size(), 1U);
    EXPECT_THAT(boxes().front(), HasSubstr("a.AD31"));
    EXPECT_THAT(listed(), ElementsAre("b.AD31"));
}

TEST_F(RecentlyUsedFiles, LeaveTheListEmptyWhenTheLastOneIsGone) {
    openAndClose("a.AD31");
    std::filesystem::remove(folder.file("a.AD31"));
    answer(QMessageBox::Ok);
    chooseListed(1);
    EXPECT_THAT(listed(), IsEmpty());
}

TEST_F(RecentlyUsedFiles, AreEightAtMost) {
    for (char name = 'a'; name <= 'i'; ++name)
        openAndClose(std::string(1, name) + ".AD31");
    EXPECT_THAT(listed(),
                ElementsAre("i.AD31", "h.AD31", "g.AD31", "f.AD31", "e.AD31", "d.AD31", "c.AD31", "b.AD31"));
}

TEST_F(RecentlyUsedFiles, AreThoseThatWereSavedToo) {
    createDocument();
    nameComponent("nitrate");
    answerName(folder.file("saved.AD31"));
    choose("File", "Save");
    choose("File", "Close");
    EXPECT_THAT(listed(), ElementsAre("saved.AD31"));
}

TEST_F(RecentlyUsedFiles, KeepAnAmpersandInTheirName) {
    openAndClose("a&b.AD31");
    bool found = false;
    for (const QAction* const action : menu("File").actions())
        found = found || action->text().contains("a&&b.AD31");
    EXPECT_TRUE(found);
}

TEST(AShellThatIsStarted, ListsTheFilesOfTheSessionBefore) {
    const kota::test::OwnSettings settings;
    QSettings().setValue("recentFiles", QStringList("/rivers/missouri.AD31"));
    const kota::test::RunningShell shell;
    kota::test::ShellUser user;
    user.use(*shell.window);
    EXPECT_TRUE(user.canChoose("File", "1 missouri.AD31 - /rivers"));
}

// Files that cannot be opened: the user is told, and the shell goes on.
class AFileThatCannotBeOpened : public ShownShell {
protected:
    void expectToldOf(const std::string& path, const char* name) {
        answer(QMessageBox::Ok);
        open(path);
        ASSERT_EQ(boxes().size(), 1U);
        EXPECT_THAT(boxes().front(), HasSubstr(name));
        createDocument();
        EXPECT_TRUE(front().isVisible());
    }
};

TEST_F(AFileThatCannotBeOpened, IsNamedWhenItIsBroken) {
    expectToldOf(folder.write("broken.AD31", "target KOTA0_AD { section"), "broken.AD31");
}
TEST_F(AFileThatCannotBeOpened, IsNamedWhenItIsMissing) {
    expectToldOf(folder.file("missing.AD31"), "missing.AD31");
    EXPECT_EQ(frames().size(), 1U);
}
TEST_F(AFileThatCannotBeOpened, IsNamedWhenItIsAFolder) {
    std::filesystem::create_directory(folder.file("folder.AD31"));
    expectToldOf(folder.file("folder.AD31"), "folder.AD31");
    EXPECT_EQ(frames().size(), 1U);
}
TEST_F(AFileThatCannotBeOpened, IsNamedWhenItIsOfAnotherKind) {
    expectToldOf(folder.write("picture.png", "no document"), "picture.png");
    EXPECT_EQ(frames().size(), 1U);
}
TEST_F(AFileThatCannotBeOpened, IsNamedWhenItIsBinaryAndOthersStillOpen) {
    const QString bad = QString::fromStdString(folder.write("bad.AD31", std::string(1000, '\x01')));
    answer(QMessageBox::Ok);
    open(QStringList{bad, QString::fromStdString(copyExample())});
    ASSERT_EQ(boxes().size(), 1U);
    EXPECT_THAT(boxes().front(), HasSubstr("bad.AD31"));
    EXPECT_EQ(frontTitle(), "river.AD31");
}

TEST_F(AnEmptyShell, NamesALibraryThatIsNone) {
    folder.write("libwrong.so", "no library");
    answer(QMessageBox::Ok);
    loadPlugIns(QString::fromStdString(folder.path().string()));
    ASSERT_EQ(boxes().size(), 1U);
    EXPECT_THAT(boxes().front(), HasSubstr("libwrong.so"));
    EXPECT_TRUE(shell.window->isVisible());
}

TEST_F(AnEmptyShell, LoadsAnEditorBesideALibraryThatIsNone) {
    folder.write("libAwrong.so", "no library");
    std::filesystem::create_symlink(KOTA_PLUG_IN, folder.file("libKota0_ad.so"));
    answer(QMessageBox::Ok);
    loadPlugIns(QString::fromStdString(folder.path().string()));
    choose("File", "New");
    EXPECT_EQ(shell.frame.Children().size(), 1U);
}

TEST_F(AnEmptyShell, NamesAFolderWithoutAnEditor) {
    const std::string empty = folder.file("empty");
    std::filesystem::create_directory(empty);
    answer(QMessageBox::Ok);
    loadPlugIns(QString::fromStdString(empty));
    ASSERT_EQ(boxes().size(), 1U);
    EXPECT_THAT(boxes().front(), HasSubstr(empty));
}

} // namespace
