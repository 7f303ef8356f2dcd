#include "hub/project/map_signs.h"

#include "hub/project/project_texts.h"
#include "hub/project/round_step.h"

#include <QFontMetricsF>
#include <QPainterPath>

#include <cmath>

namespace kota::hub {

namespace {

constexpr double edge = 12;     // pixels from the edges of the map
constexpr double longest = 150; // pixels of a scale bar
constexpr double barEnd = 4;    // pixels up from the bar
constexpr double padding = 6;
constexpr double pinHeight = 24;

// The longest round length, in metres, that is not longer than the bar may be.
double roundLength(const MapScene& scene) {
    const double unit = scene.chainages.metresPerUnit;
    const double most = longest / scene.port.scale() / unit;
    const double step = roundStep(most);
    if (step <= most || step == 1)
        return step * unit;
    const double lesser = roundStep(step / 2.6); // the round number before it
    return lesser * unit;
}

} // namespace

ScaleBar::ScaleBar(const MapScene& scene) : font_(scene.font) {
    const double metres = roundLength(scene);
    text_ = scene.chainages.text(metres);
    length_ = metres * scene.port.scale();
    const QFontMetricsF metrics(font_);
    const double width = std::max(length_, metrics.horizontalAdvance(text_)) + 2 * padding;
    const double height = metrics.height() + barEnd + 2 * padding;
    rect_ = QRectF(edge, scene.port.size().height() - edge - height, width, height);
}

void ScaleBar::paint(QPainter& painter, const MapColours& colours) const {
    QColor veil = colours.ground;
    veil.setAlphaF(0.85F);
    painter.setPen(Qt::NoPen);
    painter.setBrush(veil);
    painter.drawRoundedRect(rect_, 4, 4);
    const QRectF inner = rect_.adjusted(padding, padding, -padding, -padding);
    const QPointF up(0, -barEnd);
    const QPointF left = inner.bottomLeft();
    const QPointF right = left + QPointF(length_, 0);
    painter.setBrush(Qt::NoBrush);
    painter.setPen(QPen(colours.text, 1.6, Qt::SolidLine, Qt::FlatCap, Qt::MiterJoin));
    painter.drawPolyline(QPolygonF{left + up, left, right, right + up});
    painter.setFont(font_);
    painter.drawText(inner, Qt::AlignLeft | Qt::AlignTop | Qt::TextDontClip, text_);
}

Pin::Pin(const MapScene& scene, const Location& location)
    : font_(scene.font),
      text_(projectText(ProjectText::Place).arg(location.river, scene.chainages.text(location.chainage))),
      place_(scene.port.toScreen(location.point)) {
    font_.setBold(true);
    const bool hangs = place_.y() < pinHeight + radius + edge;
    head_ = place_ + QPointF(0, hangs ? pinHeight : -pinHeight);
    const QFontMetricsF metrics(font_);
    textRect_.setSize({metrics.horizontalAdvance(text_) + 2 * padding, metrics.height() + padding});
    textRect_.moveCenter(head_);
    textRect_.moveLeft(head_.x() + radius + padding);
    if (textRect_.right() > scene.port.size().width() - padding)
        textRect_.moveRight(head_.x() - radius - padding);
}

void Pin::paint(QPainter& painter, const MapColours& colours) const {
    const double up = head_.y() < place_.y() ? -1 : 1;
    const double shoulder = 0.42 * pinHeight;
    QPainterPath path(place_);
    path.quadTo(place_ + QPointF(-2, up * shoulder * 0.8), head_ + QPointF(-radius, 0));
    path.arcTo(QRectF(head_ - QPointF(radius, radius), head_ + QPointF(radius, radius)), 180, up * 180);
    path.quadTo(place_ + QPointF(2, up * shoulder * 0.8), place_);
    painter.setPen(QPen(colours.ground, 1.5));
    painter.setBrush(colours.pin);
    painter.drawPath(path);
    painter.drawEllipse(place_, 3, 3);
    painter.setBrush(colours.ground);
    painter.setPen(Qt::NoPen);
    painter.drawEllipse(head_, 3, 3);

    painter.setBrush(colours.ground);
    painter.setPen(QPen(colours.pin, 1.2));
    painter.drawRoundedRect(textRect_, 4, 4);
    painter.setFont(font_);
    painter.setPen(colours.text);
    painter.drawText(textRect_, Qt::AlignCenter | Qt::TextDontClip, text_);
}

void paintCurrent(QPainter& painter, QPointF place, const MapColours& colours) {
    painter.setBrush(colours.ground);
    painter.setPen(QPen(colours.ground, 6.5));
    painter.drawEllipse(place, 7, 7);
    painter.setPen(QPen(colours.current, 3));
    painter.drawEllipse(place, 7, 7);
    painter.setPen(Qt::NoPen);
    painter.setBrush(colours.current);
    painter.drawEllipse(place, 3, 3);
}

} // namespace kota::hub
