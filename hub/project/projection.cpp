#include "hub/project/projection.h"

#include <algorithm>
#include <numbers>

namespace kota::hub {

namespace {

constexpr double turn = 360;
constexpr double earthRadius = 6'371'008.8; // metres, the mean one
constexpr double metresPerDegree = earthRadius * std::numbers::pi / 180;
constexpr double infinity = std::numeric_limits<double>::infinity();

// The longitudes of a line.
struct Extent {
    double west = infinity;
    double east = -infinity;
};

void shift(PinnedLine& line, double degrees) {
    for (std::vector<QPointF>& part : line.parts)
        for (QPointF& vertex : part)
            vertex.rx() += degrees;
}

// The whole turns that bring a longitude to within half a turn of another.
double turnsTowards(double other, double longitude) {
    return turn * std::round((other - longitude) / turn);
}

Extent joinSteps(PinnedLine& line) {
    Extent extent;
    double before = line.parts.front().front().x();
    for (std::vector<QPointF>& part : line.parts)
        for (QPointF& vertex : part) {
            vertex.rx() += turnsTowards(before, vertex.x());
            before = vertex.x();
            extent.west = std::min(extent.west, before);
            extent.east = std::max(extent.east, before);
        }
    return extent;
}

// Around the earth from the first turn's beginning: where the first line behind the widest gap begins.
double westOfAll(std::vector<Extent> extents) {
    double east = -infinity; // of the lines so far
    for (Extent& extent : extents) {
        const double toFirstTurn = -turn * std::floor(extent.west / turn);
        extent = {extent.west + toFirstTurn, extent.east + toFirstTurn};
        east = std::max(east, extent.east - turn);
    }
    std::ranges::sort(extents, {}, &Extent::west);
    double first = 0;
    double widest = -infinity;
    for (const Extent& extent : extents) {
        if (extent.west - east > widest) {
            widest = extent.west - east;
            first = extent.west;
        }
        east = std::max(east, extent.east);
    }
    return first;
}

void layBesideEachOther(std::vector<PinnedLine>& lines) {
    std::vector<Extent> extents;
    extents.reserve(lines.size());
    for (PinnedLine& line : lines)
        extents.push_back(joinSteps(line));
    const double first = westOfAll(extents);
    constexpr double rounding = 1e-9; // in turns
    for (std::size_t place = 0; place < lines.size(); ++place) {
        const double toFirst = -turn * std::floor((extents[place].west - first) / turn + rounding);
        shift(lines[place], toFirst);
        const double middle = std::midpoint(extents[place].west, extents[place].east) + toFirst;
        for (ChainagePin& pin : lines[place].pins)
            pin.point.rx() += turnsTowards(middle, pin.point.x());
    }
}

double radians(double degrees) {
    return degrees * std::numbers::pi / 180;
}

void measure(PinnedLine& line) {
    for (const std::vector<QPointF>& part : line.parts) {
        std::vector<double>& lengths = line.lengths.emplace_back();
        for (std::size_t segment = 0; segment + 1 < part.size(); ++segment) {
            const QPointF step = part[segment + 1] - part[segment];
            const double latitude = std::midpoint(part[segment].y(), part[segment + 1].y());
            lengths.push_back(metresPerDegree * std::hypot(step.x() * std::cos(radians(latitude)), step.y()));
        }
    }
}

class Projection {
public:
    explicit Projection(QPointF centre)
        : centre_(centre), metresPerDegreeEast_(metresPerDegree * std::cos(radians(centre.y()))) {}

    void apply(QPointF& degrees) const {
        degrees = {(degrees.x() - centre_.x()) * metresPerDegreeEast_,
                   (degrees.y() - centre_.y()) * metresPerDegree};
    }

private:
    QPointF centre_;
    double metresPerDegreeEast_;
};

Box boxAround(const std::vector<PinnedLine>& lines) {
    Box box;
    for (const PinnedLine& line : lines)
        for (const std::vector<QPointF>& part : line.parts)
            for (const QPointF vertex : part)
                box.add(vertex);
    return box;
}

} // namespace

void projectDegrees(std::vector<PinnedLine>& lines) {
    layBesideEachOther(lines);
    const Projection projection(boxAround(lines).centre());
    for (PinnedLine& line : lines) {
        measure(line);
        for (std::vector<QPointF>& part : line.parts)
            for (QPointF& vertex : part)
                projection.apply(vertex);
        for (ChainagePin& pin : line.pins)
            projection.apply(pin.point);
    }
}

} // namespace kota::hub
