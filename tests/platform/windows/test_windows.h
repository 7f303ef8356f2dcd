#pragma once

#include "platform/framework/screen.h"
#include "platform/framework/turn.h"
#include "platform/framework/window.h"
#include "platform/headless/session.h"

#include <gmock/gmock.h>

#include <functional>
#include <string>
#include <vector>

namespace kota::test {

// A window that does what a test says.
class TestWindow : public CWnd {
public:
    explicit TestWindow(CWnd* parent = nullptr, WindowKind kind = WindowKind::Plain, UINT id = 0) {
        Create({.parent = parent ? parent->GetSafeHwnd() : nullptr, .id = id, .kind = kind});
    }

    LRESULT WindowProc(UINT message, WPARAM wParam, LPARAM lParam) override {
        if (onMessage)
            onMessage(message, wParam, lParam);
        return CWnd::WindowProc(message, wParam, lParam);
    }
    BOOL OnCmdMsg(UINT id, int notification) override { return onCommand && onCommand(id, notification); }
    BOOL PreTranslateMessage(MSG* message) override { return onKey && onKey(message->wParam); }
    bool LetFocusGo() override { return !letsGo || letsGo(); }

    std::function<void(UINT, WPARAM, LPARAM)> onMessage; // before the window does what its kind does
    std::function<bool(UINT, int)> onCommand;
    std::function<bool(WPARAM)> onKey;
    std::function<bool()> letsGo;
};

// A screen that answers from a script and writes down what it is told.
class WatchedScreen : public headless::ScriptedScreen {
public:
    WatchedScreen()
        : ScriptedScreen([](const std::string& text) { ADD_FAILURE() << text; }),
          before_(attachScreen(this)) {}
    ~WatchedScreen() override {
        { const Turn last; }
        attachScreen(before_);
        EXPECT_FALSE(hasUnusedAnswers());
    }

    void windowsChanged(std::span<const WindowChange> changes) override {
        told.emplace_back(changes.begin(), changes.end());
    }
    void changesPending() override { ++pendingCalls; }

    std::vector<std::vector<WindowChange>> told; // one entry for each time that the screen was told
    int pendingCalls = 0;

private:
    Screen* before_;
};

// A shell with a main window.
class WithSession : public testing::Test {
protected:
    headless::Session session{[](const std::string& text) { ADD_FAILURE() << text; }};
};

inline std::string textOf(const CString& text) {
    return std::string(text.View());
}

} // namespace kota::test
