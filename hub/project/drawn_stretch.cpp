#include "hub/project/drawn_stretch.h"

#include <QRectF>

#include <functional>

namespace kota::hub {

namespace {

constexpr double directionReach = 5; // pixels to both sides of a place

// What of a segment lies in a rectangle: from a part of its length to another.
struct Cut {
    double from = 0;
    double to = 1;
};

// Narrows a cut to where the segment is on the inner side of an edge. `outside` is how far its first end lies
// outside, `inwards` how much farther inside its second end lies.
bool narrow(Cut& cut, double outside, double inwards) {
    if (inwards == 0)
        return outside <= 0;
    const double part = outside / inwards;
    if (inwards > 0)
        cut.from = std::max(cut.from, part);
    else
        cut.to = std::min(cut.to, part);
    return cut.from <= cut.to;
}

bool cutOff(Cut& cut, QPointF first, QPointF second, const QRectF& rect) {
    const QPointF step = second - first;
    return narrow(cut, rect.left() - first.x(), step.x()) &&
           narrow(cut, first.x() - rect.right(), -step.x()) &&
           narrow(cut, rect.top() - first.y(), step.y()) && narrow(cut, first.y() - rect.bottom(), -step.y());
}

QPointF between(QPointF first, QPointF second, double part) {
    return {std::lerp(first.x(), second.x(), part), std::lerp(first.y(), second.y(), part)};
}

// The second of the two values between which one lies in a rising or falling row.
template <typename Before>
std::size_t behind(std::span<const double> row, double value, Before isBefore) {
    const auto found = std::lower_bound(row.begin() + 1, row.end() - 1, value, isBefore);
    return static_cast<std::size_t>(found - row.begin());
}

double partOf(double from, double to, double value) {
    return to == from ? 0 : std::clamp((value - from) / (to - from), 0.0, 1.0);
}

} // namespace

// Puts the stretches of one river together, segment by segment.
class Stretcher {
public:
    Stretcher(const Network& network, std::size_t place, const Drawing& drawing, DrawnStretches& stretches)
        : river_(network.rivers()[place]), place_(place), drawing_(drawing), to_(stretches) {
        const QSizeF size = drawing.port.size();
        const double margin = drawing.margin;
        view_ = QRectF(-margin, -margin, size.width() + 2 * margin, size.height() + 2 * margin);
    }

    void add(std::size_t first, std::size_t end) {
        if (first != next_)
            finish();
        QPointF from = drawing_.port.toScreen(river_.vertices[first]);
        for (std::size_t segment = first; segment < end; ++segment) {
            const QPointF to = drawing_.port.toScreen(river_.vertices[segment + 1]);
            addSegment(segment, from, to);
            from = to;
        }
        next_ = end;
    }

    void finish() {
        if (isOpen_)
            keepLast();
        isOpen_ = false;
    }

private:
    void addSegment(std::size_t segment, QPointF from, QPointF to) {
        Cut cut;
        if (!cutOff(cut, from, to, view_))
            return finish();
        if (cut.from > 0)
            finish();
        if (!isOpen_)
            open(between(from, to, cut.from), chainageAt(segment, cut.from));
        extend(between(from, to, cut.to), chainageAt(segment, cut.to));
        if (cut.to < 1)
            finish();
    }
    double chainageAt(std::size_t segment, double part) const {
        return std::lerp(river_.chainages[segment], river_.chainages[segment + 1], part);
    }

    void open(QPointF point, double chainage) {
        isOpen_ = true;
        to_.beginnings_.push_back({place_, to_.points_.size()});
        keep(point, chainage, 0);
        last_ = point;
        lastChainage_ = chainage;
    }
    void extend(QPointF point, double chainage) {
        last_ = point;
        lastChainage_ = chainage;
        if ((point - to_.points_.back()).manhattanLength() >= drawing_.closest)
            keepLast();
    }
    void keepLast() {
        const QPointF step = last_ - to_.points_.back();
        const bool isAlone = to_.points_.size() == to_.beginnings_.back().point + 1;
        if (isAlone || !step.isNull())
            keep(last_, lastChainage_, to_.along_.back() + std::sqrt(QPointF::dotProduct(step, step)));
        else
            to_.chainages_.back() = lastChainage_;
    }
    void keep(QPointF point, double chainage, double along) {
        to_.points_.push_back(point);
        to_.chainages_.push_back(chainage);
        to_.along_.push_back(along);
    }

    const River& river_;
    std::size_t place_;
    const Drawing& drawing_;
    DrawnStretches& to_;
    QRectF view_;
    std::size_t next_ = 0; // the segment behind the last one
    bool isOpen_ = false;
    QPointF last_; // of the open stretch; kept already, or too close to the one before it
    double lastChainage_ = 0;
};

QPointF DrawnStretch::pointAt(double length) const {
    const std::size_t second = behind(along, length, std::less<>());
    return between(points[second - 1], points[second], partOf(along[second - 1], along[second], length));
}

QPointF DrawnStretch::directionAt(double length) const {
    const QPointF step = pointAt(length + directionReach) - pointAt(length - directionReach);
    const double reach = std::hypot(step.x(), step.y());
    return reach > 0 ? step / reach : QPointF();
}

double DrawnStretch::lengthAt(double chainage) const {
    const std::size_t second = isFalling() ? behind(chainages, chainage, std::greater<>())
                                           : behind(chainages, chainage, std::less<>());
    return std::lerp(along[second - 1], along[second],
                     partOf(chainages[second - 1], chainages[second], chainage));
}

DrawnStretches::DrawnStretches(const Network& network, const Drawing& drawing) {
    const Box seen = drawing.port.seen(drawing.margin);
    for (std::size_t river = 0; river < network.rivers().size(); ++river) {
        Stretcher stretcher(network, river, drawing, *this);
        network.indexOf(river).stretchesIn(
            seen, [&stretcher](std::size_t first, std::size_t end) { stretcher.add(first, end); });
        stretcher.finish();
    }
}

DrawnStretch DrawnStretches::operator[](std::size_t stretch) const {
    const std::size_t first = beginnings_[stretch].point;
    const std::size_t end = stretch + 1 < size() ? beginnings_[stretch + 1].point : points_.size();
    const std::size_t count = end - first;
    return {beginnings_[stretch].river, std::span(points_).subspan(first, count),
            std::span(chainages_).subspan(first, count), std::span(along_).subspan(first, count)};
}

} // namespace kota::hub
