#include "hub/shell/map_dock.h"

#include "hub/shell/commands.h"
#include "hub/shell/menu.h"
#include "hub/shell/settings.h"

namespace kota::hub {

MapDock::MapDock() : Dock(HubCommand::ShowMap, hubText(HubText::RiverMap)), map_(new RiverMap) {
    setObjectName("map");
    map_->setChainageText({&chainageText, metresPerChainageUnit()});
    fill(*map_, *map_);
}

void MapDock::showNetwork(std::shared_ptr<const Network> network) {
    map_->showNetwork(std::move(network));
}

void MapDock::showPlace(const std::optional<Place>& place) {
    if (place)
        map_->setCurrentLocation(place->river, place->chainage);
    else
        map_->clearCurrentLocation();
}

} // namespace kota::hub
