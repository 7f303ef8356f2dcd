#pragma once

#include <QPointF>

#include <algorithm>
#include <cmath>
#include <limits>
#include <numeric>

namespace kota::hub {

// A rectangle of the plane with its edges, in metres. Other than a QRectF it may be a point or a straight
// line and still be met; a new one holds nothing.
struct Box {
    double left = std::numeric_limits<double>::infinity();
    double bottom = std::numeric_limits<double>::infinity();
    double right = -std::numeric_limits<double>::infinity();
    double top = -std::numeric_limits<double>::infinity();

    bool isEmpty() const { return left > right; }

    void add(QPointF point) {
        left = std::min(left, point.x());
        right = std::max(right, point.x());
        bottom = std::min(bottom, point.y());
        top = std::max(top, point.y());
    }
    void add(const Box& other) {
        left = std::min(left, other.left);
        right = std::max(right, other.right);
        bottom = std::min(bottom, other.bottom);
        top = std::max(top, other.top);
    }
    bool meets(const Box& other) const {
        return left <= other.right && other.left <= right && bottom <= other.top && other.bottom <= top;
    }
    double distanceTo(QPointF point) const {
        const double across = std::max({left - point.x(), 0.0, point.x() - right});
        const double along = std::max({bottom - point.y(), 0.0, point.y() - top});
        return std::hypot(across, along);
    }
    double width() const { return isEmpty() ? 0 : right - left; }
    double height() const { return isEmpty() ? 0 : top - bottom; }
    QPointF centre() const {
        return isEmpty() ? QPointF() : QPointF(std::midpoint(left, right), std::midpoint(bottom, top));
    }
};

} // namespace kota::hub
