#include "hub/screen/keyboard.h"

#include "hub/screen/parts.h"
#include "platform/framework/messages.h"
#include "platform/framework/scope.h"

#include <QCoreApplication>

#include <algorithm>
#include <array>
#include <memory>
#include <utility>

namespace kota::hub {

namespace {

constexpr std::array<std::pair<int, WPARAM>, 17> keys = {{
    {Qt::Key_Tab, VK_TAB},
    {Qt::Key_Backtab, VK_TAB},
    {Qt::Key_Return, VK_RETURN},
    {Qt::Key_Enter, VK_RETURN},
    {Qt::Key_Escape, VK_ESCAPE},
    {Qt::Key_PageUp, VK_PRIOR},
    {Qt::Key_PageDown, VK_NEXT},
    {Qt::Key_End, VK_END},
    {Qt::Key_Home, VK_HOME},
    {Qt::Key_Left, VK_LEFT},
    {Qt::Key_Up, VK_UP},
    {Qt::Key_Right, VK_RIGHT},
    {Qt::Key_Down, VK_DOWN},
    {Qt::Key_Insert, VK_INSERT},
    {Qt::Key_Delete, VK_DELETE},
    {Qt::Key_Backspace, VK_BACK},
    {Qt::Key_Space, ' '},
}};

// A letter typed with Ctrl or Alt, which is a command where there is one.
std::optional<WPARAM> heldLetter(const QKeyEvent& key) {
    const bool isLetter = key.key() >= Qt::Key_A && key.key() <= Qt::Key_Z;
    const bool isHeld =
        key.modifiers().testFlag(Qt::ControlModifier) != key.modifiers().testFlag(Qt::AltModifier);
    return isLetter && isHeld ? std::optional<WPARAM>('A' + static_cast<WPARAM>(key.key() - Qt::Key_A))
                              : std::nullopt;
}

// Whether the key means a command at most, and no text of a window.
bool isForShell(const QKeyEvent& key) {
    return heldLetter(key) || (key.key() >= Qt::Key_F1 && key.key() <= Qt::Key_F12);
}

} // namespace

std::optional<WPARAM> virtualKey(int qtKey) {
    if (qtKey >= Qt::Key_F1 && qtKey <= Qt::Key_F12)
        return VK_F1 + static_cast<WPARAM>(qtKey - Qt::Key_F1);
    const auto found = std::ranges::find(keys, qtKey, &std::pair<int, WPARAM>::first);
    return found == keys.end() ? std::nullopt : std::optional(found->second);
}

input::Modifiers modifiersOf(const QKeyEvent& key) {
    const Qt::KeyboardModifiers held = key.modifiers();
    return {.shift = held.testFlag(Qt::ShiftModifier) || key.key() == Qt::Key_Backtab,
            .control = held.testFlag(Qt::ControlModifier),
            .alt = held.testFlag(Qt::AltModifier)};
}

QString typedText(const QKeyEvent& key) {
    const QString text = key.text();
    // AltGr comes as both, and types.
    const bool control = key.modifiers().testFlag(Qt::ControlModifier);
    const bool alt = key.modifiers().testFlag(Qt::AltModifier);
    return text.isEmpty() || !text.front().isPrint() || control != alt ? QString() : text;
}

bool isForLineOfText(const QKeyEvent& key) {
    switch (key.key()) {
    case Qt::Key_Left:
    case Qt::Key_Right:
    case Qt::Key_Home:
    case Qt::Key_End:
    case Qt::Key_Backspace:
    case Qt::Key_Delete:
        return true;
    case Qt::Key_Insert: // with a modifier it copies or pastes
        return key.modifiers() != Qt::NoModifier;
    default:
        return !virtualKey(key.key()) || key.key() == Qt::Key_Space;
    }
}

Keyboard::Keyboard(Parts& parts) : parts_(parts) {}

void Keyboard::watch(QWidget& widget) {
    widget.installEventFilter(this);
}

void Keyboard::pass(QWidget& widget, QEvent& event) {
    const ValueScope scope(passing_, true);
    QCoreApplication::sendEvent(&widget, &event);
}

bool Keyboard::eventFilter(QObject* watched, QEvent* event) {
    const bool isInput = event->type() == QEvent::KeyPress || event->type() == QEvent::InputMethod;
    if (passing_ || !isInput)
        return QObject::eventFilter(watched, event);
    parts_.queue().add([this, kept = std::shared_ptr<QEvent>(event->clone())] { deliver(*kept); });
    return true;
}

void Keyboard::deliver(QEvent& event) {
    Part* const part = parts_.find(::GetFocus());
    if (event.type() == QEvent::InputMethod) {
        if (part)
            part->takeComposition(static_cast<QInputMethodEvent&>(event));
        return;
    }
    auto& key = static_cast<QKeyEvent&>(event);
    wasLast_ = true;
    const QWidget* const target = part ? part->focusTarget() : nullptr;
    if (target && !target->isVisible() && !isForShell(key)) // in a window that is reduced to an icon
        return;
    if (const auto letter = heldLetter(key); letter && input::key(*letter, modifiersOf(key)))
        return;
    if (part && part->takeKey(key))
        return;
    if (const auto number = virtualKey(key.key()))
        input::key(*number, modifiersOf(key));
}

} // namespace kota::hub
