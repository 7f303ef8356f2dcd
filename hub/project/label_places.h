#pragma once

#include <QLineF>
#include <QRectF>
#include <QSizeF>

#include <cstdint>
#include <vector>

namespace kota::hub {

// Which places of a picture are taken by lines and by labels, in squares of a few pixels, so that no label
// covers another, however many there are.
class LabelPlaces {
public:
    explicit LabelPlaces(QSizeF size);

    enum class On { Nothing, LinesAtMost };

    void takeLine(const QLineF& line);
    void take(const QRectF& label);
    // Whether a label lies within the picture and on nothing that it must not cover.
    bool isFree(const QRectF& label, On on = On::Nothing) const;

private:
    enum Use : std::uint8_t { Line = 1, Label = 2 };

    struct Squares {
        int left, top, right, bottom; // the last ones belong to it
    };
    Squares squaresOf(const QRectF& rect) const;
    std::uint8_t& at(int column, int row) { return uses_[static_cast<std::size_t>(row * columns_ + column)]; }

    QRectF picture_;
    int columns_;
    int rows_;
    std::vector<std::uint8_t> uses_;
};

} // namespace kota::hub
