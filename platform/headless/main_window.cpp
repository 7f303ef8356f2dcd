#include "platform/headless/main_window.h"

#include <algorithm>
#include <iterator>

namespace kota::headless {

std::vector<Received> MainWindow::received(WPARAM code) const {
    std::vector<Received> chosen;
    std::ranges::copy_if(received_, std::back_inserter(chosen),
                         [&](const Received& r) { return r.code == code; });
    return chosen;
}

LRESULT MainWindow::WindowProc(UINT message, WPARAM wParam, LPARAM lParam) {
    const bool toSwitchBoard = message == switchBoardMessage();
    if (!toSwitchBoard && message != communicationMessage())
        return CWnd::WindowProc(message, wParam, lParam);

    Received record;
    record.message = message;
    record.code = wParam;
    if (const auto* package = reinterpret_cast<const CKHComm_Package*>(lParam)) {
        record.hasPackage = true;
        record.sender = package->sender;
        record.documentName = package->documentName;
        record.packageKind = package->packageKind;
        record.project = package->project;
        record.items = package->items;
    }
    received_.push_back(record);
    if (onMessage)
        onMessage(record);
    return toSwitchBoard && wParam == SwitchBoardCode::JoinProject ? project_ : 0;
}

} // namespace kota::headless
