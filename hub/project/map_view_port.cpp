#include "hub/project/map_view_port.h"

namespace kota::hub {

namespace {

constexpr double margin = 44;       // pixels around all that is shown
constexpr double staying = 40;      // pixels of the area that cannot be moved out of view
constexpr double largestScale = 10; // pixels for each metre
constexpr double smallestOfFitting = 0.5;

} // namespace

void MapViewPort::setArea(const Box& area) {
    area_ = area;
    showAll();
}

void MapViewPort::resize(QSizeF size) {
    size_ = size;
    if (showsAll_)
        showAll();
    keepInView();
}

double MapViewPort::fittingScale() const {
    const double width = std::max(size_.width() - 2 * margin, 1.0);
    const double height = std::max(size_.height() - 2 * margin, 1.0);
    const double scale =
        std::min(width / std::max(area_.width(), 1.0), height / std::max(area_.height(), 1.0));
    return std::min(scale, largestScale);
}

void MapViewPort::showAll() {
    scale_ = fittingScale();
    centre_ = area_.centre();
    showsAll_ = true;
}

void MapViewPort::pan(QPointF pixels) {
    centre_ += QPointF(-pixels.x(), pixels.y()) / scale_;
    showsAll_ = false;
    keepInView();
}

void MapViewPort::zoom(double factor, QPointF about) {
    const QPointF kept = toPlane(about);
    scale_ = std::clamp(scale_ * factor, fittingScale() * smallestOfFitting, largestScale);
    centre_ += kept - toPlane(about);
    showsAll_ = false;
    keepInView();
}

Box MapViewPort::seen(double marginInPixels) const {
    Box box;
    box.add(toPlane({-marginInPixels, -marginInPixels}));
    box.add(toPlane({size_.width() + marginInPixels, size_.height() + marginInPixels}));
    return box;
}

void MapViewPort::keepInView() {
    if (area_.isEmpty())
        return;
    const double across = std::max(size_.width() / 2 - staying, 0.0) / scale_;
    const double along = std::max(size_.height() / 2 - staying, 0.0) / scale_;
    centre_ = {std::clamp(centre_.x(), area_.left - across, area_.right + across),
               std::clamp(centre_.y(), area_.bottom - along, area_.top + along)};
}

} // namespace kota::hub
