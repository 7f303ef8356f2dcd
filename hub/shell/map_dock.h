#pragma once

#include "hub/project/river_map.h"
#include "hub/screen/dock.h"
#include "hub/shell/exchange.h"

namespace kota::hub {

// The river map of the open project as a panel.
class MapDock : public Dock {
public:
    MapDock();

    RiverMap& map() { return *map_; }
    // Null where no project is open. What was picked in another one is forgotten.
    void showNetwork(std::shared_ptr<const Network> network);
    void showPlace(const std::optional<Place>& place);

private:
    RiverMap* map_;
};

} // namespace kota::hub
