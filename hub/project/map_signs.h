#pragma once

#include "hub/project/label_places.h"
#include "hub/project/map_colours.h"
#include "hub/project/map_scene.h"

#include <QPainter>

namespace kota::hub {

// What stands on a map above its rivers. Each takes its place before others are laid out, and is painted
// after them.

// A line of a round length with that length, in the corner below on the left.
class ScaleBar {
public:
    explicit ScaleBar(const MapScene& scene);

    const QRectF& rect() const { return rect_; }
    void paint(QPainter& painter, const MapColours& colours) const;

private:
    QFont font_;
    QString text_;
    double length_ = 0; // pixels
    QRectF rect_;
};

// The picked location: a pin whose tip is the place, with the river's name and the chainage. It stands upside
// down, and its text to the left, where there is no room for it otherwise.
class Pin {
public:
    Pin(const MapScene& scene, const Location& location);

    const QRectF& textRect() const { return textRect_; }
    QRectF rect() const {
        return QRectF(place_, head_).normalized().adjusted(-radius, -radius, radius, radius);
    }
    void paint(QPainter& painter, const MapColours& colours) const;

private:
    static constexpr double radius = 8; // of the head, in pixels

    QFont font_;
    QString text_;
    QPointF place_;
    QPointF head_;
    QRectF textRect_;
};

// The current location of the editor: a ring around the place.
void paintCurrent(QPainter& painter, QPointF place, const MapColours& colours);

} // namespace kota::hub
