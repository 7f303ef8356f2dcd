#include "hub/project/map_painter.h"

#include "hub/project/chainage_marks.h"
#include "hub/project/drawn_stretch.h"
#include "hub/project/map_colours.h"
#include "hub/project/map_labels.h"
#include "hub/project/map_signs.h"

#include <QPainter>

#include <cmath>

namespace kota::hub {

namespace {

constexpr double drawnAround = 8;    // pixels around the view, for the width of the lines
constexpr std::size_t crowd = 1'500; // from so many stretches in view on, they are drawn as thin as can be
constexpr double smallText = 0.88;

std::vector<DrawnStretch> stretchesInView(const MapScene& scene) {
    const Drawing drawing{scene.port, drawnAround, 1 / scene.pixelRatio};
    const Box seen = scene.port.seen(drawnAround);
    std::vector<DrawnStretch> stretches;
    for (std::size_t river = 0; river < scene.network.rivers().size(); ++river)
        if (scene.network.indexOf(river).bounds().meets(seen))
            addStretches(scene.network, river, drawing, stretches);
    return stretches;
}

double lineWidth(const MapScene& scene, std::size_t stretches) {
    if (stretches > crowd)
        return 1;
    return std::clamp(2.2 + 0.7 * std::log2(scene.port.magnification()), 1.4, 6.0);
}

QFont nameFont(const MapScene& scene) {
    QFont font = scene.font;
    font.setItalic(true);
    font.setLetterSpacing(QFont::PercentageSpacing, 104);
    return font;
}

QFont markFont(const MapScene& scene) {
    QFont font = scene.font;
    if (font.pointSizeF() > 0)
        font.setPointSizeF(font.pointSizeF() * smallText);
    return font;
}

// Paints from below to above; what is above has taken its place before.
class MapPainter {
public:
    MapPainter(QPainter& painter, const MapScene& scene)
        : painter_(painter), scene_(scene), colours_(scene.palette), places_(scene.port.size()),
          stretches_(stretchesInView(scene)), scaleBar_(scene) {
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
        for (const DrawnStretch& stretch : stretches_)
            for (qsizetype point = 1; point < stretch.points.size(); ++point)
                places_.takeLine({stretch.points[point - 1], stretch.points[point]});
    }

    void paintLines() {
        const double width = lineWidth(scene_, stretches_.size());
        painter_.setPen(QPen(colours_.river, width, Qt::SolidLine, Qt::RoundCap, Qt::RoundJoin));
        for (const DrawnStretch& stretch : stretches_)
            paintLine(stretch);
        painter_.setPen(Qt::NoPen);
        painter_.setBrush(colours_.riverName);
        for (const DrawnStretch& stretch : stretches_)
            paintArrows(painter_, scene_, stretch, 4 + 0.6 * width);
    }

    void paintLine(const DrawnStretch& stretch) {
        if (stretch.length() > 0)
            painter_.drawPolyline(stretch.points);
        else
            painter_.drawPoint(stretch.points.constFirst());
    }

    void paintLabels() {
        painter_.setFont(nameFont(scene_));
        painter_.setPen(colours_.riverName);
        paintRiverNames(painter_, scene_.network, stretches_, places_, colours_.ground);
        painter_.setFont(markFont(scene_));
        for (const DrawnStretch& stretch : stretches_)
            paintMarks(painter_, scene_, colours_, stretch, places_);
    }

    QPainter& painter_;
    const MapScene& scene_;
    MapColours colours_;
    LabelPlaces places_;
    std::vector<DrawnStretch> stretches_;
    ScaleBar scaleBar_;
    std::optional<Pin> pin_;
};

} // namespace

void paintMap(QPainter& painter, const MapScene& scene) {
    MapPainter(painter, scene).paint();
}

} // namespace kota::hub
