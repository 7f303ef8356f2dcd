#pragma once

#include "hub/project/chainage_pins.h"

#include <vector>

namespace kota::hub {

// Turns longitudes (x, from -360 to 360) and latitudes (y) in degrees, of lines and their pins, into metres
// on the plane.
//
// Longitudes begin anew somewhere, and no river is cut there: each vertex comes to lie within half a turn of
// the one before it, and the rivers beside each other, with the widest gap between them around the earth as
// the map's edge.
//
// The projection is the equidistant cylindrical one about the middle of all vertices, which becomes (0, 0):
// true to scale from south to north, and from west to east at the middle latitude.
void projectDegrees(std::vector<PinnedLine>& lines);

} // namespace kota::hub
