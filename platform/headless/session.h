#pragma once

#include "platform/framework/application.h"
#include "platform/headless/main_window.h"
#include "platform/headless/screen.h"

#include <string>

class CDocument;

namespace kota::headless {

// The application of a session: notes which help was asked for.
class Application : public CWinApp {
public:
    void WinHelp(UINT context) override { helpContexts.push_back(context); }

    std::vector<UINT> helpContexts;
};

// A shell without a screen, for tests: an application with a main window, and a screen that answers from a
// script. One session lives at a time.
class Session {
public:
    // `fail` is told what goes against the script; by default the program ends with the text.
    explicit Session(std::function<void(const std::string&)> fail = abortWith);
    // Closes what is open without asking. Answers that nothing asked for are a failure.
    ~Session();
    Session(const Session&) = delete;
    Session& operator=(const Session&) = delete;

    MainWindow& mainWindow() { return mainWindow_; }
    ScriptedScreen& screen() { return screen_; }
    Application& application() { return application_; }

    // Makes the templates and the tool bars of a plug-in known, as a shell does. Throws std::runtime_error,
    // with the reason, for a library that is none, or was built for another version; see PlugIn. Its language
    // libraries stand in the folder `languages` beside it.
    void load(const std::string& path);
    const std::vector<std::unique_ptr<CKhToolBarEx>>& toolBars() const { return toolBars_; }
    // Opens a file in a window of its own, or brings it to the front. Null when no template is for files of
    // its kind, and when that failed; then the user was told why in a box. The document belongs to its views.
    CDocument* open(const std::string& path);
    // A new document of the first template; null when there is none.
    CDocument* create();
    // Saves under the document's name, or under another one. False when it was not saved.
    bool save(CDocument& document);
    bool saveAs(CDocument& document, const std::string& path);

    // Closes the main window, as when the shell is about to end.
    void closeMainWindow();

private:
    static constexpr UINT firstToolBar = 59400; // the number of the first one's window

    [[noreturn]] static void abortWith(const std::string& text);

    std::function<void(const std::string&)> fail_;
    Application application_;
    MainWindow mainWindow_;
    std::vector<std::unique_ptr<CKhToolBarEx>> toolBars_;
    ScriptedScreen screen_;
    Screen* screenBefore_;
};

} // namespace kota::headless
