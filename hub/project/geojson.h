#pragma once

#include "hub/project/network.h"

#include <QByteArray>
#include <QString>

#include <memory>

namespace kota::hub {

// What came of reading a network: the network, or why there is none, in the user's words and with the place.
struct NetworkReading {
    std::shared_ptr<const Network> network; // null when there is an error
    QString error;
};

// Reads a river network from a GeoJSON file: a Feature or a FeatureCollection, each feature a LineString or a
// MultiLineString that is a river, or one of several reaches of the same name. Its properties:
//
//   river           its name ("name" is read where there is no "river")
//   chainage_start  the chainage of its first vertex in metres
//   chainage_end    that of its last vertex, which may be the lesser one
//   way_points      optional: places with a known chainage in between, each {"chainage", "longitude",
//   "latitude"}, or
//                   {"chainage", "x", "y"}; taken to the nearest place of the line
//
// The parts of a MultiLineString share the span of chainages by their lengths. Other properties and members
// are not read. Any other geometry, and a feature without one of the three, is an error: nothing is left out
// silently.
//
// Coordinates are degrees of longitude and latitude when a "crs" member says so, or when there is none and
// all lie within 360 and 90; else metres to the east and north. All numbers are from -1e9 to 1e9.
NetworkReading readNetwork(const QString& path);

// The same from the bytes of a file, whose name is for the error's text.
NetworkReading networkFromGeoJson(const QByteArray& bytes, const QString& fileName);

} // namespace kota::hub
