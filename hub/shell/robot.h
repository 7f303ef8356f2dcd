#pragma once

#include "platform/framework/types.h"

#include <QMainWindow>
#include <QString>
#include <QTimer>

#include <functional>

namespace kota::hub {

// A user at mouse and keyboard, for the tour: it sends the toolkit's own events to the widgets that are
// there. What it does not find is an error (std::runtime_error), and so is a box that it was not told to
// expect: the robot closes it.
class Robot {
public:
    explicit Robot(QMainWindow& window);

    // Lets everything happen that was set going.
    void settle();
    // To the widget with the focus.
    void press(int key, Qt::KeyboardModifiers held = Qt::NoModifier);
    void type(const QString& text);
    // A tab by its place, from 0.
    void clickTab(int place);
    QStringList tabs() const;
    // How many lines the grid in front has.
    int lineCount() const;
    // A cell of the grid in front, lines and columns from 1.
    void clickCell(int line, int column);
    // A place of a river on the map.
    void clickMap(const QString& river, double chainage);
    // The entry of a command in the menu bar.
    void choose(UINT command);
    // Writes into a field of the page in front, counted from 1, in place of what it holds.
    void fill(int place, const QString& text);
    // What the user does with the next box or dialog, once it is open. Call it before what opens the box.
    void answerNext(std::function<void(QWidget&)> answer);
    // The window as it is to be seen, with what stands in front of it.
    QPixmap picture() const;

private:
    void click(QWidget& widget, QPoint at);
    void lookForBox();
    template <class Widget>
    Widget& visible(const char* what) const;

    QMainWindow& window_;
    QTimer watch_;
    std::function<void(QWidget&)> answer_; // to the box that is expected
    QString unexpected_;                   // what another one said
};

} // namespace kota::hub
