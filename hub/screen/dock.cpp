#include "hub/screen/dock.h"

#include <QKeyEvent>
#include <QVariant>

#include <algorithm>
#include <array>

namespace kota::hub {

namespace {

constexpr const char* commandProperty = "command";

// Whether the key is one of the program's that change no document.
bool isForProgram(const QKeyEvent& key) {
    constexpr std::array letters = {Qt::Key_N, Qt::Key_O, Qt::Key_S, Qt::Key_Q};
    const bool isHeld = key.modifiers() == Qt::ControlModifier;
    return key.key() == Qt::Key_F6 || (isHeld && std::ranges::find(letters, key.key()) != letters.end());
}

bool leads(const QKeyEvent& key) {
    const bool controlTab = key.key() == Qt::Key_Tab && key.modifiers().testFlag(Qt::ControlModifier);
    return key.key() == Qt::Key_Escape || controlTab;
}

} // namespace

Dock::Dock(UINT command, const QString& title) : QDockWidget(title) {
    setProperty(commandProperty, command);
    setFeatures(DockWidgetClosable |
                DockWidgetMovable); // a window of its own would get no keys of the program
}

UINT Dock::commandOf(const QDockWidget& panel) {
    return panel.property(commandProperty).toUInt();
}

void Dock::fill(QWidget& content, QWidget& first) {
    setWidget(&content);
    setFocusProxy(&first);
}

void Dock::keyPressEvent(QKeyEvent* event) {
    event->setAccepted(!isForProgram(*event));
    if (leads(*event) && onLeave)
        onLeave();
}

} // namespace kota::hub
