#pragma once

#include "hub/project/map_colours.h"
#include "hub/project/map_labels.h"
#include "hub/project/map_scene.h"

#include <vector>

namespace kota::hub {

// Marks a river at round chainages and points, between them, to where chainages rise. The marks stand so far
// apart that they do not crowd, at whatever scale and chainages.
class ChainageMarks {
public:
    // How far apart marks stand at the scene's scale; a stretch whose chainages differ much from its drawn
    // length gets a step of its own.
    ChainageMarks(const MapScene& scene, const DrawnStretch& stretch);

    // In metres, those of the stretch, from the least on.
    std::vector<double> marks() const;
    // The lengths along the stretch where arrows stand; one in the middle where there would be none.
    std::vector<double> arrows() const;

private:
    std::vector<double> multiples(double shift) const;

    const DrawnStretch& stretch_;
    double step_; // metres of chainage; 0 for no marks
};

void paintArrows(QPainter& painter, const MapScene& scene, const DrawnStretch& stretch, double size);
// The ticks, and their chainages where there is room for them.
void paintMarks(QPainter& painter, const MapScene& scene, const MapColours& colours,
                const DrawnStretch& stretch, LabelPlaces& places);

} // namespace kota::hub
