#include "document/records/component.h"
#include "document/records/decay.h"
#include "platform/framework/property_sheet.h"
#include "resources/ids.h"
#include "tests/hub/shown_editor.h"

#include <QDir>
#include <QHeaderView>
#include <QInputMethodEvent>

namespace {

using kota::test::ShownEditor;

class AShownPage : public ShownEditor {
protected:
    const AD_Decay& firstDecay() { return *static_cast<AD_Decay*>(document.decayList.GetHead()); }
    const AD_Component& firstComponent() { return *static_cast<AD_Component*>(document.compList.GetHead()); }
    QLineEdit& lineOf(UINT edit) { return *static_cast<QLineEdit*>(screen.widgetOf(user.control(edit))); }
    void fill(UINT edit, const char* text) {
        QTest::mouseClick(&lineOf(edit), Qt::LeftButton);
        settle();
        press(Qt::Key_A, Qt::ControlModifier);
        type(text);
    }
    void takePicture(const char* name) {
        const QDir folder(KOTA_PICTURES);
        ASSERT_TRUE(folder.mkpath("."));
        const QPixmap picture = desktop().grab();
        EXPECT_EQ(picture.size(), QSize(1280, 800));
        EXPECT_TRUE(picture.save(folder.filePath(QString(name) + ".png")));
    }
};

TEST_F(AShownPage, TakesAValueFromTheKeyboard) {
    clickTab("Decay");
    ASSERT_EQ(user.tab(), "Decay");
    clickCell(1, 2);
    type("0.344");
    ASSERT_TRUE(cellLine());
    EXPECT_EQ(cellLine()->text(), "0.344");
    press(Qt::Key_Return);

    EXPECT_FALSE(cellLine());
    EXPECT_EQ(displayed(1, 2), "0.344");
    EXPECT_EQ(user.cursor(), std::make_pair(1U, 3U));
    EXPECT_EQ(firstDecay().decayConst, 0.344);
}

TEST_F(AShownPage, TakesKeysThatCameBeforeItCouldFollow) {
    clickTab("Decay");
    clickCell(1, 2);
    QWidget* const focus = QApplication::focusWidget();
    QTest::keyClicks(focus, "0.25");
    QTest::keyClick(focus, Qt::Key_Tab);
    QTest::keyClick(focus, Qt::Key_Backtab, Qt::ShiftModifier);
    QTest::keyClicks(focus, "7");
    settle();

    ASSERT_TRUE(cellLine());
    EXPECT_EQ(cellLine()->text(), "7");
    EXPECT_EQ(user.held(1, 2), "0.25");
}

TEST_F(AShownPage, KeepsABadNumberOpenUntilItIsTakenBack) {
    clickTab("Decay");
    clickCell(1, 2);
    type("0.3x");
    const QLineEdit* const line = cellLine();
    ASSERT_TRUE(line);
    EXPECT_EQ(shownWarning(), "");
    press(Qt::Key_Tab);

    EXPECT_EQ(shownWarning(), "Double number required");
    EXPECT_EQ(cellLine(), line) << "the same editor, with the focus";
    EXPECT_EQ(line->text(), "0.3x");
    EXPECT_EQ(user.cursor(), std::make_pair(1U, 2U));

    press(Qt::Key_Backspace);
    EXPECT_EQ(shownWarning(), "") << "the edit goes on";
    press(Qt::Key_Escape);
    EXPECT_FALSE(cellLine());
    EXPECT_EQ(displayed(1, 2), "0.000");
    press(Qt::Key_Tab);
    EXPECT_EQ(user.cursor(), std::make_pair(1U, 3U));
}

TEST_F(AShownPage, OpensThePlaceOfALineByItsGlobalBox) {
    clickTab("Decay");
    ASSERT_EQ(index(1, 3).data(Qt::CheckStateRole).toInt(), Qt::Checked);
    EXPECT_FALSE(index(1, 4).flags().testFlag(Qt::ItemIsEditable));
    clickCell(1, 3);

    EXPECT_EQ(index(1, 3).data(Qt::CheckStateRole).toInt(), Qt::Unchecked);
    EXPECT_TRUE(index(1, 4).flags().testFlag(Qt::ItemIsEditable));
    press(Qt::Key_Space);
    EXPECT_EQ(index(1, 3).data(Qt::CheckStateRole).toInt(), Qt::Checked);
}

TEST_F(AShownPage, LetsTheKeyboardChoose) {
    clickCell(1, 1);
    type("nitrate");
    press(Qt::Key_Tab);
    press(Qt::Key_Tab);
    ASSERT_EQ(user.cursor(), std::make_pair(1U, 3U));
    press(Qt::Key_F2);
    press(Qt::Key_Down);
    EXPECT_EQ(displayed(1, 3), "Single Layer Cohesive");
    press(Qt::Key_Backtab, Qt::ShiftModifier);

    EXPECT_EQ(displayed(1, 3), "Single Layer Cohesive");
    clickTab("Decay");
    EXPECT_EQ(firstComponent().name, "NITRATE");
    EXPECT_EQ(firstComponent().kind, 1);
}

TEST_F(AShownPage, ChoosesByTheFirstLetter) {
    clickCell(1, 3);
    ASSERT_EQ(displayed(1, 3), "Normal");
    type("m");
    EXPECT_EQ(displayed(1, 3), "Multi Layer Cohesive");
    type("s");
    EXPECT_EQ(displayed(1, 3), "Single Layer Cohesive");
}

TEST_F(AShownPage, StaysInFrontWhenItRefusesToBeLeft) {
    clickTab("Dispersion");
    fill(ControlId::MinimumDispersion, "9");
    fill(ControlId::MaximumDispersion, "3");
    QString words;
    onNextModal([&](QWidget& modal) {
        words = static_cast<QMessageBox&>(modal).text();
        QTest::keyClick(&modal, Qt::Key_Return);
    });
    clickTab("Decay");

    EXPECT_FALSE(words.isEmpty());
    EXPECT_EQ(user.tab(), "Dispersion");
    const auto* const bar = desktop().findChild<QTabBar*>();
    EXPECT_EQ(bar->tabText(bar->currentIndex()), "Dispersion");
    EXPECT_TRUE(gridView().isVisible());
    EXPECT_FALSE(QApplication::activeModalWidget());
}

TEST_F(AShownPage, TellsTheUnitOfANumberWhenThePointerRests) {
    clickTab("Dispersion");
    EXPECT_FALSE(lineOf(ControlId::MinimumDispersion).toolTip().isEmpty());
    EXPECT_FALSE(index(1, 2).data(Qt::ToolTipRole).toString().isEmpty());
}

TEST_F(AShownPage, HasNamesForThoseWhoListen) {
    EXPECT_EQ(gridView().accessibleName().toStdString(), user.tab()) << "no group is around it";
    clickTab("Decay");
    EXPECT_EQ(gridView().accessibleName().toStdString(), "Decay constants");
    EXPECT_EQ(desktop().findChild<QTabBar*>()->accessibleName().toStdString(),
              std::string(user.sheet().GetWindowText().View()));
    EXPECT_FALSE(desktop().findChild<QTabBar*>()->accessibleName().isEmpty());
    clickCell(1, 2);
    type("1");
    ASSERT_TRUE(cellLine());
    const QString heading = gridView().model()->headerData(1, Qt::Horizontal).toString();
    EXPECT_EQ(cellLine()->accessibleName(), heading.simplified());
    EXPECT_FALSE(heading.isEmpty());
}

TEST_F(AShownPage, TakesAComposedTextAsOne) {
    clickTab("Decay");
    clickCell(1, 3);
    clickCell(1, 4);
    QInputMethodEvent composing("u", {});
    QCoreApplication::sendEvent(QApplication::focusWidget(), &composing);
    settle();
    ASSERT_TRUE(cellLine());
    EXPECT_FALSE(user.grid().IsEditPending()) << "nothing is typed while the text is being composed";

    QInputMethodEvent composed("", {});
    composed.setCommitString("ü");
    QCoreApplication::sendEvent(QApplication::focusWidget(), &composed);
    settle();
    EXPECT_EQ(user.shown(1, 4), "ü");
    press(Qt::Key_Return);
    EXPECT_EQ(displayed(1, 4), "Ü");
}

TEST_F(AShownPage, SelectsLinesByTheirHeaders) {
    clickTab("Decay");
    press(Qt::Key_Insert);
    auto* const header = gridView().verticalHeader();
    const auto at = [&](int line) {
        return QPoint(header->width() / 2,
                      header->sectionViewportPosition(line) + header->sectionSize(line) / 2);
    };
    ASSERT_EQ(header->count(), 2);
    QTest::mouseClick(header->viewport(), Qt::LeftButton, {}, at(0));
    settle();
    QTest::mouseClick(header->viewport(), Qt::LeftButton, Qt::ShiftModifier, at(1));
    settle();

    std::vector<ROWCOL> selected;
    user.grid().GetSelectedRows(selected);
    EXPECT_EQ(selected, (std::vector<ROWCOL>{1, 2}));
    press(Qt::Key_Delete);
    EXPECT_EQ(header->count(), 1);
}

TEST_F(AShownPage, AsksForALineInADialog) {
    clickTab("Decay");
    press(Qt::Key_Insert);
    clickCell(1, 2);
    QString title;
    onNextModal([&](QWidget& dialog) {
        title = dialog.windowTitle();
        type("2");
        press(Qt::Key_Return);
    });
    user.command(CommandId::GotoLine);
    settle();

    EXPECT_EQ(title, "Go to grid line");
    EXPECT_EQ(user.cursor().first, 2U);
    EXPECT_FALSE(QApplication::activeModalWidget());
    EXPECT_EQ(desktop().focusWidget(), &gridView());
}

TEST_F(AShownPage, LeavesADialogByItsCloseButton) {
    clickTab("Decay");
    bool shown = false;
    onNextModal([&](QWidget& dialog) {
        shown = true;
        dialog.close();
    });
    user.command(CommandId::Search);
    EXPECT_TRUE(shown);
    EXPECT_FALSE(QApplication::activeModalWidget());
}

TEST_F(AShownPage, ClosesWithItsFrame) {
    const QPointer<QWidget> window = &desktop();
    document.SetModifiedFlag(FALSE);
    window->close();
    settle();
    EXPECT_TRUE(window.isNull());
}

TEST_F(AShownPage, CanBeLookedAt) {
    clickCell(1, 1);
    type("nitrate");
    for (const char* tab : {"Components", "Decay", "Dispersion"}) {
        clickTab(tab);
        ASSERT_EQ(user.tab(), tab);
        takePicture(tab);
    }
    clickCell(1, 4);
    type("9x");
    press(Qt::Key_Tab);
    ASSERT_NE(shownWarning(), "");
    takePicture("Refused");
    press(Qt::Key_Escape);
}

} // namespace
