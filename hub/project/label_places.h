#pragma once

#include <QLineF>
#include <QRectF>
#include <QSizeF>

#include <cstddef>
#include <cstdint>
#include <vector>

namespace kota::hub {

// Which places of a picture are taken by lines and by labels, in squares of a few pixels, so that no label
// covers another, however many there are.
class LabelPlaces {
public:
    explicit LabelPlaces(QSizeF size);

    enum class On { Nothing, LinesAtMost };

    // Shorter than a million squares.
    void takeLine(const QLineF& line);
    void take(const QRectF& label);
    // Whether a label lies within the picture and on nothing that it must not cover.
    bool isFree(const QRectF& label, On on = On::Nothing) const;

private:
    enum Use : std::uint8_t { Line = 1, Label = 2 };

    struct Squares {
        std::size_t left, top, right, bottom; // the last ones belong to it
    };
    Squares squaresOf(const QRectF& rect) const;
    std::size_t placeOf(std::size_t column, std::size_t row) const { return row * columns_ + column; }

    QRectF picture_;
    std::size_t columns_;
    std::size_t rows_;
    std::vector<std::uint8_t> uses_;
};

} // namespace kota::hub
