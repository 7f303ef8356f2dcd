#include "hub/project/label_places.h"

#include <algorithm>
#include <cmath>

namespace kota::hub {

namespace {

constexpr double square = 4; // pixels

int squaresIn(double length) {
    return static_cast<int>(length / square) + 1;
}

} // namespace

LabelPlaces::LabelPlaces(QSizeF size)
    : picture_(QPointF(), size), columns_(squaresIn(size.width())), rows_(squaresIn(size.height())),
      uses_(static_cast<std::size_t>(columns_) * static_cast<std::size_t>(rows_)) {}

LabelPlaces::Squares LabelPlaces::squaresOf(const QRectF& rect) const {
    const auto within = [](double pixel, int count) {
        return static_cast<int>(std::clamp(std::floor(pixel / square), 0.0, count - 1.0));
    };
    return {within(rect.left(), columns_), within(rect.top(), rows_), within(rect.right(), columns_),
            within(rect.bottom(), rows_)};
}

void LabelPlaces::takeLine(const QLineF& line) {
    const double steps = std::max(std::ceil(line.length() / square), 1.0);
    for (double step = 0; step <= steps; ++step) {
        const QPointF point = line.pointAt(step / steps);
        if (!picture_.contains(point))
            continue;
        const Squares there = squaresOf({point, point});
        at(there.left, there.top) |= Line;
    }
}

void LabelPlaces::take(const QRectF& label) {
    const Squares squares = squaresOf(label);
    for (int row = squares.top; row <= squares.bottom; ++row)
        for (int column = squares.left; column <= squares.right; ++column)
            at(column, row) |= Label;
}

bool LabelPlaces::isFree(const QRectF& label, On on) const {
    if (!picture_.contains(label))
        return false;
    const int barred = on == On::Nothing ? Line | Label : Label;
    const Squares squares = squaresOf(label);
    for (int row = squares.top; row <= squares.bottom; ++row)
        for (int column = squares.left; column <= squares.right; ++column)
            if ((uses_[static_cast<std::size_t>(row * columns_ + column)] & barred) != 0)
                return false;
    return true;
}

} // namespace kota::hub
