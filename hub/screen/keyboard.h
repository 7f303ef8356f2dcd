#pragma once

#include "platform/framework/input.h"

#include <QKeyEvent>
#include <QObject>

#include <optional>
#include <utility>

class QWidget;

namespace kota::hub {

class Parts;

// Keeps keys and composed texts from the widgets that it watches until the queue comes to them. They go then
// to the window that has the platform's focus, which need not be the one that had it when they were typed.
class Keyboard : public QObject {
public:
    explicit Keyboard(Parts& parts);

    void watch(QWidget& widget);
    // Lets a widget have an event that was kept from it. For the queue's actions.
    void pass(QWidget& widget, QEvent& event);

    // Whether a key was the last input since this was asked before.
    bool takeWasLast() { return std::exchange(wasLast_, false); }

    bool eventFilter(QObject* watched, QEvent* event) override;

private:
    void deliver(QEvent& event);

    Parts& parts_;
    bool passing_ = false;
    bool wasLast_ = false;
};

// None for keys that the platform has no number for.
std::optional<WPARAM> virtualKey(int qtKey);
input::Modifiers modifiersOf(const QKeyEvent& key);
// The text that a key types; empty for a key that types none.
QString typedText(const QKeyEvent& key);
// Whether a line of text that is being edited uses the key itself.
bool isForLineOfText(const QKeyEvent& key);

} // namespace kota::hub
