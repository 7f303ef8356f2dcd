#pragma once

#include "hub/screen/grid_view.h"
#include "hub/screen/qt_screen.h"
#include "tests/support/editor.h"

#include <QApplication>
#include <QLabel>
#include <QLineEdit>
#include <QMessageBox>
#include <QTabBar>
#include <QTest>
#include <QTimer>

#include <functional>
#include <string>
#include <utility>
#include <vector>

namespace kota::test {

// A new document whose window is on the screen, with a user at mouse and keyboard.
class ShownEditor : public Editor {
protected:
    // With rivers: in a project that has them.
    explicit ShownEditor(const std::vector<std::string>& rivers = {})
        : document(createAmong(rivers)), user(session), screenBefore_(attachScreen(&screen)) {
        desktop_ = screen.makeWindow(*user.view().GetParentFrame());
        desktop_->resize(1280, 800);
        desktop_->show();
        desktop_->activateWindow();
        EXPECT_TRUE(QTest::qWaitForWindowActive(desktop_));
        settle();
    }
    ~ShownEditor() override { attachScreen(screenBefore_); }

    // Lets everything happen that the user's doings have set going.
    static void settle() {
        for (int round = 0; round < 5; ++round)
            QCoreApplication::processEvents();
    }
    // To the widget with the focus.
    static void press(Qt::Key key, Qt::KeyboardModifiers held = Qt::NoModifier) {
        QTest::keyClick(QApplication::focusWidget(), key, held);
        settle();
    }
    // All at once, as by fast fingers: no event is handled between two keys.
    static void type(const char* text) {
        QTest::keyClicks(QApplication::focusWidget(), text);
        settle();
    }
    void clickTab(const char* caption) {
        const auto* const bar = desktop_->findChild<QTabBar*>();
        for (int i = 0; i < bar->count(); ++i)
            if (bar->tabText(i) == caption)
                QTest::mouseClick(desktop_->findChild<QTabBar*>(), Qt::LeftButton, {},
                                  bar->tabRect(i).center());
        settle();
    }
    // Plays the user of the next box or dialog, once it is open.
    void onNextModal(std::function<void(QWidget&)> answer) {
        auto* const timer = new QTimer(desktop_);
        QObject::connect(timer, &QTimer::timeout, timer, [timer, act = std::move(answer)] {
            QWidget* const modal = QApplication::activeModalWidget();
            if (!modal || !modal->isVisible())
                return;
            timer->deleteLater();
            timer->stop();
            act(*modal);
        });
        timer->start();
    }
    hub::GridView& gridView() { return *static_cast<hub::GridView*>(screen.widgetOf(user.grid())); }
    QModelIndex index(ROWCOL row, ROWCOL col) {
        return gridView().model()->index(static_cast<int>(row) - 1, static_cast<int>(col) - 1);
    }
    void clickCell(ROWCOL row, ROWCOL col) {
        QTest::mouseClick(gridView().viewport(), Qt::LeftButton, {},
                          gridView().visualRect(index(row, col)).center());
        settle();
    }
    std::string displayed(ROWCOL row, ROWCOL col) {
        return index(row, col).data(Qt::DisplayRole).toString().toStdString();
    }
    // The cell editor that has the focus; null when none has.
    QLineEdit* cellLine() {
        auto* const line = qobject_cast<QLineEdit*>(QApplication::focusWidget());
        return line && gridView().isAncestorOf(line) ? line : nullptr;
    }
    // The text of the warning that is to be seen in the grid; empty when there is none.
    std::string shownWarning() {
        for (const QLabel* label : gridView().findChildren<QLabel*>())
            if (label->isVisible())
                return label->text().toStdString();
        return {};
    }
    QWidget& desktop() { return *desktop_; }

    CKota0_adDoc& document;
    headless::User user;
    hub::QtScreen screen;

private:
    CKota0_adDoc& createAmong(const std::vector<std::string>& rivers) {
        if (!rivers.empty())
            openProject();
        shell().project().rivers = rivers;
        return create();
    }

    QWidget* desktop_ = nullptr;
    Screen* screenBefore_;
};

} // namespace kota::test
