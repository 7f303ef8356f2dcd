#include "platform/headless/main_window.h"

#include <algorithm>
#include <iterator>
#include <memory>
#include <utility>

namespace kota::headless {

namespace {

std::unique_ptr<CK31_CBE_ModelDataItem> itemOf(const Location& location) {
    auto item = std::make_unique<CK31_CBE_ModelDataItem>();
    item->riverName = location.riverName.c_str();
    item->chainage = location.chainage;
    item->chainage2 = location.chainage2;
    item->dataType = location.dataType;
    return item;
}

Location locationOf(const CK31_CBE_ModelDataItem& item) {
    return {std::string(item.riverName.View()), item.chainage, item.chainage2, item.dataType};
}

constexpr MenuItemTemplate fileItems[] = {{ID_FILE_CLOSE, "&Close"},
                                          {ID_FILE_SAVE, "&Save\tCtrl+S"},
                                          {ID_FILE_SAVE_AS, "Save &As..."},
                                          {ID_FILE_PRINT, "&Print...\tCtrl+P"}};
constexpr MenuItemTemplate windowItems[] = {{ID_WINDOW_NEW, "&New Window"}};
constexpr MenuPopupTemplate popups[] = {
    {"&File", fileItems}, {"&Edit", {}}, {"&View", {}}, {"&Window", windowItems}, {"&Help", {}}};
constexpr MenuTemplate menu{.id = 0, .popups = popups};

LRESULT handOver(CObject* object) {
    return reinterpret_cast<LRESULT>(object);
}

} // namespace

MainWindow::MainWindow() {
    LoadMenu(menu);
}
MainWindow::~MainWindow() = default;

std::vector<Received> MainWindow::received(WPARAM code) const {
    std::vector<Received> chosen;
    std::ranges::copy_if(received_, std::back_inserter(chosen),
                         [&](const Received& r) { return r.code == code; });
    return chosen;
}

void MainWindow::record(UINT message, WPARAM code, const CKHComm_Package* package) {
    Received record;
    record.message = message;
    record.code = code;
    if (package) {
        record.hasPackage = true;
        record.sender = package->sender;
        record.documentName = package->documentName;
        record.packageKind = package->packageKind;
        record.project = package->project;
        record.items = package->items;
        if (code == CommunicationCode::LocationChanged && package->items)
            record.location = locationOf(static_cast<const CK31_CBE_ModelDataItem&>(*package->items));
    }
    received_.push_back(record);
    if (onMessage)
        onMessage(record);
}

LRESULT MainWindow::answer(WPARAM code) {
    switch (code) {
    case SwitchBoardCode::JoinProject:
        return project_.handle;
    case SwitchBoardCode::OfferRivers: {
        if (project_.rivers.empty())
            return 0;
        auto rivers = std::make_unique<CObList>();
        for (const std::string& name : project_.rivers)
            rivers->AddTail(itemOf({.riverName = name}).release());
        return handOver(rivers.release());
    }
    case SwitchBoardCode::OfferLocation: {
        if (project_.offers.empty())
            return 0;
        const Location offer = project_.offers.front();
        project_.offers.pop_front();
        return handOver(itemOf(offer).release());
    }
    default:
        return 0;
    }
}

LRESULT MainWindow::WindowProc(UINT message, WPARAM wParam, LPARAM lParam) {
    if (message == showToolbarMessage() || message == hideToolbarMessage()) {
        record(message, wParam, nullptr);
        return 0;
    }
    const bool toSwitchBoard = message == switchBoardMessage();
    if (!toSwitchBoard && message != communicationMessage())
        return CKhMDIFrameWnd::WindowProc(message, wParam, lParam);
    record(message, wParam, reinterpret_cast<const CKHComm_Package*>(lParam));
    if (toSwitchBoard)
        return answer(wParam);
    if (CommunicationCode::isToldToAll(wParam))
        PassOn(message, wParam, lParam);
    return 0;
}

} // namespace kota::headless
