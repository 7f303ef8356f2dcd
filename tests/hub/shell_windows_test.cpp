#include "tests/hub/shown_shell.h"
#include "tests/support/hearing_view.h"

#include <QMdiArea>

namespace {

using kota::test::ShownShell;

// Two new documents in windows beside one another, the second in front.
class TwoDocuments : public ShownShell {
protected:
    TwoDocuments() {
        createDocument();
        createDocument();
        choose("Window", "Tile");
    }
    CMDIChildWnd* first() const { return frames().at(0); }
    CMDIChildWnd* second() const { return frames().at(1); }
    void clickTitle(const CMDIChildWnd* frame) {
        click(*windowOf(frame), QPoint(windowOf(frame)->width() / 2, 8));
    }
    const QMdiSubWindow* activeWindow() const {
        return shell.window->findChild<QMdiArea*>()->activeSubWindow();
    }
    void expectInFront(const CMDIChildWnd* frame) const {
        EXPECT_EQ(shell.frame.MDIGetActive(), frame);
        EXPECT_EQ(activeWindow(), windowOf(frame));
        EXPECT_TRUE(windowOf(frame)->isAncestorOf(QApplication::focusWidget()));
    }
    // Whether both lie whole inside the area for them.
    bool areAllInside() const {
        const QRect area = windowOf(first())->parentWidget()->rect();
        return area.contains(windowOf(first())->geometry()) && area.contains(windowOf(second())->geometry());
    }
    bool areAllVisible() const { return windowOf(first())->isVisible() && windowOf(second())->isVisible(); }
};

TEST_F(TwoDocuments, HearWhatAnEditorTellsTheShellAndNothingElse) {
    kota::test::HearingView hearing(*first());

    for (const WPARAM code : {503U, 42U, 62U, 82U, 523U})
        shell.frame.SendMessage(communicationMessage(), code);
    shell.frame.SendMessage(switchBoardMessage(), 523U);

    EXPECT_EQ(hearing.codes, (std::vector<WPARAM>{503, 523}));
}

TEST_F(TwoDocuments, ComeToTheFrontByAClickOnTheirTitle) {
    expectInFront(second());
    clickTitle(first());
    expectInFront(first());
    clickTitle(second());
    expectInFront(second());
}

TEST_F(TwoDocuments, ComeToTheFrontByAClickIntoThem) {
    auto* const bar = windowOf(first())->findChild<QTabBar*>();
    click(*bar, bar->tabRect(4).center());
    expectInFront(first());
    EXPECT_EQ(bar->tabText(bar->currentIndex()), "Decay");
}

TEST_F(TwoDocuments, ComeToTheFrontByAKey) {
    press(Qt::Key_Tab, Qt::ControlModifier);
    expectInFront(first());
}

TEST_F(TwoDocuments, ComeToTheFrontByTheKeyForTheNextPane) {
    press(Qt::Key_F6);
    expectInFront(first());
}

TEST_F(TwoDocuments, StayBehindACellWithABadNumber) {
    clickTab("Decay");
    clickCell(1, 2);
    type("0.3x");
    QWidget* const line = QApplication::focusWidget();
    clickTitle(first());
    expectInFront(second());
    EXPECT_EQ(QApplication::focusWidget(), line);
}

TEST_F(TwoDocuments, StayBehindACellWithABadNumberWhenAKeyChangesTheWindow) {
    clickTab("Decay");
    clickCell(1, 2);
    type("0.3x");
    press(Qt::Key_Tab, Qt::ControlModifier);
    expectInFront(second());
}

TEST_F(TwoDocuments, TakeOverATextThatIsLeftByAClickOnTheOther) {
    clickTab("Components");
    clickCell(1, 1);
    type("nitrate");
    clickTitle(first());
    expectInFront(first());
    EXPECT_TRUE(windowOf(second())->isWindowModified());
}

TEST_F(TwoDocuments, AreBothSeenWhenTheyAreTiled) {
    EXPECT_TRUE(areAllVisible());
    EXPECT_TRUE(areAllInside());
    EXPECT_FALSE(windowOf(first())->geometry().intersects(windowOf(second())->geometry()));
    expectInFront(second());
}

TEST_F(TwoDocuments, AreBothSeenWhenTheyAreCascaded) {
    choose("Window", "Cascade");
    EXPECT_TRUE(areAllVisible());
    EXPECT_FALSE(windowOf(first())->isMaximized() || windowOf(second())->isMaximized());
    EXPECT_TRUE(areAllInside());
    EXPECT_NE(windowOf(first())->pos(), windowOf(second())->pos());
    expectInFront(second());
}

TEST_F(TwoDocuments, HaveTheIconsArrangedOnlyWhenThereAreSome) {
    EXPECT_FALSE(canChoose("Window", "Arrange Icons"));
    windowOf(first())->showMinimized();
    settle();
    ASSERT_TRUE(windowOf(first())->isMinimized());
    choose("Window", "Arrange Icons");
    EXPECT_FALSE(windowOf(first())->isMinimized());
    EXPECT_TRUE(areAllVisible());
}

TEST_F(TwoDocuments, LeaveTheOtherInFrontWhenOneIsClosed) {
    CMDIChildWnd* const left = first();
    choose("File", "Close");
    ASSERT_EQ(frames().size(), 1U);
    expectInFront(left);
}

TEST_F(TwoDocuments, KeepTheFocusWhenClosingIsCancelled) {
    clickTab("Components");
    clickCell(1, 1);
    type("nitrate");
    press(Qt::Key_Return);
    answer(QMessageBox::Cancel);
    choose("File", "Close");
    expectInFront(second());
}

TEST_F(ShownShell, GreysTheArrangementsWithoutADocument) {
    for (const char* text : {"New Window", "Cascade", "Tile", "Arrange Icons"})
        EXPECT_FALSE(canChoose("Window", text)) << text;
    createDocument();
    for (const char* text : {"New Window", "Cascade", "Tile"})
        EXPECT_TRUE(canChoose("Window", text)) << text;
}

} // namespace
