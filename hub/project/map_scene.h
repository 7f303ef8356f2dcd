#pragma once

#include "hub/project/map_view_port.h"
#include "hub/project/network.h"

#include <QFont>
#include <QPalette>

#include <functional>
#include <optional>

namespace kota::hub {

// How chainages and distances read in the user's unit.
struct ChainageText {
    std::function<QString(double metres)> text; // with the unit
    double metresPerUnit = 1;                   // marks stand at round numbers of units
};

// All that a picture of a map depends on.
struct MapScene {
    const Network& network;
    const MapViewPort& port;
    const ChainageText& chainages;
    QPalette palette;
    QFont font;
    double pixelRatio = 1; // of the device, to the pixels of the port
    std::optional<Location> picked;
    std::optional<QPointF> current; // of the editor, on the plane
};

} // namespace kota::hub
