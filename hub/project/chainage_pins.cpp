#include "hub/project/chainage_pins.h"

#include <algorithm>
#include <utility>

namespace kota::hub {

namespace {

// A place of the line whose chainage is known.
struct Known {
    double along = 0; // length along the line from its start
    double chainage = 0;
    std::size_t pin = 0;
    std::size_t part = 0;
    PlaceOnLine place;
};

Known knownAt(double along, double chainage) {
    Known known;
    known.along = along;
    known.chainage = chainage;
    return known;
}

class Chainer {
public:
    explicit Chainer(PinnedLine line) : line_(std::move(line)) { measure(); }

    Chained run() {
        if (length_ == 0)
            return {.reaches = spread(), .misplacedPin = std::nullopt};
        std::vector<Known> pins = placedPins();
        if (const std::optional<std::size_t> misplaced = misplacedPin(pins))
            return {.reaches = {}, .misplacedPin = misplaced};
        insertVertices(pins);
        return {.reaches = interpolated(std::move(pins)), .misplacedPin = std::nullopt};
    }

private:
    void measure() {
        for (std::size_t part = 0; part < line_.parts.size(); ++part) {
            std::vector<double>& along = along_.emplace_back();
            along.reserve(line_.parts[part].size());
            along.push_back(length_);
            for (std::size_t segment = 0; segment + 1 < line_.parts[part].size(); ++segment)
                along.push_back(length_ += lengthOf(part, segment));
        }
    }
    double lengthOf(std::size_t part, std::size_t segment) const {
        if (!line_.lengths.empty())
            return line_.lengths[part][segment];
        const QPointF step = line_.parts[part][segment + 1] - line_.parts[part][segment];
        return std::hypot(step.x(), step.y());
    }

    std::vector<River> spread() {
        std::size_t steps = 0;
        for (const std::vector<QPointF>& part : line_.parts)
            steps += part.size() - 1;
        std::vector<River> reaches;
        std::size_t step = 0;
        for (std::vector<QPointF>& part : line_.parts) {
            River reach{line_.name, std::move(part), {}};
            for (std::size_t vertex = 0; vertex < reach.vertices.size(); ++vertex)
                reach.chainages.push_back(
                    chainageAt(static_cast<double>(step + vertex) / static_cast<double>(steps)));
            step += reach.vertices.size() - 1;
            reaches.push_back(std::move(reach));
        }
        return reaches;
    }
    double chainageAt(double share) const {
        return std::lerp(line_.firstChainage, line_.lastChainage, share);
    }

    // The pins in the order of the river's chainages.
    std::vector<Known> placedPins() const {
        if (line_.pins.empty())
            return {};
        std::vector<LineIndex> indices;
        for (const std::vector<QPointF>& part : line_.parts)
            indices.emplace_back(part);
        std::vector<Known> pins;
        for (std::size_t pin = 0; pin < line_.pins.size(); ++pin)
            pins.push_back(placed(pin, indices));
        const bool isFalling = line_.firstChainage > line_.lastChainage;
        std::ranges::stable_sort(pins, [isFalling](const Known& left, const Known& right) {
            return isFalling ? left.chainage > right.chainage : left.chainage < right.chainage;
        });
        return pins;
    }

    Known placed(std::size_t pin, const std::vector<LineIndex>& indices) const {
        const ChainagePin& asked = line_.pins[pin];
        Known known = knownAt(0, asked.chainage);
        known.pin = pin;
        double nearerThan = std::numeric_limits<double>::infinity();
        for (std::size_t part = 0; part < line_.parts.size(); ++part) {
            const auto found = indices[part].nearest(line_.parts[part], asked.point, nearerThan);
            if (!found)
                continue;
            nearerThan = found->distance;
            known.part = part;
            known.place = *found;
        }
        const std::vector<double>& along = along_[known.part];
        known.along = std::lerp(along[known.place.segment], along[known.place.segment + 1], known.place.part);
        return known;
    }

    // The ends are known too: a pin at an end must have the end's chainage.
    std::optional<std::size_t> misplacedPin(const std::vector<Known>& pins) const {
        Known before = knownAt(0, line_.firstChainage);
        for (const Known& pin : pins) {
            const bool isBehind =
                pin.along > before.along || (pin.along == before.along && pin.chainage == before.chainage);
            const bool isBeforeEnd = pin.along < length_ || pin.chainage == line_.lastChainage;
            if (!isBehind || !isBeforeEnd)
                return pin.pin;
            before = pin;
        }
        return std::nullopt;
    }

    // From the last pin to the first, so that the segments of those before keep their numbers.
    void insertVertices(std::vector<Known> pins) {
        std::ranges::stable_sort(pins, [](const Known& left, const Known& right) {
            return std::pair(left.part, left.along) < std::pair(right.part, right.along);
        });
        std::size_t next = 0;
        for (std::size_t part = 0; part < line_.parts.size(); ++part) {
            std::vector<QPointF> vertices;
            std::vector<double> along;
            for (std::size_t vertex = 0; vertex < line_.parts[part].size(); ++vertex) {
                vertices.push_back(line_.parts[part][vertex]);
                along.push_back(along_[part][vertex]);
                for (; next < pins.size() && isOn(pins[next], part, vertex); ++next) {
                    const bool isVertex =
                        pins[next].along <= along.back() ||
                        (vertex + 1 < along_[part].size() && pins[next].along >= along_[part][vertex + 1]);
                    if (isVertex)
                        continue;
                    vertices.push_back(pins[next].place.point);
                    along.push_back(pins[next].along);
                }
            }
            line_.parts[part] = std::move(vertices);
            along_[part] = std::move(along);
        }
    }
    static bool isOn(const Known& pin, std::size_t part, std::size_t segment) {
        return pin.part == part && pin.place.segment <= segment;
    }

    std::vector<River> interpolated(std::vector<Known> known) {
        known.insert(known.begin(), knownAt(0, line_.firstChainage));
        known.push_back(knownAt(length_, line_.lastChainage));
        std::vector<River> reaches;
        std::size_t behind = 1;
        for (std::size_t part = 0; part < line_.parts.size(); ++part) {
            River reach{line_.name, std::move(line_.parts[part]), {}};
            for (const double along : along_[part]) {
                while (behind + 1 < known.size() && known[behind].along < along)
                    ++behind;
                reach.chainages.push_back(between(known[behind - 1], known[behind], along));
            }
            reaches.push_back(std::move(reach));
        }
        return reaches;
    }
    static double between(const Known& before, const Known& behind, double along) {
        const double stretch = behind.along - before.along;
        const double part = stretch > 0 ? (along - before.along) / stretch : 0;
        return std::lerp(before.chainage, behind.chainage, part);
    }

    PinnedLine line_;
    std::vector<std::vector<double>> along_; // for each vertex of each part
    double length_ = 0;
};

} // namespace

Chained chain(PinnedLine line) {
    return Chainer(std::move(line)).run();
}

} // namespace kota::hub
