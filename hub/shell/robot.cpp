#include "hub/shell/robot.h"

#include "hub/project/river_map.h"

#include <QApplication>
#include <QDockWidget>
#include <QLineEdit>
#include <QMenuBar>
#include <QMessageBox>
#include <QMouseEvent>
#include <QPainter>
#include <QTabBar>
#include <QTableView>

#include <stdexcept>
#include <utility>

namespace kota::hub {

namespace {

std::runtime_error missing(const QString& what) {
    return std::runtime_error(QString("there is no %1 to be seen").arg(what).toStdString());
}

} // namespace

Robot::Robot(QMainWindow& window) : window_(window) {
    QObject::connect(&watch_, &QTimer::timeout, &watch_, [this] { lookForBox(); });
    watch_.start();
}

void Robot::settle() {
    for (int round = 0; round < 5; ++round)
        QCoreApplication::processEvents();
    if (!unexpected_.isEmpty())
        throw std::runtime_error(std::exchange(unexpected_, {}).toStdString());
}

void Robot::lookForBox() {
    auto* const box = qobject_cast<QDialog*>(QApplication::activeModalWidget());
    if (!box || !box->isVisible())
        return;
    if (answer_) {
        std::exchange(answer_, nullptr)(*box);
        return;
    }
    const auto* const message = qobject_cast<QMessageBox*>(box);
    unexpected_ = message ? message->text() : "a dialog opened: " + box->windowTitle();
    box->reject();
}

void Robot::press(int key, Qt::KeyboardModifiers held) {
    QWidget* const focus = QApplication::focusWidget();
    QWidget* const target = focus ? focus : QApplication::activeWindow();
    if (!target)
        throw missing("window for a key");
    QKeyEvent down(QEvent::KeyPress, key, held);
    QCoreApplication::sendEvent(target, &down);
    settle();
}

void Robot::type(const QString& text) {
    for (const QChar letter : text) {
        QWidget* const focus = QApplication::focusWidget();
        if (!focus)
            throw missing("widget for a text");
        QKeyEvent down(QEvent::KeyPress, letter.toUpper().unicode(), Qt::NoModifier, QString(letter));
        QCoreApplication::sendEvent(focus, &down);
        settle();
    }
}

void Robot::click(QWidget& widget, QPoint at) {
    widget.window()->activateWindow(); // as a window manager does
    settle();
    for (const QEvent::Type type : {QEvent::MouseButtonPress, QEvent::MouseButtonRelease}) {
        const Qt::MouseButtons held = type == QEvent::MouseButtonPress ? Qt::LeftButton : Qt::NoButton;
        QMouseEvent event(type, QPointF(at), QPointF(widget.mapToGlobal(at)), Qt::LeftButton, held,
                          Qt::NoModifier);
        QCoreApplication::sendEvent(&widget, &event);
    }
    settle();
}

template <class Widget>
Widget& Robot::visible(const char* what) const {
    for (Widget* const widget : window_.findChildren<Widget*>())
        if (widget->isVisible())
            return *widget;
    throw missing(what);
}

void Robot::clickTab(int place) {
    auto& bar = visible<QTabBar>("row of tabs");
    if (place >= bar.count())
        throw missing(QString("tab %1").arg(place + 1));
    click(bar, bar.tabRect(place).center());
}

QStringList Robot::tabs() const {
    const auto& bar = visible<QTabBar>("row of tabs");
    QStringList all;
    for (int place = 0; place < bar.count(); ++place)
        all.append(bar.tabText(place));
    return all;
}

int Robot::lineCount() const {
    return visible<QTableView>("grid").model()->rowCount();
}

void Robot::clickCell(int line, int column) {
    auto& grid = visible<QTableView>("grid");
    const QModelIndex cell = grid.model()->index(line - 1, column - 1);
    grid.scrollTo(cell);
    click(*grid.viewport(), grid.visualRect(cell).center());
}

void Robot::clickMap(const QString& river, double chainage) {
    auto* const panel = window_.findChild<QDockWidget*>("map");
    auto* const map = panel ? static_cast<RiverMap*>(panel->widget()) : nullptr;
    const auto place = map ? map->network().place(river, chainage) : std::nullopt;
    if (!place)
        throw missing("place on the map");
    click(*map, map->viewPort().toScreen(*place).toPoint());
}

void Robot::choose(UINT command) {
    for (const QAction* const popup : window_.menuBar()->actions())
        for (QAction* const entry : popup->menu()->actions())
            if (entry->data().toUInt() == command && popup->isEnabled() && entry->isEnabled()) {
                entry->trigger();
                settle();
                return;
            }
    throw missing(QString("entry of the command %1").arg(command));
}

void Robot::fill(int place, const QString& text) {
    for (QLineEdit* const line : window_.findChildren<QLineEdit*>()) {
        if (!line->isVisible() || --place > 0)
            continue;
        click(*line, line->rect().center());
        press(Qt::Key_A, Qt::ControlModifier);
        type(text);
        return;
    }
    throw missing("further field");
}

void Robot::answerNext(std::function<void(QWidget&)> answer) {
    answer_ = std::move(answer);
}

QPixmap Robot::picture() const {
    QPixmap whole = window_.grab();
    if (QWidget* const modal = QApplication::activeModalWidget()) {
        QPainter painter(&whole);
        const QPoint at = window_.mapFromGlobal(modal->mapToGlobal(QPoint(0, 0)));
        const QRect room(at, modal->size());
        painter.drawPixmap(at, modal->grab());
        painter.setPen(modal->palette().color(QPalette::Shadow));
        painter.drawRect(room.adjusted(-1, -1, 0, 0));
    }
    return whole;
}

} // namespace kota::hub
