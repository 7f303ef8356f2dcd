#include "hub/project/map_painter.h"

#include "hub/project/chainage_marks.h"
#include "hub/project/drawn_stretch.h"
#include "hub/project/map_colours.h"
#include "hub/project/map_labels.h"
#include "hub/project/map_signs.h"

#include <QPainter>

#include <algorithm>
#include <cmath>

namespace kota::hub {

namespace {

constexpr double drawnAround = 8;    // pixels around the view, for the width of the lines
constexpr double few = 60;           // stretches in view do not crowd
constexpr double leastLabelled = 24; // pixels
constexpr double nameSize = 1.1;     // of the font's size
constexpr double markSize = 0.88;

DrawnStretches stretchesInView(const MapScene& scene) {
    return {scene.network, {scene.port, drawnAround, 1 / scene.pixelRatio}};
}

// Those long enough for a name, marks and arrows.
std::vector<DrawnStretch> labelled(const DrawnStretches& stretches) {
    std::vector<DrawnStretch> found;
    for (std::size_t stretch = 0; stretch < stretches.size(); ++stretch)
        if (const DrawnStretch drawn = stretches[stretch]; drawn.length() >= leastLabelled)
            found.push_back(drawn);
    return found;
}

// Wider when the map is larger, and narrower where many lines are in view.
double lineWidth(const MapScene& scene, std::size_t stretches) {
    const double alone = std::clamp(2.2 + 0.7 * std::log2(scene.port.magnification()), 1.4, 6.0);
    const double share = std::sqrt(few / std::max(static_cast<double>(stretches), few));
    return std::max(alone * share, 1.0);
}

// Where corners cannot be seen, they are not rounded, which costs the most.
QPen linePen(const QColor& colour, double width) {
    const bool isThin = width < 2;
    return {colour, width, Qt::SolidLine, isThin ? Qt::FlatCap : Qt::RoundCap,
            isThin ? Qt::BevelJoin : Qt::RoundJoin};
}

// A font given in pixels keeps its size.
QFont sized(QFont font, double share) {
    if (font.pointSizeF() > 0)
        font.setPointSizeF(font.pointSizeF() * share);
    return font;
}

QFont nameFont(const MapScene& scene) {
    QFont font = sized(scene.font, nameSize);
    font.setItalic(true);
    font.setLetterSpacing(QFont::PercentageSpacing, 104);
    return font;
}

// Paints from below to above; what is above has taken its place before.
class MapPainter {
public:
    MapPainter(QPainter& painter, const MapScene& scene)
        : painter_(painter), scene_(scene), colours_(scene.palette), places_(scene.port.size()),
          stretches_(stretchesInView(scene)), labelled_(labelled(stretches_)), scaleBar_(scene) {
        if (scene.picked)
            pin_.emplace(scene, *scene.picked);
        painter.setRenderHint(QPainter::Antialiasing);
    }

    void paint() {
        takePlaces();
        paintLines();
        paintLabels();
        scaleBar_.paint(painter_, colours_);
        if (scene_.current)
            paintCurrent(painter_, scene_.port.toScreen(*scene_.current), colours_);
        if (pin_)
            pin_->paint(painter_, colours_);
    }

private:
    void takePlaces() {
        places_.take(scaleBar_.rect());
        if (pin_) {
            places_.take(pin_->textRect());
            places_.take(pin_->rect());
        }
        if (labelled_.empty())
            return;
        for (std::size_t stretch = 0; stretch < stretches_.size(); ++stretch) {
            const DrawnStretch drawn = stretches_[stretch];
            for (std::size_t point = 1; point < drawn.points.size(); ++point)
                places_.takeLine({drawn.points[point - 1], drawn.points[point]});
        }
    }

    void paintLines() {
        const double width = lineWidth(scene_, stretches_.size());
        painter_.setPen(linePen(colours_.river, width));
        painter_.setBrush(Qt::NoBrush);
        for (std::size_t stretch = 0; stretch < stretches_.size(); ++stretch)
            paintLine(stretches_[stretch]);
        painter_.setPen(Qt::NoPen);
        painter_.setBrush(colours_.riverName);
        for (const DrawnStretch& stretch : labelled_)
            paintArrows(painter_, scene_, stretch, 4 + 0.6 * width);
    }

    void paintLine(const DrawnStretch& stretch) {
        if (stretch.length() > 0)
            painter_.drawPolyline(stretch.points.data(), static_cast<int>(stretch.points.size()));
        else
            painter_.drawEllipse(stretch.points.front(), 1.5, 1.5);
    }

    void paintLabels() {
        painter_.setFont(nameFont(scene_));
        painter_.setPen(colours_.riverName);
        paintRiverNames(painter_, scene_.network, labelled_, places_, colours_.ground);
        painter_.setFont(sized(scene_.font, markSize));
        for (const DrawnStretch& stretch : labelled_)
            paintMarks(painter_, scene_, colours_, stretch, places_);
    }

    QPainter& painter_;
    const MapScene& scene_;
    MapColours colours_;
    LabelPlaces places_;
    DrawnStretches stretches_;
    std::vector<DrawnStretch> labelled_;
    ScaleBar scaleBar_;
    std::optional<Pin> pin_;
};

} // namespace

void paintMap(QPainter& painter, const MapScene& scene) {
    MapPainter(painter, scene).paint();
}

} // namespace kota::hub
