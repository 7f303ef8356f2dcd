#include "platform/headless/screen.h"

#include "platform/framework/dialog.h"
#include "platform/framework/message_box.h"

#include <string>
#include <utility>

namespace kota::headless {

namespace {

template <class Answer>
std::optional<Answer> takeFirst(std::deque<Answer>& answers) {
    if (answers.empty())
        return std::nullopt;
    Answer first = std::move(answers.front());
    answers.pop_front();
    return first;
}

} // namespace

ScriptedScreen::ScriptedScreen(std::function<void(const std::string&)> fail) : fail_(std::move(fail)) {}

int ScriptedScreen::showMessageBox(const MessageBoxRequest& request) {
    boxes_.push_back(request);
    if (onBox)
        onBox();
    const auto button = takeFirst(boxAnswers_);
    if (!button)
        fail_("a message box that the script has no answer for: " + std::string(request.text.View()));
    return button.value_or(IDCANCEL);
}

std::optional<CString> ScriptedScreen::askSaveName(const CString& proposal) {
    const auto name = takeFirst(nameAnswers_);
    if (!name)
        fail_("a question for a file name that the script has no answer for: " +
              std::string(proposal.View()));
    return name.value_or(std::nullopt);
}

void ScriptedScreen::showDialog(CDialog& dialog) {
    const auto user = takeFirst(dialogUsers_);
    if (!user)
        fail_("a dialog that the script has no answer for: " + std::string(dialog.GetWindowText().View()));
    else
        (*user)(dialog);
    if (!dialog.IsEnded())
        dialog.EndDialog(IDCANCEL);
}

} // namespace kota::headless
