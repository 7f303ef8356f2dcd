#include "tests/random/answering_screen.h"

#include "platform/framework/dialog.h"
#include "platform/grid/grid.h"

#include <utility>

namespace kota::random_user {

int AnsweringScreen::showMessageBox(const MessageBoxRequest& request) {
    boxes.emplace_back(request.text.View());
    if (onBox)
        onBox();
    if (request.type != MB_YESNO && request.type != MB_YESNOCANCEL)
        return IDOK;
    if (answer == Answer::Yes)
        return IDYES;
    return answer == Answer::No || request.type == MB_YESNO ? IDNO : IDCANCEL;
}

std::optional<CString> AnsweringScreen::askSaveName(const CString& /*proposal*/) {
    if (answer == Answer::Cancel || !nextName)
        return std::nullopt;
    return CString(nextName().c_str());
}

void AnsweringScreen::showDialog(CDialog& dialog) {
    const HWND window = dialog.GetSafeHwnd();
    if (const auto now = std::exchange(user, nullptr))
        now(dialog);
    if (IsWindow(window) && !dialog.IsEnded())
        dialog.EndDialog(IDCANCEL);
}

void AnsweringScreen::windowsChanged(std::span<const WindowChange> changes) {
    for (const WindowChange& change : changes)
        if (auto* const grid = dynamic_cast<CGXGridCore*>(CWnd::FromHandle(change.window)))
            grid->TakeChanges();
}

} // namespace kota::random_user
