#include "hub/project/label_places.h"

#include <algorithm>

namespace kota::hub {

namespace {

constexpr double square = 4; // pixels

std::size_t squaresIn(double length) {
    return static_cast<std::size_t>(std::max(length, 0.0) / square) + 1;
}

} // namespace

LabelPlaces::LabelPlaces(QSizeF size)
    : picture_(QPointF(), size), columns_(squaresIn(size.width())), rows_(squaresIn(size.height())),
      uses_(columns_ * rows_) {}

LabelPlaces::Squares LabelPlaces::squaresOf(const QRectF& rect) const {
    const auto within = [](double pixel, std::size_t count) {
        return static_cast<std::size_t>(std::clamp(pixel / square, 0.0, static_cast<double>(count - 1)));
    };
    return {within(rect.left(), columns_), within(rect.top(), rows_), within(rect.right(), columns_),
            within(rect.bottom(), rows_)};
}

void LabelPlaces::takeLine(const QLineF& line) {
    const int steps = static_cast<int>(line.length() / square) + 1;
    for (int step = 0; step <= steps; ++step) {
        const QPointF point = line.pointAt(static_cast<double>(step) / steps);
        if (!picture_.contains(point))
            continue;
        const Squares there = squaresOf({point, point});
        uses_[placeOf(there.left, there.top)] |= Line;
    }
}

void LabelPlaces::take(const QRectF& label) {
    const Squares squares = squaresOf(label);
    for (std::size_t row = squares.top; row <= squares.bottom; ++row)
        for (std::size_t column = squares.left; column <= squares.right; ++column)
            uses_[placeOf(column, row)] |= Label;
}

bool LabelPlaces::isFree(const QRectF& label, On on) const {
    if (!picture_.contains(label))
        return false;
    const int barred = on == On::Nothing ? Line | Label : Label;
    const Squares squares = squaresOf(label);
    for (std::size_t row = squares.top; row <= squares.bottom; ++row)
        for (std::size_t column = squares.left; column <= squares.right; ++column)
            if ((uses_[placeOf(column, row)] & barred) != 0)
                return false;
    return true;
}

} // namespace kota::hub
