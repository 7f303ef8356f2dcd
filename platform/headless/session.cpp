#include "platform/headless/session.h"

#include <cstdio>
#include <cstdlib>

namespace kota::headless {

Session::Session(std::function<void(const std::string&)> fail) : fail_(std::move(fail)), screen_(fail_) {
    mainWindow_.Create();
    application_.SetMainWnd(&mainWindow_);
    screenBefore_ = attachScreen(&screen_);
}

Session::~Session() {
    attachScreen(screenBefore_);
    if (screen_.hasUnusedAnswers())
        fail_("the script has answers that nothing asked for");
}

void Session::abortWith(const std::string& text) {
    std::fprintf(stderr, "headless session: %s\n", text.c_str());
    std::abort();
}

} // namespace kota::headless
