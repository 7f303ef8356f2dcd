#pragma once

#include "hub/screen/qt_screen.h"
#include "hub/shell/exchange_dock.h"
#include "hub/shell/hub_frame.h"
#include "hub/shell/map_dock.h"

namespace kota::hub {

// The panels around the documents: the river map at the right, the exchange, hidden at first, at the bottom.
class Panels {
public:
    // `window` is the main window of `frame`; the panels belong to it.
    Panels(QMainWindow& window, HubFrame& frame, QtScreen& screen);
    ~Panels();
    Panels(const Panels&) = delete;
    Panels& operator=(const Panels&) = delete;

    MapDock& map() { return *map_; }
    ExchangeDock& exchange() { return *exchange_; }

private:
    HubFrame& frame_;
    MapDock* map_;
    ExchangeDock* exchange_;
};

} // namespace kota::hub
