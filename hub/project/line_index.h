#pragma once

#include "hub/project/box.h"

#include <functional>
#include <optional>
#include <vector>

namespace kota::hub {

// A place on a line of straight segments: segment n goes from vertex n to vertex n + 1.
struct PlaceOnLine {
    std::size_t segment = 0;
    double part = 0; // 0 at the segment's first vertex, 1 at its second
    QPointF point;
    double distance = 0; // from the point that was asked for
};

// Finds what of a line is near a point or within an area without looking at all of it. The line itself is
// given anew to each question and must be the one that the index was made from.
class LineIndex {
public:
    LineIndex() = default;
    explicit LineIndex(const std::vector<QPointF>& line);

    // The box around the whole line.
    Box bounds() const { return levels_.empty() ? Box() : levels_.back().front(); }

    // The nearest place, the first one of several; none when it is not nearer than `nearerThan`.
    std::optional<PlaceOnLine> nearest(const std::vector<QPointF>& line, QPointF point,
                                       double nearerThan) const;

    // Gives, in their order, stretches of segments, from `first` to before `end`, that hold all that meet the
    // area.
    using Visit = std::function<void(std::size_t first, std::size_t end)>;
    void stretchesIn(const Box& area, const Visit& visit) const;

private:
    struct Search;
    void search(std::size_t level, std::size_t node, Search& search) const;
    void visitNode(std::size_t level, std::size_t node, const Box& area, const Visit& visit) const;
    std::size_t endOf(std::size_t leaf) const;

    std::size_t segments_ = 0;
    std::vector<std::vector<Box>> levels_; // from the leaves, of several segments each, to the one root
};

} // namespace kota::hub
