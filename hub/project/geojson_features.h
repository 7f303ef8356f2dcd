#pragma once

#include "hub/project/chainage_pins.h"
#include "hub/project/json_place.h"

#include <optional>
#include <vector>

namespace kota::hub {

// Reads the features of a GeoJSON document, whose form `geojson.h` tells, as rivers on the plane.
class GeoJsonFeatures {
public:
    // The document must outlive its reading.
    explicit GeoJsonFeatures(const JsonPlace& root) : root_(root) {}

    // Throws a JsonMisfit, whose place counts from the feature that is being read, else from the document's
    // root.
    std::vector<River> read();

    // The feature that is being read, in the user's words; empty before and after.
    QString current() const;

private:
    enum class Coordinates { Unknown, Degrees, Metres };

    void readCoordinateSystem();
    void readAll();
    void readFeature(const JsonPlace& feature);
    void readGeometry(const JsonPlace& geometry, PinnedLine& line) const;
    std::vector<QPointF> readLine(const JsonPlace& coordinates) const;
    QPointF readPoint(const JsonPlace& x, const JsonPlace& y) const;
    void readWayPoints(const JsonPlace& wayPoints, PinnedLine& line) const;
    bool areDegrees() const;
    std::vector<River> chained();

    const JsonPlace& root_;
    Coordinates coordinates_ = Coordinates::Unknown;
    std::vector<PinnedLine> lines_; // one for each feature
    std::size_t number_ = 0;        // of the current feature, from 1; 0 for none
    QString name_;                  // its river's
};

} // namespace kota::hub
