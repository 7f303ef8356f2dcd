#include "hub/shell/panels.h"

#include "hub/shell/settings.h"

#include <cmath>

namespace kota::hub {

namespace {

// A mouse is no finer than whole units, which is what the user reads at the pin.
double asShown(double chainage) {
    const double unit = metresPerChainageUnit();
    return std::round(chainage / unit) * unit;
}

} // namespace

Panels::Panels(QMainWindow& window, HubFrame& frame, QtScreen& screen)
    : frame_(frame), map_(new MapDock), exchange_(new ExchangeDock) {
    constexpr int mapWidth = 380;
    window.addDockWidget(Qt::RightDockWidgetArea, map_);
    window.addDockWidget(Qt::BottomDockWidgetArea, exchange_);
    window.resizeDocks({map_}, {mapWidth}, Qt::Horizontal);
    map_->hide();
    exchange_->hide();
    for (Dock* const panel : {static_cast<Dock*>(map_), static_cast<Dock*>(exchange_)})
        panel->onLeave = [&window, &screen] {
            window.setFocus(); // out of the panel; the screen gives the focus to the document
            screen.perform([] {});
        };

    // A place that is not to be seen is not offered.
    QObject::connect(map_, &QDockWidget::visibilityChanged, map_, [map = map_] {
        if (map->isHidden())
            map->map().dropPick();
    });
    Exchange& passed = frame_.exchange();
    map_->map().onPick = [&passed](const std::optional<Location>& picked) {
        passed.offer(picked ? std::optional(Place{picked->river, asShown(picked->chainage)}) : std::nullopt);
    };
    passed.onMessage = [this](const PassedMessage& message) { exchange_->add(message); };
    passed.onCurrentPlace = [this] { map_->showPlace(frame_.exchange().current()); };
    frame_.onProject = [this] {
        map_->showNetwork(frame_.projects().network());
        map_->setVisible(frame_.projects().isOpen());
    };
}

Panels::~Panels() {
    frame_.exchange().onMessage = nullptr;
    frame_.exchange().onCurrentPlace = nullptr;
    frame_.onProject = nullptr;
}

} // namespace kota::hub
