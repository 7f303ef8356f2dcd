#include "hub/screen/part.h"

#include "hub/screen/parts.h"
#include "hub/screen/text.h"

#include <utility>

namespace kota::hub {

Part::Part(Parts& parts, HWND window, QWidget* widget) : parts_(parts), window_(window), widget_(widget) {}

Part::~Part() {
    delete label_.data();
    delete widget_.data();
}

void Part::retire() {
    for (QWidget* const own : {static_cast<QWidget*>(label_), widget_.data()})
        if (own)
            own->hide();
    deleteLater();
}

void Part::update() {
    const CWnd* const window = CWnd::FromHandle(window_);
    if (!window || !widget_)
        return;
    const WindowState& state = *window->State();
    for (QWidget* const own : {static_cast<QWidget*>(label_), widget_.data()})
        if (own) {
            own->setEnabled(state.enabled);
            if (own->parentWidget() || !state.visible) // without a parent it would be a window of its own
                own->setVisible(state.visible);
            own->setToolTip(toQt(state.toolTip));
        }
    widget_->setAccessibleName(name(state).remove('&'));
    refresh(state);
}

QString Part::name(const WindowState& state) const {
    return toQt(state.label.IsEmpty() ? state.text : state.label);
}

QString Part::nameAround() const {
    const CWnd* window = CWnd::FromHandle(window_);
    do
        window = window ? window->GetParent() : nullptr;
    while (window && window->State()->text.IsEmpty());
    return window ? toQt(window->State()->text) : QString();
}

void Part::settle() {}
void Part::add(Part& /*child*/) {}

bool Part::takeKey(QKeyEvent& /*key*/) {
    return false;
}

void Part::takeComposition(QInputMethodEvent& /*composition*/) {}

void Part::refresh(const WindowState& /*state*/) {}

void Part::queue(std::function<void(CWnd&)> action) const {
    parts_.queue().add([handle = window_, act = std::move(action)] {
        if (CWnd* const window = CWnd::FromHandle(handle))
            act(*window);
    });
}

} // namespace kota::hub
