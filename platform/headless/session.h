#pragma once

#include "platform/framework/application.h"
#include "platform/headless/main_window.h"
#include "platform/headless/screen.h"

namespace kota::headless {

// A shell without a screen, for tests: an application with a main window, and a screen that answers from a
// script. One session lives at a time.
class Session {
public:
    // `fail` is told what goes against the script; by default the program ends with the text.
    explicit Session(std::function<void(const std::string&)> fail = abortWith);
    // Answers that nothing asked for are a failure.
    ~Session();
    Session(const Session&) = delete;
    Session& operator=(const Session&) = delete;

    MainWindow& mainWindow() { return mainWindow_; }
    ScriptedScreen& screen() { return screen_; }

    // Closes the main window, as when the shell is about to end.
    void closeMainWindow() { mainWindow_.DestroyWindow(); }

private:
    [[noreturn]] static void abortWith(const std::string& text);

    std::function<void(const std::string&)> fail_;
    CWinApp application_;
    MainWindow mainWindow_;
    ScriptedScreen screen_;
    Screen* screenBefore_;
};

} // namespace kota::headless
