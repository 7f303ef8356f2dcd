#pragma once

#include "hub/project/drawn_stretch.h"
#include "hub/project/label_places.h"

#include <QPainter>

#include <optional>
#include <vector>

namespace kota::hub {

// The first free one of the places of a text beside a point of a stretch: to its right, to its left, and off
// the line to both sides, closer first.
std::optional<QRectF> placeBeside(const DrawnStretch& stretch, double along, QSizeF text,
                                  const LabelPlaces& places, LabelPlaces::On on = LabelPlaces::On::Nothing);

// Names each river beside its line, horizontally, where there is room; the longest in view go first, and one
// name stands once for all reaches. Takes the places of the names.
void paintRiverNames(QPainter& painter, const Network& network, const std::vector<DrawnStretch>& stretches,
                     LabelPlaces& places, const QColor& ground);

} // namespace kota::hub
