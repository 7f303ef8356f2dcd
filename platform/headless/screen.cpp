#include "platform/headless/screen.h"

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
    constexpr int cancel = 2;
    boxes_.push_back(request);
    if (onBox)
        onBox();
    const auto button = takeFirst(boxAnswers_);
    if (!button)
        fail_("a message box that the script has no answer for: " + std::string(request.text.View()));
    return button.value_or(cancel);
}

std::optional<CString> ScriptedScreen::askSaveName(const CString& proposal) {
    const auto name = takeFirst(nameAnswers_);
    if (!name)
        fail_("a question for a file name that the script has no answer for: " +
              std::string(proposal.View()));
    return name.value_or(std::nullopt);
}

} // namespace kota::headless
