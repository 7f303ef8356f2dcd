#include "platform/framework/screen.h"

#include <utility>

namespace kota {

namespace {
Screen* theScreen = nullptr;
} // namespace

Screen::Screen() = default;
Screen::~Screen() = default;

void Screen::windowsChanged(std::span<const WindowChange> /*changes*/) {}
void Screen::changesPending() {}

Screen* attachScreen(Screen* screen) {
    return std::exchange(theScreen, screen);
}
Screen* attachedScreen() {
    return theScreen;
}

} // namespace kota
