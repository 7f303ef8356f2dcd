#pragma once

#include "hub/project/network.h"

#include <QPointF>

#include <optional>
#include <vector>

namespace kota::hub {

// A chainage that is known in between, with its place, which is taken to the nearest place of the line.
struct ChainagePin {
    QPointF point; // on the plane
    double chainage = 0;
};

// A river whose line may lie in several parts, with what is known of its chainages.
struct PinnedLine {
    QString name;
    std::vector<std::vector<QPointF>> parts; // in the river's order, each of at least two vertices
    // Of each segment of each part, in metres; those on the plane where this is empty.
    std::vector<std::vector<double>> lengths;
    double firstChainage = 0;      // of the first vertex
    double lastChainage = 0;       // of the last vertex; may be less than the first
    std::vector<ChainagePin> pins; // in any order, their chainages between those two
};

struct Chained {
    std::vector<River> reaches; // one for each part
    // The first pin that lies before one of a chainage nearer to the start. There are no reaches then.
    std::optional<std::size_t> misplacedPin;
};

// Gives each vertex its chainage: between two known ones in proportion to the length along the line, on which
// the way from one part to the next counts nothing. A pin between two vertices becomes a vertex. Where all
// the line is one point, the chainages are spread evenly over the vertices, and pins change nothing.
Chained chain(PinnedLine line);

} // namespace kota::hub
