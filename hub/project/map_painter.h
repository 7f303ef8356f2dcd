#pragma once

#include "hub/project/map_scene.h"

class QPainter;

namespace kota::hub {

// Draws a map, all but its ground. Costs what is in view, not what the network has.
void paintMap(QPainter& painter, const MapScene& scene);

} // namespace kota::hub
