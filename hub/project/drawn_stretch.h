#pragma once

#include "hub/project/map_view_port.h"
#include "hub/project/network.h"

#include <QPointF>

#include <span>
#include <vector>

namespace kota::hub {

// A stretch of a river as it is drawn, in pixels: cut off at the edges of the view, and without vertices that
// lie closer together than can be seen. It looks into the stretches that it belongs to.
struct DrawnStretch {
    std::size_t river = 0; // its place in the network
    std::span<const QPointF> points;
    std::span<const double> chainages; // for each point
    std::span<const double> along;     // the length from the first point to each point

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

// The stretches of a network that are in view, in the order of its rivers.
class DrawnStretches {
public:
    DrawnStretches(const Network& network, const Drawing& drawing);

    std::size_t size() const { return beginnings_.size(); }
    DrawnStretch operator[](std::size_t stretch) const;

private:
    friend class Stretcher;

    struct Beginning {
        std::size_t river;
        std::size_t point;
    };
    std::vector<Beginning> beginnings_;
    // Of all stretches, one behind the other.
    std::vector<QPointF> points_;
    std::vector<double> chainages_;
    std::vector<double> along_;
};

} // namespace kota::hub
