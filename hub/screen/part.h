#pragma once

#include "platform/framework/window.h"

#include <QInputMethodEvent>
#include <QKeyEvent>
#include <QLabel>
#include <QPointer>
#include <QWidget>

#include <functional>

namespace kota::hub {

class Parts;

// What draws one window of the platform and takes the user's input for it. It reads the window's state when
// told that it changed, and never changes it but by the platform's input operations, through the queue.
class Part : public QObject {
public:
    ~Part() override;

    HWND window() const { return window_; }
    QWidget* widget() const { return widget_; }
    // The label in front of the widget, null for none. It is seen and enabled as the widget is.
    QLabel* label() const { return label_; }
    void setLabel(QLabel* label) { label_ = label; }
    // The window is gone. The part deletes itself when nothing of it can be running any more.
    void retire();
    // Shows the window as it stands.
    void update();
    // An input is done, with all that it changed.
    virtual void settle();

    // Takes the part of a window inside this one into the layout, behind those that are there.
    virtual void add(Part& child);
    // Whether the widget can use all the height that it can get.
    virtual bool isTall() const { return false; }
    // What has the toolkit's focus while the window has the platform's.
    virtual QWidget* focusTarget() const { return widget(); }
    // A key for the window while it has the focus. False: the platform is to see it.
    virtual bool takeKey(QKeyEvent& key);
    // A text that an input method composes or has composed.
    virtual void takeComposition(QInputMethodEvent& composition);

protected:
    // `widget` is new, and the part's to delete.
    Part(Parts& parts, HWND window, QWidget* widget);

    virtual void refresh(const WindowState& state);
    // What a screen reader calls the widget.
    virtual QString name(const WindowState& state) const;
    // The text of the nearest window around that has one.
    QString nameAround() const;
    // Queues an input for the window, which is dropped if the window is gone by then.
    void queue(std::function<void(CWnd&)> action) const;
    Parts& parts() const { return parts_; }

private:
    Parts& parts_;
    HWND window_;
    QPointer<QWidget> widget_;
    QPointer<QLabel> label_;
};

} // namespace kota::hub
