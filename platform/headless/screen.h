#pragma once

#include "platform/framework/screen.h"

#include <deque>
#include <functional>
#include <string>
#include <vector>

namespace kota::headless {

// A screen without a display: it records what would be shown and answers from a queue. A box for which no
// answer stands ready is reported as a failure and answered with IDCANCEL.
class ScriptedScreen : public Screen {
public:
    // `fail` is called with a text when something was asked that the script does not answer.
    explicit ScriptedScreen(std::function<void(const std::string&)> fail);

    int showMessageBox(const MessageBoxRequest& request) override;
    std::optional<CString> askSaveName(const CString& proposal) override;
    void showDialog(CDialog& dialog) override;

    // The next box is answered with this button, the next question for a name with this name (none: the
    // user changed their mind).
    void answerBox(int button) { boxAnswers_.push_back(button); }
    void answerSaveName(std::optional<CString> name) { nameAnswers_.push_back(std::move(name)); }

    // The next dialog is handed to this, which plays the user until the dialog is ended.
    void answerDialog(std::function<void(CDialog&)> user) { dialogUsers_.push_back(std::move(user)); }

    // What happens while a box stands open, before it is answered: other programs, other windows.
    std::function<void()> onBox;

    // All boxes shown so far, in their order.
    const std::vector<MessageBoxRequest>& boxes() const { return boxes_; }
    // Whether answers stand ready that nothing asked for.
    bool hasUnusedAnswers() const {
        return !boxAnswers_.empty() || !nameAnswers_.empty() || !dialogUsers_.empty();
    }

private:
    std::function<void(const std::string&)> fail_;
    std::vector<MessageBoxRequest> boxes_;
    std::deque<int> boxAnswers_;
    std::deque<std::optional<CString>> nameAnswers_;
    std::deque<std::function<void(CDialog&)>> dialogUsers_;
};

} // namespace kota::headless
