#include "hub/project/chainage_marks.h"

#include "hub/project/round_step.h"

#include <cmath>

namespace kota::hub {

namespace {

constexpr double leastApart = 64; // pixels between marks
constexpr double tick = 4.5;      // pixels to both sides of the line

// Metres of chainage for so many pixels. A stretch drawn nearly to scale goes by the map's scale, so that
// rivers beside each other have the same step.
double chainageOf(double pixels, const DrawnStretch& stretch, double scale) {
    const double span = std::abs(stretch.chainages.back() - stretch.chainages.front());
    const double own = span / stretch.length();
    const bool isToScale = own * scale > 0.5 && own * scale < 2;
    return pixels * (isToScale ? 1 / scale : own);
}

bool hasMarks(const DrawnStretch& stretch) {
    return stretch.length() > 0 && stretch.chainages.front() != stretch.chainages.back();
}

} // namespace

ChainageMarks::ChainageMarks(const MapScene& scene, const DrawnStretch& stretch)
    : stretch_(stretch), step_(0) {
    const double unit = scene.chainages.metresPerUnit;
    if (hasMarks(stretch))
        step_ = roundStep(chainageOf(leastApart, stretch, scene.port.scale()) / unit) * unit;
}

// The multiples of the step, and so much of a step behind each.
std::vector<double> ChainageMarks::multiples(double shift) const {
    std::vector<double> found;
    if (step_ <= 0)
        return found;
    const auto [least, most] = std::minmax({stretch_.chainages.front(), stretch_.chainages.back()});
    const double first = std::ceil(least / step_ - shift);
    const int count = static_cast<int>(std::floor(most / step_ - shift) - first) + 1;
    for (int number = 0; number < count; ++number)
        found.push_back((first + number + shift) * step_ + 0.0);
    return found;
}

std::vector<double> ChainageMarks::marks() const {
    return multiples(0);
}

std::vector<double> ChainageMarks::arrows() const {
    if (step_ <= 0)
        return {};
    std::vector<double> arrows;
    for (const double chainage : multiples(0.5))
        arrows.push_back(stretch_.lengthAt(chainage));
    if (arrows.empty())
        arrows.push_back(stretch_.length() / 2);
    return arrows;
}

void paintArrows(QPainter& painter, const MapScene& scene, const DrawnStretch& stretch, double size) {
    for (const double along : ChainageMarks(scene, stretch).arrows()) {
        const QPointF ahead = stretch.directionAt(along) * (stretch.isFalling() ? -size : size);
        const QPointF aside(-ahead.y() * 0.62, ahead.x() * 0.62);
        const QPointF place = stretch.pointAt(along);
        painter.drawPolygon(QPolygonF{place + ahead, place - ahead * 0.8 + aside, place - ahead * 0.35,
                                      place - ahead * 0.8 - aside});
    }
}

void paintMarks(QPainter& painter, const MapScene& scene, const MapColours& colours,
                const DrawnStretch& stretch, LabelPlaces& places) {
    const QFontMetricsF metrics(painter.font());
    for (const double chainage : ChainageMarks(scene, stretch).marks()) {
        const double along = stretch.lengthAt(chainage);
        const QPointF place = stretch.pointAt(along);
        const QPointF direction = stretch.directionAt(along);
        const QPointF aside(-direction.y(), direction.x());
        painter.setPen(QPen(colours.mark, 1.2));
        painter.drawLine(place - aside * tick, place + aside * tick);
        painter.setPen(colours.markText);
        const QString text = scene.chainages.text(chainage);
        const QSizeF size(metrics.horizontalAdvance(text) + 2, metrics.height());
        if (const std::optional<QRectF> rect = placeBeside(stretch, along, size, places)) {
            writeLabel(painter, metrics, *rect, text);
            places.take(*rect);
        }
    }
}

} // namespace kota::hub
