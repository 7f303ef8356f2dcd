#pragma once

#include "hub/project/line_index.h"

#include <QHash>
#include <QString>
#include <QStringList>

#include <optional>
#include <vector>

namespace kota::hub {

// A river, or one reach of it, as a line on the plane. All numbers are finite.
struct River {
    QString name;
    std::vector<QPointF> vertices; // in metres, x to the east and y to the north; at least two
    std::vector<double> chainages; // in metres, one for each vertex, never rising here and falling there

    double firstChainage() const { return chainages.front(); }
    double lastChainage() const { return chainages.back(); }
};

// A place on a river.
struct Location {
    QString river;
    double chainage = 0; // in metres
    QPointF point;       // on the plane

    bool operator==(const Location&) const = default;
};

// A river network as a value.
class Network {
public:
    Network() = default;
    // Leaves out rivers that are not two vertices long, or have not one chainage for each vertex.
    explicit Network(std::vector<River> rivers);

    const std::vector<River>& rivers() const { return rivers_; }
    // Of a river, by its place in `rivers`.
    const LineIndex& indexOf(std::size_t river) const { return indices_[river]; }
    // The box around all rivers; empty where there are none.
    const Box& bounds() const { return bounds_; }

    // Each name once, in the order of their first reaches. The case of letters does not tell rivers apart,
    // since editors write names in capitals.
    const QStringList& names() const { return names_; }

    // The place at a chainage, interpolated between the vertices around it; the first one where several
    // reaches of the river have it. None for an unknown river and for a chainage beyond its reaches.
    std::optional<QPointF> place(const QString& river, double chainage) const;

    // The place on a river nearest to a point, when it is not farther than `withinDistance` metres. On equal
    // terms the first river in the order of the network.
    std::optional<Location> nearest(QPointF point, double withinDistance) const;

private:
    std::vector<River> rivers_;
    std::vector<LineIndex> indices_; // one for each river
    Box bounds_;
    QStringList names_;
    QHash<QString, std::vector<std::size_t>> reaches_; // by name, in capitals
};

} // namespace kota::hub
