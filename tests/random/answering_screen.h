#pragma once

#include "platform/framework/message_box.h"
#include "platform/framework/screen.h"

#include <functional>
#include <string>
#include <vector>

namespace kota::random_user {

// What the user says to a question.
enum class Answer { Yes, No, Cancel };

// A screen whose user always has an answer, and which looks at whatever is said to have changed.
class AnsweringScreen : public Screen {
public:
    int showMessageBox(const MessageBoxRequest& request) override;
    // The name that `nextName` gives; none while the user's answer is Cancel.
    std::optional<CString> askSaveName(const CString& proposal) override;
    // Hands the dialog to `user`, once, and cancels what nobody ended.
    void showDialog(CDialog& dialog) override;
    void windowsChanged(std::span<const WindowChange> changes) override;

    Answer answer = Answer::Yes;
    std::function<std::string()> nextName;
    std::function<void(CDialog&)> user;
    // What happens while a box stands open.
    std::function<void()> onBox;
    // The words of all boxes so far.
    std::vector<std::string> boxes;
};

} // namespace kota::random_user
