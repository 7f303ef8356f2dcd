#include "hub/project/line_index.h"

#include <utility>

namespace kota::hub {

namespace {

constexpr std::size_t segmentsInLeaf = 16;

PlaceOnLine nearestOnSegment(QPointF from, QPointF to, QPointF point) {
    const QPointF along = to - from;
    const double squared = QPointF::dotProduct(along, along);
    const double part =
        squared > 0 ? std::clamp(QPointF::dotProduct(point - from, along) / squared, 0.0, 1.0) : 0.0;
    const QPointF there(std::lerp(from.x(), to.x(), part), std::lerp(from.y(), to.y(), part));
    return {0, part, there, std::hypot(point.x() - there.x(), point.y() - there.y())};
}

} // namespace

struct LineIndex::Search {
    const std::vector<QPointF>& line;
    QPointF point;
    double nearerThan;
    std::optional<PlaceOnLine> found;
};

LineIndex::LineIndex(const std::vector<QPointF>& line) : segments_(line.empty() ? 0 : line.size() - 1) {
    std::vector<Box> boxes((segments_ + segmentsInLeaf - 1) / segmentsInLeaf);
    for (std::size_t segment = 0; segment < segments_; ++segment) {
        boxes[segment / segmentsInLeaf].add(line[segment]);
        boxes[segment / segmentsInLeaf].add(line[segment + 1]);
    }
    while (boxes.size() > 1) {
        std::vector<Box> above((boxes.size() + 1) / 2);
        for (std::size_t node = 0; node < boxes.size(); ++node)
            above[node / 2].add(boxes[node]);
        levels_.push_back(std::exchange(boxes, std::move(above)));
    }
    if (!boxes.empty())
        levels_.push_back(std::move(boxes));
}

std::size_t LineIndex::endOf(std::size_t leaf) const {
    return std::min((leaf + 1) * segmentsInLeaf, segments_);
}

std::optional<PlaceOnLine> LineIndex::nearest(const std::vector<QPointF>& line, QPointF point,
                                              double nearerThan) const {
    Search asked{line, point, nearerThan, std::nullopt};
    if (!levels_.empty())
        search(levels_.size() - 1, 0, asked);
    return asked.found;
}

// The child that is nearer goes first, so that the other one can mostly be left out.
void LineIndex::search(std::size_t level, std::size_t node, Search& search) const {
    if (!(levels_[level][node].distanceTo(search.point) < search.nearerThan))
        return;
    if (level > 0) {
        const std::vector<Box>& below = levels_[level - 1];
        const std::size_t left = 2 * node;
        const std::size_t right = left + 1;
        const bool both = right < below.size();
        const bool rightFirst =
            both && below[right].distanceTo(search.point) < below[left].distanceTo(search.point);
        this->search(level - 1, rightFirst ? right : left, search);
        if (both)
            this->search(level - 1, rightFirst ? left : right, search);
        return;
    }
    for (std::size_t segment = node * segmentsInLeaf; segment < endOf(node); ++segment) {
        PlaceOnLine place = nearestOnSegment(search.line[segment], search.line[segment + 1], search.point);
        if (!(place.distance < search.nearerThan))
            continue;
        place.segment = segment;
        search.nearerThan = place.distance;
        search.found = place;
    }
}

void LineIndex::stretchesIn(const Box& area, const Visit& visit) const {
    if (!levels_.empty())
        visitNode(levels_.size() - 1, 0, area, visit);
}

void LineIndex::visitNode(std::size_t level, std::size_t node, const Box& area, const Visit& visit) const {
    if (!levels_[level][node].meets(area))
        return;
    if (level == 0) {
        visit(node * segmentsInLeaf, endOf(node));
        return;
    }
    visitNode(level - 1, 2 * node, area, visit);
    if (2 * node + 1 < levels_[level - 1].size())
        visitNode(level - 1, 2 * node + 1, area, visit);
}

} // namespace kota::hub
