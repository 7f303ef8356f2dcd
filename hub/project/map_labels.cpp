#include "hub/project/map_labels.h"

#include <QSet>

#include <algorithm>
#include <array>

namespace kota::hub {

namespace {

constexpr double leastNamed = 24;             // pixels of a river in view
constexpr std::size_t mostNamed = 250;        // names are tried
constexpr std::array distances = {7.0, 13.0}; // pixels from a line

constexpr double roomBehindName = 18; // pixels, where there are other places

// Where on its river a name is tried, in this order.
constexpr std::array shares = {0.5, 0.38, 0.62, 0.26, 0.74, 0.14, 0.86};

std::vector<const DrawnStretch*> longestFirst(const std::vector<DrawnStretch>& stretches) {
    std::vector<const DrawnStretch*> longest;
    for (const DrawnStretch& stretch : stretches)
        if (stretch.length() >= leastNamed)
            longest.push_back(&stretch);
    std::ranges::stable_sort(longest, [](const DrawnStretch* left, const DrawnStretch* right) {
        return left->length() > right->length();
    });
    if (longest.size() > mostNamed)
        longest.resize(mostNamed);
    return longest;
}

std::optional<QRectF> placeOf(QSizeF name, const DrawnStretch& stretch, const LabelPlaces& places,
                              LabelNeeds needs) {
    for (const double share : shares)
        if (const std::optional<QRectF> rect =
                placeBeside(stretch, share * stretch.length(), name, places, needs))
            return rect;
    return std::nullopt;
}

// The rectangle for a text beside a place, so many pixels off it to one side.
QRectF besideOf(QPointF place, QPointF towards, double distance, QSizeF size) {
    const double reach =
        distance + std::abs(towards.x()) * size.width() / 2 + std::abs(towards.y()) * size.height() / 2;
    QRectF rect(QPointF(), size);
    rect.moveCenter(place + towards * reach);
    return rect;
}

void paintEdge(QPainter& painter, const QFontMetricsF& metrics, const QRectF& rect, const QString& text,
               const QColor& ground) {
    const QPen pen = painter.pen();
    painter.setPen(ground);
    for (const QPointF shift : {QPointF(-1, -1), QPointF(1, -1), QPointF(-1, 1), QPointF(1, 1)})
        writeLabel(painter, metrics, rect.translated(shift), text);
    painter.setPen(pen);
}

} // namespace

std::optional<QRectF> placeBeside(const DrawnStretch& stretch, double along, QSizeF text,
                                  const LabelPlaces& places, LabelNeeds needs) {
    const QPointF place = stretch.pointAt(along);
    const QPointF direction = stretch.directionAt(along);
    const QPointF right(-direction.y(), direction.x());
    for (const QPointF side : {QPointF(1, 0), right})
        for (const double distance : distances)
            for (const QPointF towards : {side, -side}) {
                const QRectF rect = besideOf(place, towards, distance, text);
                if (places.isFree(rect.united(rect.translated(towards * needs.behind)), needs.on))
                    return rect;
            }
    return std::nullopt;
}

void writeLabel(QPainter& painter, const QFontMetricsF& metrics, const QRectF& rect, const QString& text) {
    painter.drawText(rect.topLeft() + QPointF(1, metrics.ascent()), text);
}

void paintRiverNames(QPainter& painter, const Network& network, const std::vector<DrawnStretch>& stretches,
                     LabelPlaces& places, const QColor& ground) {
    const QFontMetricsF metrics(painter.font());
    QSet<QString> named;
    for (const DrawnStretch* stretch : longestFirst(stretches)) {
        const QString& name = network.rivers()[stretch->river].name;
        if (named.contains(name))
            continue;
        const QSizeF size(metrics.horizontalAdvance(name) + 2, metrics.height());
        std::optional<QRectF> rect = placeOf(size, *stretch, places, {.behind = roomBehindName});
        if (!rect)
            rect = placeOf(size, *stretch, places, {});
        if (!rect && stretch->length() > size.width()) {
            rect = placeOf(size, *stretch, places, {.on = LabelPlaces::On::LinesAtMost});
            if (rect)
                paintEdge(painter, metrics, *rect, name, ground);
        }
        if (!rect)
            continue;
        writeLabel(painter, metrics, *rect, name);
        places.take(*rect);
        named.insert(name);
    }
}

} // namespace kota::hub
