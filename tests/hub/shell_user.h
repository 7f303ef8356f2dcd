#pragma once

#include <QAbstractButton>
#include <QApplication>
#include <QFileDialog>
#include <QLabel>
#include <QLineEdit>
#include <QMainWindow>
#include <QMenu>
#include <QMenuBar>
#include <QMessageBox>
#include <QPointer>
#include <QTabBar>
#include <QTest>
#include <QTimer>

#include <gtest/gtest.h>

#include <deque>
#include <functional>
#include <stdexcept>
#include <string>
#include <utility>
#include <vector>

namespace kota::test {

// A user at mouse and keyboard of the shell's window, who answers boxes as told before. A box that nobody
// told of fails the test.
class ShellUser {
public:
    ShellUser() {
        QObject::connect(&watch_, &QTimer::timeout, &watch_, [this] { lookForModal(); });
        watch_.start();
    }
    void use(QMainWindow& window) { window_ = &window; }

    // Lets everything happen that the user's doings have set going.
    void settle() {
        for (int round = 0; round < 8; ++round) {
            QCoreApplication::processEvents();
            if (window_ && window_->isVisible() && !QApplication::activeWindow())
                window_->activateWindow(); // as a window manager does when a box was closed
        }
    }
    // To the widget with the focus.
    void press(Qt::Key key, Qt::KeyboardModifiers held = Qt::NoModifier) {
        QWidget* const focus = QApplication::focusWidget();
        QWidget* const target = focus ? focus : QApplication::activeWindow();
        if (!target)
            throw std::runtime_error("no window for a key");
        QTest::keyClick(target, key, held);
        settle();
    }
    void type(const char* text) {
        QTest::keyClicks(QApplication::focusWidget(), text);
        settle();
    }
    void click(QWidget& widget, QPoint at) {
        QTest::mouseClick(&widget, Qt::LeftButton, {}, at);
        settle();
    }
    void clickTabOf(QWidget& window, const char* caption) {
        auto* const bar = window.findChild<QTabBar*>();
        for (int i = 0; bar && i < bar->count(); ++i)
            if (bar->tabText(i) == caption) {
                click(*bar, bar->tabRect(i).center());
                return;
            }
        throw std::runtime_error(std::string("no tab ") + caption);
    }

    // What is done with the next box or dialog that is not told of yet.
    void onBox(std::function<void(QWidget&)> answer) { answers_.push_back(std::move(answer)); }
    void answer(QMessageBox::StandardButton button) {
        onBox([button](QWidget& box) {
            auto* const asked = qobject_cast<QMessageBox*>(&box);
            if (!asked || !asked->button(button))
                throw std::runtime_error("no such button to press");
            QTest::mouseClick(asked->button(button), Qt::LeftButton);
        });
    }
    // Types a name into the dialog that asks for one.
    void answerName(const std::string& path) {
        onBox([path](QWidget& dialog) {
            auto* const name = dialog.findChild<QLineEdit*>("fileNameEdit");
            if (!name)
                throw std::runtime_error("no field for a name");
            name->setText(QString::fromStdString(path));
            QTest::keyClick(name, Qt::Key_Return);
        });
    }
    // Leaves boxes to somebody else from now on.
    void leaveBoxes() { watch_.stop(); }
    // The words of the boxes shown so far, and the titles of other dialogs.
    const std::vector<std::string>& boxes() const { return boxes_; }

    // The menus of the menu bar.
    QStringList menus() const {
        QStringList names;
        for (const QAction* const action : window_->menuBar()->actions())
            if (action->isVisible())
                names.append(QString(action->text()).remove('&'));
        return names;
    }
    // A menu as the user has it open; an unknown one is an error.
    QMenu& menu(const QString& name) const {
        for (const QAction* const action : window_->menuBar()->actions())
            if (QString(action->text()).remove('&') == name) {
                emit action->menu()->aboutToShow();
                return *action->menu();
            }
        throw std::runtime_error("no menu " + name.toStdString());
    }
    static QString textOf(const QAction& entry) {
        return QString(entry.text()).remove('&').section('\t', 0, 0);
    }
    QAction& entry(const QString& menuName, const QString& text) const {
        for (QAction* const action : menu(menuName).actions())
            if (textOf(*action) == text)
                return *action;
        throw std::runtime_error("no entry " + text.toStdString());
    }
    bool canChoose(const QString& menuName, const QString& text) const {
        const QAction& action = entry(menuName, text);
        return menu(menuName).menuAction()->isEnabled() && action.isEnabled();
    }
    void choose(const QString& menuName, const QString& text) {
        if (!canChoose(menuName, text))
            throw std::runtime_error("greyed: " + text.toStdString());
        entry(menuName, text).trigger();
        settle();
    }

private:
    void lookForModal() {
        QWidget* const modal = QApplication::activeModalWidget();
        if (!modal || !modal->isVisible() || modal == seen_)
            return;
        seen_ = modal;
        const auto* const box = qobject_cast<QMessageBox*>(modal);
        boxes_.push_back((box ? box->text() : modal->windowTitle()).toStdString());
        // Not from inside the timer's own turn, for an answer may open the next box.
        QTimer::singleShot(0, modal, [this, modal] { give(*modal); });
    }
    void give(QWidget& modal) {
        try {
            if (answers_.empty())
                throw std::runtime_error("nobody expected it");
            const auto answer = std::exchange(answers_.front(), nullptr);
            answers_.pop_front();
            answer(modal);
        } catch (const std::exception& error) {
            ADD_FAILURE() << boxes_.back() << ": " << error.what();
            dynamic_cast<QDialog&>(modal).reject();
        }
    }

    QPointer<QMainWindow> window_;
    QTimer watch_;
    QPointer<QWidget> seen_; // is answered, or being so
    std::deque<std::function<void(QWidget&)>> answers_;
    std::vector<std::string> boxes_;
};

} // namespace kota::test
