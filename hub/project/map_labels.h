#pragma once

#include "hub/project/drawn_stretch.h"
#include "hub/project/label_places.h"

#include <QFontMetricsF>
#include <QPainter>

#include <optional>
#include <vector>

namespace kota::hub {

// What a label needs: nothing below it, or lines at most, and so many pixels of the same behind it, seen from
// its place, so that it does not seem to belong to another line.
struct LabelNeeds {
    LabelPlaces::On on = LabelPlaces::On::Nothing;
    double behind = 0;
};

// The first place for a text beside a point of a stretch that has what it needs: to the right or the left of
// the point, else off the line to one of its sides.
std::optional<QRectF> placeBeside(const DrawnStretch& stretch, double along, QSizeF text,
                                  const LabelPlaces& places, LabelNeeds needs = {});

// Writes a text into a rectangle of its size, with the painter's font, whose metrics are given.
void writeLabel(QPainter& painter, const QFontMetricsF& metrics, const QRectF& rect, const QString& text);

// Names each river beside its line, horizontally, where there is room; the longest in view go first, and one
// name stands once for all reaches. Takes the places of the names.
void paintRiverNames(QPainter& painter, const Network& network, const std::vector<DrawnStretch>& stretches,
                     LabelPlaces& places, const QColor& ground);

} // namespace kota::hub
