#pragma once

#include "hub/project/map_view_port.h"
#include "hub/project/network.h"

#include <QPolygonF>

#include <vector>

namespace kota::hub {

// A stretch of a river as it is drawn, in pixels: cut off at the edges of the view, and without vertices that
// lie closer together than can be seen.
struct DrawnStretch {
    std::size_t river = 0; // its place in the network
    QPolygonF points;
    std::vector<double> chainages; // for each point
    std::vector<double> along;     // the length from the first point to each point

    double length() const { return along.back(); }
    bool isFalling() const { return chainages.front() > chainages.back(); }
    QPointF pointAt(double length) const;
    // The direction of the stretch there, of length 1, over a few pixels; (0, 0) where there is none.
    QPointF directionAt(double length) const;
    // Where a chainage is that the stretch has.
    double lengthAt(double chainage) const;
};

// How rivers are cut and thinned out.
struct Drawing {
    const MapViewPort& port;
    double margin = 0;  // in pixels around the view, within which lines are drawn
    double closest = 1; // vertices lie so many pixels apart at least
};

// Adds the stretches of a river of a network that are in view.
void addStretches(const Network& network, std::size_t river, const Drawing& drawing,
                  std::vector<DrawnStretch>& stretches);

} // namespace kota::hub
