#pragma once

#include "hub/project/drawn_stretch.h"
#include "hub/project/label_places.h"

#include <QPainter>

#include <optional>
#include <vector>

namespace kota::hub {

// A text beside a place, in a colour of its own; an edge in the colour of the ground keeps it readable on
// lines.
void paintLabel(QPainter& painter, const QRectF& rect, const QString& text, const QColor& ground);

// The rectangle for a text of a size beside a place, `distance` pixels off it to one side.
QRectF besideOf(QPointF place, QPointF towards, double distance, QSizeF size);

// Names each river beside its line, horizontally, where there is room; the longest in view go first, and one
// name stands once for all reaches. Takes the places of the names.
void paintRiverNames(QPainter& painter, const Network& network, const std::vector<DrawnStretch>& stretches,
                     LabelPlaces& places, const QColor& ground);

} // namespace kota::hub
