#include "hub/project/geojson.h"
#include "tests/hub/project/printed.h"

#include <QFile>
#include <QTemporaryDir>

#include <rapidcheck/gtest.h>

namespace {

using kota::hub::networkFromGeoJson;
using testing::StartsWith;

struct Broken {
    const char* name;
    const char* json;
    const char* error; // how it begins
};

void PrintTo(const Broken& broken, std::ostream* out) {
    *out << broken.json;
}

// A feature "PLATTE" with given properties, behind a sound one.
#define SECOND_FEATURE(PROPERTIES, GEOMETRY)                                                                 \
    R"({"type": "FeatureCollection", "features": [{"type": "Feature", "properties": {"river": "A", )"        \
    R"("chainage_start": 0, "chainage_end": 1}, "geometry": {"type": "LineString", "coordinates": )"         \
    R"([[1, 2], [3, 4]]}}, {"type": "Feature", "properties": )" PROPERTIES R"(, "geometry": )" GEOMETRY      \
    "}]}"
#define SPAN R"("chainage_start": 0, "chainage_end": 100)"
#define PLATTE R"({"river": "PLATTE", )" SPAN "}"
#define LINE R"({"type": "LineString", "coordinates": [[1, 2], [3, 4]]})"
#define LINE_OF(COORDINATES) R"({"type": "LineString", "coordinates": )" COORDINATES "}"
#define WAY_POINTS(LIST)                                                                                     \
    R"({"river": "PLATTE", "chainage_start": 0, "chainage_end": 100, "way_points": )" LIST "}"

constexpr Broken brokenOnes[] = {
    {"Empty", "", "n.geojson:1:1: valid JSON was expected ("},
    {"Cut", "{\n  \"type\":", "n.geojson:2:10: valid JSON was expected ("},
    {"Nan", "{\"type\": NaN}", "n.geojson:1:10: valid JSON was expected ("},
    {"Umlauts", "{\"äöü\": x}", "n.geojson:1:9: valid JSON was expected ("},
    {"List", "[]", "n.geojson: an object was expected, and an empty list stands there"},
    {"Nothing", "{}", "n.geojson: type: a text was expected, and nothing stands there"},
    {"Geometry", LINE,
     "n.geojson: type: FeatureCollection or Feature was expected, and 'LineString' stands there"},
    {"NoFeatures", R"({"type": "FeatureCollection"})",
     "n.geojson: features: a list was expected, and nothing stands there"},
    {"EmptyFeatures", R"({"type": "FeatureCollection", "features": []})",
     "n.geojson: features: a list of at least one feature was expected, and an empty list stands there"},
    {"NullFeature", R"({"type": "FeatureCollection", "features": [null]})",
     "n.geojson: feature 1: an object was expected, and null stands there"},
    {"NoProperties", SECOND_FEATURE("null", LINE),
     "n.geojson: feature 2: properties: an object was expected, and null stands there"},
    {"NoName", SECOND_FEATURE("{" SPAN "}", LINE),
     "n.geojson: feature 2: properties.river: a text was expected, and nothing stands there"},
    {"NumberAsName", SECOND_FEATURE(R"({"river": 12.5, "name": "N", )" SPAN "}", LINE),
     "n.geojson: feature 2: properties.river: a text was expected, and 12.5 stands there"},
    {"BlankName", SECOND_FEATURE(R"({"name": "  ", )" SPAN "}", LINE),
     "n.geojson: feature 2: properties.name: a text was expected, and '' stands there"},
    {"NoStart", SECOND_FEATURE(R"({"river": "PLATTE", "chainage_end": 1})", LINE),
     "n.geojson: feature 2 (PLATTE): properties.chainage_start: a number was expected, and nothing stands "
     "there"},
    {"TextAsEnd", SECOND_FEATURE(R"({"river": "PLATTE", "chainage_start": 0, "chainage_end": "x"})", LINE),
     "n.geojson: feature 2 (PLATTE): properties.chainage_end: a number was expected, and 'x' stands there"},
    {"NanAsEnd", SECOND_FEATURE(R"({"river": "PLATTE", "chainage_start": 0, "chainage_end": "NaN"})", LINE),
     "n.geojson: feature 2 (PLATTE): properties.chainage_end: a number was expected, and 'NaN' stands there"},
    {"HugeEnd", SECOND_FEATURE(R"({"river": "PLATTE", "chainage_start": 0, "chainage_end": 1e10})", LINE),
     "n.geojson: feature 2 (PLATTE): properties.chainage_end: a number from -1e9 to 1e9 was expected, and "},
    {"PercentInName", SECOND_FEATURE(R"({"river": "%1 %2", "chainage_start": true})", LINE),
     "n.geojson: feature 2 (%1 %2): properties.chainage_start: a number was expected, and true stands there"},
    {"NoGeometry", SECOND_FEATURE(PLATTE, "null"),
     "n.geojson: feature 2 (PLATTE): geometry: an object was expected, and null stands there"},
    {"Point", SECOND_FEATURE(PLATTE, R"({"type": "Point", "coordinates": [1, 2]})"),
     "n.geojson: feature 2 (PLATTE): geometry.type: LineString or MultiLineString was expected, and 'Point' "
     "stands there"},
    {"Polygon", SECOND_FEATURE(PLATTE, R"({"type": "Polygon", "coordinates": [[[1, 2], [3, 4], [1, 2]]]})"),
     "n.geojson: feature 2 (PLATTE): geometry.type: LineString or MultiLineString was expected, and "
     "'Polygon' "},
    {"NoCoordinates", SECOND_FEATURE(PLATTE, R"({"type": "LineString"})"),
     "n.geojson: feature 2 (PLATTE): geometry.coordinates: a list was expected, and nothing stands there"},
    {"EmptyCoordinates", SECOND_FEATURE(PLATTE, LINE_OF("[]")),
     "n.geojson: feature 2 (PLATTE): geometry.coordinates: a list of at least two coordinates was expected, "
     "and "
     "an empty list stands there"},
    {"OneCoordinate", SECOND_FEATURE(PLATTE, LINE_OF("[[1, 2]]")),
     "n.geojson: feature 2 (PLATTE): geometry.coordinates: a list of at least two coordinates was expected, "
     "and "
     "a list stands there"},
    {"TextAsCoordinate", SECOND_FEATURE(PLATTE, LINE_OF(R"([[1, 2], [3, "4"]])")),
     "n.geojson: feature 2 (PLATTE): geometry.coordinates[1][1]: a number was expected, and '4' stands "
     "there"},
    {"HalfACoordinate", SECOND_FEATURE(PLATTE, LINE_OF("[[1, 2], [3]]")),
     "n.geojson: feature 2 (PLATTE): geometry.coordinates[1][1]: a number was expected, and nothing stands "
     "there"},
    {"FlatCoordinates", SECOND_FEATURE(PLATTE, LINE_OF("[1, 2]")),
     "n.geojson: feature 2 (PLATTE): geometry.coordinates[0]: a list was expected, and 1 stands there"},
    {"HugeCoordinate", SECOND_FEATURE(PLATTE, LINE_OF("[[1, 2], [-1e308, 4]]")),
     "n.geojson: feature 2 (PLATTE): geometry.coordinates[1][0]: a number from -1e9 to 1e9 was expected, "
     "and "},
    {"NoParts", SECOND_FEATURE(PLATTE, R"({"type": "MultiLineString", "coordinates": []})"),
     "n.geojson: feature 2 (PLATTE): geometry.coordinates: a list of at least one line was expected, and an "
     "empty "},
    {"EmptyPart",
     SECOND_FEATURE(PLATTE, R"({"type": "MultiLineString", "coordinates": [[[1, 2], [3, 4]], []]})"),
     "n.geojson: feature 2 (PLATTE): geometry.coordinates[1]: a list of at least two coordinates was "
     "expected, "},
    {"CoordinateSystem", R"({"type": "Feature", "crs": 5})",
     "n.geojson: crs: an object was expected, and 5 stands there"},
    {"Longitude",
     R"({"type": "Feature", "crs": {"properties": {"name": "EPSG:4326"}}, "properties": )" PLATTE
     R"(, "geometry": )" LINE_OF("[[1, 2], [-361, 2]]") "}",
     "n.geojson: feature 1 (PLATTE): geometry.coordinates[1][0]: a longitude from -360 to 360 was expected, "
     "and -361 "},
    {"Latitude",
     R"({"type": "Feature", "crs": {"properties": {"name": "EPSG:4326"}}, "properties": )" PLATTE
     R"(, "geometry": )" LINE_OF("[[1, 2], [3, 91]]") "}",
     "n.geojson: feature 1 (PLATTE): geometry.coordinates[1][1]: a latitude from -90 to 90 was expected, and "
     "91 "},
    {"WayPointsNoList", SECOND_FEATURE(WAY_POINTS("{}"), LINE),
     "n.geojson: feature 2 (PLATTE): properties.way_points: a list was expected, and an object stands there"},
    {"WayPointNowhere", SECOND_FEATURE(WAY_POINTS(R"([{"chainage": 5}])"), LINE),
     "n.geojson: feature 2 (PLATTE): properties.way_points[0].longitude: a number was expected, and "
     "nothing "},
    {"WayPointWithoutChainage", SECOND_FEATURE(WAY_POINTS(R"([{"longitude": 1, "latitude": 2}])"), LINE),
     "n.geojson: feature 2 (PLATTE): properties.way_points[0].chainage: a number was expected, and nothing "},
    {"WayPointBeyond",
     SECOND_FEATURE(WAY_POINTS(R"([{"longitude": 2, "latitude": 3, "chainage": 101}])"), LINE),
     "n.geojson: feature 2 (PLATTE): properties.way_points[0].chainage: a chainage from chainage_start to "
     "chainage_end was expected, and 101 stands there"},
    {"WayPointsCrossed",
     SECOND_FEATURE(
         WAY_POINTS(R"([{"x": 2.5, "y": 3.5, "chainage": 30}, {"x": 1.5, "y": 2.5, "chainage": 60}])"), LINE),
     "n.geojson: feature 2 (PLATTE): properties.way_points[1].chainage: a chainage in the order of the "
     "places along "
     "the line was expected, and 60 stands there"},
    {"WayPointAgainstStart", SECOND_FEATURE(WAY_POINTS(R"([{"x": 1, "y": 2, "chainage": 30}])"), LINE),
     "n.geojson: feature 2 (PLATTE): properties.way_points[0].chainage: a chainage in the order of the "
     "places "},
    {"WayPointAgainstEnd", SECOND_FEATURE(WAY_POINTS(R"([{"x": 3, "y": 4, "chainage": 0}])"), LINE),
     "n.geojson: feature 2 (PLATTE): properties.way_points[0].chainage: a chainage in the order of the "
     "places "},
};

class ABrokenNetwork : public testing::TestWithParam<Broken> {};

TEST_P(ABrokenNetwork, IsToldWithItsPlace) {
    const auto reading = networkFromGeoJson(GetParam().json, "n.geojson");
    EXPECT_EQ(reading.network, nullptr);
    EXPECT_THAT(reading.error.toStdString(), StartsWith(GetParam().error));
}

INSTANTIATE_TEST_SUITE_P(Each, ABrokenNetwork, testing::ValuesIn(brokenOnes),
                         [](const auto& param) { return std::string(param.param.name); });

TEST(ABrokenFile, IsToldByItsName) {
    QTemporaryDir folder;
    const auto missing = kota::hub::readNetwork(folder.filePath("gone.geojson"));
    EXPECT_EQ(missing.network, nullptr);
    EXPECT_THAT(missing.error.toStdString(), StartsWith("gone.geojson: the file cannot be read: "));
    EXPECT_NE(kota::hub::readNetwork(folder.path()).error, "");
}

TEST(ABrokenFile, MayBeNestedDeeply) {
    const auto reading = networkFromGeoJson(QByteArray(1'000'000, '['), "n.geojson");
    EXPECT_THAT(reading.error.toStdString(), StartsWith("n.geojson:1:"));
}

TEST(ABrokenFile, IsQuotedInPart) {
    const QByteArray type(100'000, 'x');
    const auto reading = networkFromGeoJson("{\"type\": \"" + type + "\"}", "n.geojson");
    EXPECT_LT(reading.error.size(), 200);
}

// An example with bytes changed, left out, or doubled is read or told, whatever the bytes.
RC_GTEST_PROP(AMangledFile, IsReadOrTold, ()) {
    static const QByteArray sound = [] {
        QFile file(KOTA_EXAMPLES "/missouri/network.geojson");
        return file.open(QIODevice::ReadOnly) ? file.readAll() : QByteArray();
    }();
    RC_ASSERT(!sound.isEmpty());
    QByteArray bytes = sound;
    const int changes = *rc::gen::inRange(1, 4);
    for (int change = 0; change < changes; ++change) {
        const auto place = *rc::gen::inRange<qsizetype>(0, bytes.size());
        const auto length = *rc::gen::inRange<qsizetype>(0, 12);
        const QByteArray other =
            *rc::gen::element<QByteArray>("", "9", "-", "e308", "null", "[]", "{}", "\"", ",");
        bytes.replace(place, length, other);
    }
    const auto reading = networkFromGeoJson(bytes, "n.geojson");
    RC_ASSERT((reading.network == nullptr) != reading.error.isEmpty());
}

} // namespace
