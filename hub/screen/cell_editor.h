#pragma once

#include "hub/screen/controls.h"
#include "platform/grid/control.h"

#include <QLineEdit>
#include <QPointer>

#include <functional>

namespace kota::hub {

// The widgets that edit a cell: a line of text, a list of entries, or both. They hold the text of the
// platform's control and are made anew for each edit.
class CellEditor {
public:
    // The widget that lies over the cell, inside `parent`.
    QWidget* open(CellKind kind, Qt::Alignment alignment, QWidget* parent);
    // The widget is the view's to delete. Nothing is heard of it any more.
    void close();
    bool isOpen() const { return widget_ != nullptr; }

    QWidget* widget() const { return widget_; }
    // Null where no text can be typed.
    QLineEdit* line() const { return line_; }
    // Null where there is no list.
    DropBox* box() const { return box_; }
    // What takes the keys.
    QWidget* focusTarget() const;

    // Of the line of text; empty and without effect where there is none.
    QString text() const;
    void setText(const QString& text);
    void setEntries(const QStringList& entries);

    // The user clicked into the line of text.
    std::function<void()> onLinePress;

private:
    QPointer<QWidget> widget_;
    QPointer<QLineEdit> line_;
    QPointer<DropBox> box_;
};

} // namespace kota::hub
