#include "hub/screen/dock.h"

#include "hub/screen/keyboard.h"

#include <QVariant>

namespace kota::hub {

namespace {

constexpr const char* commandProperty = "command";

bool leads(const QKeyEvent& key) {
    const bool controlTab = key.key() == Qt::Key_Tab && key.modifiers().testFlag(Qt::ControlModifier);
    return key.key() == Qt::Key_Escape || controlTab;
}

} // namespace

Dock::Dock(UINT command, const QString& title) : QDockWidget(title) {
    setProperty(commandProperty, command);
}

UINT Dock::commandOf(const QDockWidget& panel) {
    return panel.property(commandProperty).toUInt();
}

void Dock::fill(QWidget& content, QWidget& first) {
    setWidget(&content);
    setFocusProxy(&first);
}

void Dock::keyPressEvent(QKeyEvent* event) {
    event->setAccepted(!isForShell(*event));
    if (leads(*event) && onLeave)
        onLeave();
}

} // namespace kota::hub
