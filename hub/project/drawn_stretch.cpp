#include "hub/project/drawn_stretch.h"

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

// Puts the stretches of one river together, segment by segment.
class Stretcher {
public:
    Stretcher(const River& river, std::size_t place, const Drawing& drawing,
              std::vector<DrawnStretch>& stretches)
        : river_(river), place_(place), drawing_(drawing), stretches_(stretches) {
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
        stretches_.push_back({place_, {point}, {chainage}, {0}});
        last_ = point;
        lastChainage_ = chainage;
    }
    void extend(QPointF point, double chainage) {
        last_ = point;
        lastChainage_ = chainage;
        if ((point - stretches_.back().points.constLast()).manhattanLength() >= drawing_.closest)
            keepLast();
    }
    void keepLast() {
        DrawnStretch& stretch = stretches_.back();
        const QPointF step = last_ - stretch.points.constLast();
        const bool isThere = stretch.points.size() > 1 && step.isNull();
        if (isThere) {
            stretch.chainages.back() = lastChainage_;
            return;
        }
        stretch.points.append(last_);
        stretch.chainages.push_back(lastChainage_);
        stretch.along.push_back(stretch.along.back() + std::hypot(step.x(), step.y()));
    }

    const River& river_;
    std::size_t place_;
    const Drawing& drawing_;
    std::vector<DrawnStretch>& stretches_;
    QRectF view_;
    std::size_t next_ = 0; // the segment behind the last one
    bool isOpen_ = false;
    QPointF last_; // of the open stretch; kept already, or too close to the one before it
    double lastChainage_ = 0;
};

// The second of the two values between which one lies in a rising or falling row.
template <typename Before>
std::size_t behind(const std::vector<double>& row, double value, Before isBefore) {
    const auto found = std::lower_bound(row.begin() + 1, row.end() - 1, value, isBefore);
    return static_cast<std::size_t>(found - row.begin());
}

double partOf(double from, double to, double value) {
    return to == from ? 0 : std::clamp((value - from) / (to - from), 0.0, 1.0);
}

} // namespace

QPointF DrawnStretch::pointAt(double length) const {
    const std::size_t second = behind(along, length, std::less<>());
    return between(points[static_cast<qsizetype>(second) - 1], points[static_cast<qsizetype>(second)],
                   partOf(along[second - 1], along[second], length));
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

void addStretches(const Network& network, std::size_t river, const Drawing& drawing,
                  std::vector<DrawnStretch>& stretches) {
    Stretcher stretcher(network.rivers()[river], river, drawing, stretches);
    network.indexOf(river).stretchesIn(
        drawing.port.seen(drawing.margin),
        [&stretcher](std::size_t first, std::size_t end) { stretcher.add(first, end); });
    stretcher.finish();
}

} // namespace kota::hub
