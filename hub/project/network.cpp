#include "hub/project/network.h"

#include <algorithm>
#include <cmath>
#include <utility>

namespace kota::hub {

namespace {

bool isLine(const River& river) {
    return river.vertices.size() >= 2 && river.chainages.size() == river.vertices.size();
}

// The second vertex of the first segment whose chainages are around the given one, which the river has.
std::size_t vertexBehind(const River& river, double chainage) {
    const bool isFalling = river.firstChainage() > river.lastChainage();
    const auto isBefore = [isFalling](double left, double right) {
        return isFalling ? left > right : left < right;
    };
    const auto found =
        std::lower_bound(river.chainages.begin() + 1, river.chainages.end() - 1, chainage, isBefore);
    return static_cast<std::size_t>(found - river.chainages.begin());
}

// The ends are taken for reached within a millimetre: a chainage that was shown and read again is not the
// same to the last digit.
std::optional<QPointF> placeOn(const River& river, double wanted) {
    constexpr double tolerance = 1e-3;
    const auto [lowest, highest] = std::minmax({river.firstChainage(), river.lastChainage()});
    if (!(wanted >= lowest - tolerance && wanted <= highest + tolerance))
        return std::nullopt;
    const double chainage = std::clamp(wanted, lowest, highest);
    const std::size_t behind = vertexBehind(river, chainage);
    const double from = river.chainages[behind - 1];
    const double span = river.chainages[behind] - from;
    const double part = span == 0 ? 0 : (chainage - from) / span;
    const QPointF first = river.vertices[behind - 1];
    const QPointF second = river.vertices[behind];
    return QPointF(std::lerp(first.x(), second.x(), part), std::lerp(first.y(), second.y(), part));
}

double chainageAt(const River& river, const PlaceOnLine& place) {
    return std::lerp(river.chainages[place.segment], river.chainages[place.segment + 1], place.part);
}

} // namespace

Network::Network(std::vector<River> rivers) : rivers_(std::move(rivers)) {
    std::erase_if(rivers_, [](const River& river) { return !isLine(river); });
    indices_.reserve(rivers_.size());
    for (const River& river : rivers_) {
        bounds_.add(indices_.emplace_back(river.vertices).bounds());
        std::vector<std::size_t>& reaches = reaches_[river.name.toUpper()];
        if (reaches.empty())
            names_.append(river.name);
        reaches.push_back(indices_.size() - 1);
    }
}

std::optional<QPointF> Network::place(const QString& river, double chainage) const {
    const auto reaches = reaches_.constFind(river.toUpper());
    if (reaches == reaches_.constEnd())
        return std::nullopt;
    for (const std::size_t reach : *reaches)
        if (const std::optional<QPointF> found = placeOn(rivers_[reach], chainage))
            return found;
    return std::nullopt;
}

std::optional<Location> Network::nearest(QPointF point, double withinDistance) const {
    double nearerThan = std::nextafter(withinDistance, std::numeric_limits<double>::infinity());
    std::optional<Location> found;
    for (std::size_t river = 0; river < rivers_.size(); ++river) {
        const std::optional<PlaceOnLine> place =
            indices_[river].nearest(rivers_[river].vertices, point, nearerThan);
        if (!place)
            continue;
        nearerThan = place->distance;
        found = Location{rivers_[river].name, chainageAt(rivers_[river], *place), place->point};
    }
    return found;
}

} // namespace kota::hub
