#include "platform/framework/screen.h"

#include <utility>

namespace kota {

namespace {
Screen* theScreen = nullptr;
} // namespace

Screen::Screen() = default;
Screen::~Screen() = default;

CString Screen::clipboardText() const {
    return clipboard_;
}
void Screen::setClipboardText(const CString& text) {
    clipboard_ = text;
}
bool Screen::editText(UINT /*command*/, bool /*asked*/) {
    return false;
}
bool Screen::usesDecimalComma() const {
    return false;
}
CString Screen::fontFor(int /*language*/) const {
    return {};
}
void Screen::windowsChanged(std::span<const WindowChange> /*changes*/) {}
void Screen::changesPending() {}

Screen* attachScreen(Screen* screen) {
    return std::exchange(theScreen, screen);
}
Screen* attachedScreen() {
    return theScreen;
}

} // namespace kota
