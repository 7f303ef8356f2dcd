#include "document/records/component.h"
#include "document/records/decay.h"
#include "tests/hub/shown_shell.h"

#include <QHeaderView>

namespace {

using kota::test::ShownShell;
using testing::ElementsAre;

// The example, open.
class AnOpenDocument : public ShownShell {
protected:
    AnOpenDocument() { open(path); }

    std::string shownWarning() const {
        for (const QLabel* const label : grid().findChildren<QLabel*>())
            if (label->isVisible())
                return label->text().toStdString();
        return {};
    }
    void clickLine(int line, Qt::KeyboardModifiers held = Qt::NoModifier) {
        const QHeaderView& header = *grid().verticalHeader();
        const QPoint at(header.width() / 2,
                        header.sectionViewportPosition(line - 1) + header.sectionSize(line - 1) / 2);
        QTest::mouseClick(header.viewport(), Qt::LeftButton, held, at);
        settle();
    }
    QString tabInFront() const {
        const auto* const bar = front().findChild<QTabBar*>();
        return bar->tabText(bar->currentIndex());
    }
    void fill(const QString& label, const char* text) {
        for (QLineEdit* const line : front().findChildren<QLineEdit*>())
            if (line->isVisible() && line->accessibleName() == label) {
                click(*line, line->rect().center());
                press(Qt::Key_A, Qt::ControlModifier);
                type(text);
                return;
            }
        throw std::runtime_error("no field " + label.toStdString());
    }

    const std::string path = copyExample();
};

TEST_F(AnOpenDocument, StoresAValueThatIsTypedIntoACell) {
    clickTab("Components");
    clickCell(1, 1);
    type("nitrate");
    press(Qt::Key_Return);
    EXPECT_EQ(displayed(1, 1), "NITRATE");
    clickTab("Decay");
    EXPECT_EQ(kota::test::recordOf(document().compList).name, "NITRATE");
}

TEST_F(AnOpenDocument, WarnsOfABadNumberAndKeepsItsCell) {
    clickTab("Decay");
    const double before = storedDecay();
    clickCell(1, 2);
    type("0.3x");
    QWidget* const line = QApplication::focusWidget();
    press(Qt::Key_Tab);
    EXPECT_EQ(shownWarning(), "Double number required");
    EXPECT_EQ(QApplication::focusWidget(), line);
    EXPECT_EQ(storedDecay(), before);

    press(Qt::Key_Escape);
    EXPECT_EQ(shownWarning(), "");
    EXPECT_EQ(storedDecay(), before);
}

TEST_F(AnOpenDocument, WarnsOfABadNumberThatATabIsClickedOver) {
    clickTab("Decay");
    clickCell(1, 2);
    type("0.3x");
    clickTab("Components");
    EXPECT_EQ(tabInFront(), "Decay");
    EXPECT_EQ(shownWarning(), "Double number required");
    EXPECT_TRUE(grid().isAncestorOf(QApplication::focusWidget()));
}

TEST_F(AnOpenDocument, GetsANewLineByTabInTheLastCell) {
    clickTab("Components");
    const int lines = lineCount();
    const int columns = grid().model()->columnCount();
    clickCell(lines, columns);
    press(Qt::Key_Tab);
    EXPECT_EQ(lineCount(), lines + 1);
    EXPECT_EQ(grid().currentIndex(), index(lines + 1, 1));
}

TEST_F(AnOpenDocument, GetsANewLineByInsertAndLosesItByDelete) {
    clickTab("Decay");
    const int lines = lineCount();
    clickCell(1, 2);
    press(Qt::Key_Insert);
    ASSERT_EQ(lineCount(), lines + 1);
    clickLine(lines + 1);
    press(Qt::Key_Delete);
    EXPECT_EQ(lineCount(), lines);
}

TEST_F(AnOpenDocument, LosesTheLinesSelectedByTheirHeaders) {
    clickTab("Decay");
    press(Qt::Key_Insert);
    press(Qt::Key_Insert);
    const int lines = lineCount();
    ASSERT_GE(lines, 3);
    clickLine(lines - 1);
    clickLine(lines, Qt::ShiftModifier);
    press(Qt::Key_Delete);
    EXPECT_EQ(lineCount(), lines - 2);
    EXPECT_TRUE(front().isWindowModified());
}

TEST_F(AnOpenDocument, InsertsAndDeletesLinesByTheMenu) {
    clickTab("Decay");
    const int lines = lineCount();
    choose("Grid", "Insert line");
    EXPECT_EQ(lineCount(), lines + 1);
    clickLine(lines + 1);
    choose("Grid", "Delete line");
    EXPECT_EQ(lineCount(), lines);
}

TEST_F(AnOpenDocument, StaysOnATabThatRefusesToBeLeft) {
    clickTab("Dispersion");
    fill("Minimum disp. coefficient", "99999");
    answer(QMessageBox::Ok);
    clickTab("Decay");
    EXPECT_THAT(boxes(), ElementsAre("Maximum disp. coef. must be greater than minimum disp. coef."));
    EXPECT_EQ(tabInFront(), "Dispersion");

    fill("Minimum disp. coefficient", "10");
    clickTab("Decay");
    EXPECT_EQ(tabInFront(), "Decay");
    EXPECT_EQ(boxes().size(), 1U);
}

TEST_F(AnOpenDocument, SavesWhatWasEditedAndShowsItAgain) {
    clickTab("Components");
    clickCell(1, 1);
    type("nitrate");
    press(Qt::Key_Return);
    choose("File", "Save");
    EXPECT_EQ(componentIn(path), "NITRATE");
    choose("File", "Close");
    ASSERT_TRUE(frames().empty());

    open(path);
    clickTab("Components");
    EXPECT_EQ(displayed(1, 1), "NITRATE");
}

TEST_F(AnOpenDocument, ShowsAnEditInItsOtherWindowToo) {
    choose("Window", "New Window");
    changeDecay("0.25");
    const std::string typed = displayed(1, 2);
    choose("Window", "Tile");
    CMDIChildWnd* const first = frames().front();
    click(*windowOf(first), QPoint(windowOf(first)->width() / 2, 8));
    ASSERT_EQ(shell.frame.MDIGetActive(), first);
    clickTab("Decay");
    EXPECT_EQ(displayed(1, 2), typed);
    EXPECT_NE(typed, "0.344");
}

} // namespace
