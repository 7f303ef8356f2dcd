#pragma once

#include "hub/project/box.h"

#include <QPointF>
#include <QSizeF>

namespace kota::hub {

// Which part of the plane a map shows, and how large: a place on the plane in metres, north up, is a place on
// the screen in pixels from the top left. Some of the area stays in view whatever is done.
class MapViewPort {
public:
    // What there is to see; shows all of it.
    void setArea(const Box& area);
    // Keeps the middle, or all in view where all was shown.
    void resize(QSizeF size);

    // The area as large as it fits, with a margin.
    void showAll();
    bool showsAll() const { return showsAll_; }
    // Moves the map, in pixels to the right and down.
    void pan(QPointF pixels);
    // Makes it larger, with a factor above 1, or smaller about a place on the screen, which keeps what it
    // shows while the limits of size and area allow.
    void zoom(double factor, QPointF about);

    QSizeF size() const { return size_; }
    // In pixels for each metre; greater than 0.
    double scale() const { return scale_; }
    // How many times larger than when all is shown.
    double magnification() const { return scale_ / fittingScale(); }

    QPointF toScreen(QPointF plane) const {
        return {(plane.x() - centre_.x()) * scale_ + size_.width() / 2,
                (centre_.y() - plane.y()) * scale_ + size_.height() / 2};
    }
    QPointF toPlane(QPointF screen) const {
        return {(screen.x() - size_.width() / 2) / scale_ + centre_.x(),
                centre_.y() - (screen.y() - size_.height() / 2) / scale_};
    }
    // What is seen of the plane, with so many pixels around it.
    Box seen(double marginInPixels) const;

private:
    double fittingScale() const;
    void keepInView();

    Box area_;
    QSizeF size_;
    QPointF centre_; // the place on the plane in the middle of the screen
    double scale_ = 1;
    bool showsAll_ = true;
};

} // namespace kota::hub
