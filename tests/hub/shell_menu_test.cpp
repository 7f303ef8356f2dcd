#include "tests/hub/shown_shell.h"

namespace {

using kota::test::ShownShell;

class AShellsMenu : public ShownShell {
protected:
    // What the status bar says while an entry is chosen in an open menu.
    QString prompt(const char* menuName, const char* text) {
        QMenu& opened = menu(menuName);
        shell.window->menuBar()->setActiveAction(opened.menuAction());
        settle();
        QAction& action = entry(menuName, text);
        opened.setActiveAction(&action);
        settle();
        const QString shown = shell.window->statusBar()->currentMessage();
        opened.hide();
        settle();
        return shown;
    }
    QToolBar& toolBar() const { return *shell.window->findChild<QToolBar*>(); }
};

TEST_F(AShellsMenu, HasTheGridOnlyWithADocumentInFront) {
    const QStringList without = {"File", "Edit", "View", "Window", "Help"};
    const QStringList with = {"File", "Edit", "Grid", "View", "Window", "Help"};
    EXPECT_EQ(menus(), without);
    createDocument();
    EXPECT_EQ(menus(), with);
    choose("File", "Close");
    EXPECT_EQ(menus(), without);
}

TEST_F(AShellsMenu, GreysTheGridOnATabThatHasNone) {
    createDocument();
    clickTab("Additional output");
    EXPECT_FALSE(menu("Grid").menuAction()->isEnabled());
    EXPECT_TRUE(menu("View").menuAction()->isEnabled());
    clickTab("Decay");
    EXPECT_TRUE(menu("Grid").menuAction()->isEnabled());
}

TEST_F(AShellsMenu, KeepsTheGridAsEachDocumentHasIt) {
    createDocument();
    clickTab("Additional output");
    createDocument();
    EXPECT_TRUE(menu("Grid").menuAction()->isEnabled());
    choose("File", "Close");
    EXPECT_FALSE(menu("Grid").menuAction()->isEnabled());
}

TEST_F(AShellsMenu, GreysWhatNobodyCanDo) {
    EXPECT_FALSE(canChoose("File", "Data Utility..."));
    for (const char* text : {"Close", "Save", "Save As..."})
        EXPECT_FALSE(canChoose("File", text)) << text;
    for (const char* text : {"New", "Open...", "Exit"})
        EXPECT_TRUE(canChoose("File", text)) << text;

    createDocument();
    EXPECT_FALSE(canChoose("File", "Data Utility..."));
    for (const char* text : {"Close", "Save", "Save As..."})
        EXPECT_TRUE(canChoose("File", text)) << text;
}

TEST_F(AShellsMenu, OpensByItsLetter) {
    createDocument();
    QTest::keyClick(QApplication::focusWidget(), Qt::Key_G, Qt::AltModifier);
    settle();
    QWidget* const opened = QApplication::activePopupWidget();
    EXPECT_EQ(opened, &menu("Grid"));
    if (opened)
        opened->hide();
}

TEST_F(AShellsMenu, TellsInTheStatusBarWhatAnEntryDoes) {
    createDocument();
    EXPECT_EQ(prompt("File", "New"), "Create a new document.");
    EXPECT_EQ(prompt("Grid", "Search"), "Search for river name/topo ID.");
    EXPECT_EQ(prompt("View", "Status Bar"), "Show or hide the status bar.");
    EXPECT_EQ(shell.window->statusBar()->currentMessage(), "") << "once the menu is closed";
}

TEST_F(AShellsMenu, HidesTheStatusBarAndShowsItAgain) {
    ASSERT_TRUE(shell.window->statusBar()->isVisible());
    EXPECT_TRUE(entry("View", "Status Bar").isChecked());
    choose("View", "Status Bar");
    EXPECT_FALSE(shell.window->statusBar()->isVisible());
    EXPECT_FALSE(entry("View", "Status Bar").isChecked());
    choose("View", "Status Bar");
    EXPECT_TRUE(shell.window->statusBar()->isVisible());
}

TEST_F(AShellsMenu, HidesTheToolBarAndShowsItAgain) {
    createDocument();
    ASSERT_TRUE(toolBar().isVisible());
    choose("View", "Toolbar");
    EXPECT_FALSE(toolBar().isVisible());
    EXPECT_FALSE(entry("View", "Toolbar").isChecked());
    createDocument();
    EXPECT_FALSE(toolBar().isVisible()) << "until the user wants it";
    choose("View", "Toolbar");
    EXPECT_TRUE(toolBar().isVisible());
    EXPECT_TRUE(entry("View", "Toolbar").isChecked());
}

TEST_F(AShellsMenu, HasATwoButtonToolBarWhileADocumentIsInFront) {
    EXPECT_FALSE(toolBar().isVisible());
    createDocument();
    EXPECT_TRUE(toolBar().isVisible());
    int buttons = 0;
    for (const QAction* const action : toolBar().actions())
        if (!action->isSeparator()) {
            ++buttons;
            EXPECT_FALSE(action->icon().isNull()) << action->text().toStdString();
        }
    EXPECT_EQ(buttons, 2);
    choose("File", "Close");
    EXPECT_FALSE(toolBar().isVisible());
}

TEST_F(AShellsMenu, KeepsTheToolBarWhileAnotherDocumentIsThere) {
    createDocument();
    createDocument();
    choose("File", "Close");
    EXPECT_TRUE(toolBar().isVisible());
}

TEST_F(AShellsMenu, SearchesByTheButtonsOfTheToolBar) {
    createDocument();
    clickTab("Decay");
    const auto press = [this](const char* name) {
        for (QAction* const action : toolBar().actions())
            if (action->text() == name && action->isEnabled()) {
                QWidget* const button = toolBar().widgetForAction(action);
                click(*button, button->rect().center());
                return;
            }
        throw std::runtime_error(std::string("no button ") + name);
    };
    onBox([](QWidget& dialog) { QTest::keyClick(&dialog, Qt::Key_Escape); });
    press("Search");
    ASSERT_EQ(boxes().size(), 1U);
    EXPECT_EQ(boxes().front(), "Search");
    onBox([](QWidget& box) { QTest::keyClick(&box, Qt::Key_Escape); });
    press("Find Next");
    EXPECT_EQ(boxes().size(), 2U);
}

TEST_F(AShellsMenu, GreysTheButtonsWithTheGrid) {
    createDocument();
    clickTab("Additional output");
    for (const QAction* const action : toolBar().actions())
        EXPECT_TRUE(action->isSeparator() || !action->isEnabled()) << action->text().toStdString();
    clickTab("Decay");
    for (const QAction* const action : toolBar().actions())
        EXPECT_TRUE(action->isEnabled()) << action->text().toStdString();
}

TEST_F(AShellsMenu, TellsAboutTheProgramAndItsEditors) {
    answer(QMessageBox::Ok);
    choose("Help", "About KOTAHub...");
    ASSERT_EQ(boxes().size(), 1U);
    EXPECT_THAT(boxes().front(), testing::HasSubstr("AD Parameters"));
}

} // namespace
