#include "hub/project/geojson.h"
#include "tests/hub/project/printed.h"

#include <QTemporaryDir>

#include <numbers>

namespace {

using kota::hub::Network;
using kota::hub::networkFromGeoJson;
using kota::test::IsAt;
using testing::DoubleNear;
using testing::ElementsAre;
using testing::Optional;
using testing::Pointwise;

constexpr double metresPerDegree = 6371008.8 * std::numbers::pi / 180;

// A river "R" of chainages 0 to 100 in metres, with other properties and a geometry of a type.
QByteArray feature(const char* type, const char* coordinates, const char* properties = "",
                   const char* chainages = R"("chainage_start": 0, "chainage_end": 100)") {
    return QByteArray(R"({"type": "Feature", "properties": {"river": "R", )") + chainages + properties +
           R"(}, "geometry": {"type": ")" + type + R"(", "coordinates": )" + coordinates + "}}";
}

QByteArray collection(const QByteArray& features, const char* crs = R"("EPSG:32615")") {
    return R"({"type": "FeatureCollection", "crs": {"type": "name", "properties": {"name": )" +
           QByteArray(crs) + "}}, \"features\": [" + features + "]}";
}

Network read(const QByteArray& json) {
    const auto reading = networkFromGeoJson(json, "n.geojson");
    EXPECT_EQ(reading.error, "");
    return reading.network ? *reading.network : Network();
}

const std::vector<double>& chainagesOf(const Network& network) {
    return network.rivers().at(0).chainages;
}

TEST(ALine, HasItsChainagesByLength) {
    const Network network = read(collection(feature("LineString", "[[0, 0], [30, 0], [30, 40], [60, 80]]")));
    EXPECT_THAT(chainagesOf(network), Pointwise(DoubleNear(1e-9), {0.0, 25.0, 175.0 / 3, 100.0}));
    EXPECT_THAT(network.place("R", 12.5), Optional(IsAt(15, 0, 1e-9)));
}

TEST(ALine, MayHaveFallingChainages) {
    const Network network = read(collection(feature("LineString", "[[0, 0], [30, 0], [40, 0]]", "",
                                                    R"("chainage_start": 100, "chainage_end": -100)")));
    EXPECT_THAT(chainagesOf(network), Pointwise(DoubleNear(1e-9), {100.0, -50.0, -100.0}));
}

TEST(ALine, MayBeOnePoint) {
    const Network network = read(collection(feature("LineString", "[[7, 7], [7, 7], [7, 7]]")));
    EXPECT_THAT(chainagesOf(network), ElementsAre(0, 50, 100));
    EXPECT_THAT(network.place("R", 20), Optional(IsAt(7, 7, 0)));
    EXPECT_EQ(network.nearest({7, 7}, 1)->river, "R");
}

TEST(ALine, MayRepeatVerticesAndChainages) {
    const Network network = read(collection(
        feature("LineString", "[[0, 0], [0, 0], [10, 0], [10, 0], [20, 0]]") + "," +
        feature("LineString", "[[0, 5], [9, 5]]", "", R"("chainage_start": 5, "chainage_end": 5)")));
    EXPECT_THAT(chainagesOf(network), ElementsAre(0, 0, 50, 50, 100));
    EXPECT_THAT(network.rivers().at(1).chainages, ElementsAre(5, 5));
}

TEST(ALine, MayBeAFeatureAlone) {
    EXPECT_THAT(read(feature("LineString", "[[0, 0], [1000, 0]]")).names(), ElementsAre("R"));
}

TEST(ALine, MayHaveHeightsAndOtherMembers) {
    const Network network = read(
        collection(feature("LineString", "[[0, 0, 12.5], [10, 0, 12.0]]", R"(, "joins": {"river": "Q"})")));
    EXPECT_THAT(network.rivers().at(0).vertices, ElementsAre(QPointF(0, 0), QPointF(10, 0)));
}

TEST(ALine, IsNamedByNameWhereThereIsNoRiver) {
    EXPECT_THAT(read(collection(feature("LineString", "[[0, 0], [9, 9]]", R"(, "name": "N")"))).names(),
                ElementsAre("R"));
    const QByteArray named = collection(feature("LineString", "[[0, 0], [9, 9]]")).replace("river", "name");
    EXPECT_THAT(read(named).names(), ElementsAre("R"));
}

TEST(PartsOfALine, ShareTheChainagesByTheirLengths) {
    const Network network = read(collection(
        feature("MultiLineString", "[[[0, 0], [30, 0]], [[500, 0], [510, 0]], [[0, 9], [0, 9]]]")));
    ASSERT_EQ(network.rivers().size(), 3U);
    EXPECT_THAT(network.rivers()[0].chainages, ElementsAre(0, 75));
    EXPECT_THAT(network.rivers()[1].chainages, ElementsAre(75, 100));
    EXPECT_THAT(network.rivers()[2].chainages, ElementsAre(100, 100));
    EXPECT_THAT(network.names(), ElementsAre("R"));
}

TEST(PartsOfALine, OfNoLengthShareTheChainagesEvenly) {
    const Network network =
        read(collection(feature("MultiLineString", "[[[1, 1], [1, 1]], [[5, 5], [5, 5], [5, 5], [5, 5]]]")));
    EXPECT_THAT(network.rivers()[0].chainages, ElementsAre(0, 25));
    EXPECT_THAT(network.rivers()[1].chainages, ElementsAre(25, 50, 75, 100));
}

// 100 m to the east with the given way points.
QByteArray pinned(const char* wayPoints,
                  const char* chainages = R"("chainage_start": 0, "chainage_end": 100)") {
    const QByteArray properties = QByteArray(R"(, "way_points": )") + wayPoints;
    return collection(
        feature("LineString", "[[0, 0], [50, 0], [100, 0]]", properties.constData(), chainages));
}

TEST(AWayPoint, PinsTheChainageOfAVertex) {
    const Network network = read(pinned(R"([{"name": "Mill", "chainage": 80, "x": 50, "y": 0}])"));
    EXPECT_THAT(chainagesOf(network), ElementsAre(0, 80, 100));
    EXPECT_THAT(network.place("R", 40), Optional(IsAt(25, 0, 1e-9)));
    EXPECT_THAT(network.place("R", 90), Optional(IsAt(75, 0, 1e-9)));
}

TEST(AWayPoint, PinsTheChainageBetweenVertices) {
    const Network network =
        read(pinned(R"([{"chainage": 30, "x": 60, "y": 3}, {"chainage": 6, "x": 20, "y": -1}])"));
    EXPECT_THAT(network.rivers().at(0).vertices,
                ElementsAre(QPointF(0, 0), QPointF(20, 0), QPointF(50, 0), QPointF(60, 0), QPointF(100, 0)));
    EXPECT_THAT(chainagesOf(network), Pointwise(DoubleNear(1e-9), {0.0, 6.0, 24.0, 30.0, 100.0}));
}

TEST(AWayPoint, MayStandAtTheEnds) {
    EXPECT_THAT(chainagesOf(read(
                    pinned(R"([{"chainage": 100, "x": 100, "y": 0}, {"chainage": 0, "x": 0, "y": 0}])"))),
                ElementsAre(0, 50, 100));
}

TEST(AWayPoint, PinsFallingChainages) {
    EXPECT_THAT(chainagesOf(read(pinned(R"([{"chainage": 20, "x": 50, "y": 0}])",
                                        R"("chainage_start": 100, "chainage_end": 0)"))),
                ElementsAre(100, 20, 0));
}

TEST(AWayPoint, PinsAPlaceOfAFurtherPart) {
    const Network network =
        read(collection(feature("MultiLineString", "[[[0, 0], [10, 0]], [[20, 0], [30, 0]]]",
                                R"(, "way_points": [{"chainage": 80, "x": 25, "y": 0}])")));
    EXPECT_THAT(network.rivers().at(0).chainages, Pointwise(DoubleNear(1e-9), {0.0, 160.0 / 3}));
    EXPECT_THAT(network.rivers().at(1).chainages, Pointwise(DoubleNear(1e-9), {160.0 / 3, 80.0, 100.0}));
}

TEST(AWayPoint, OfALineOfOnePointChangesNothing) {
    const Network network = read(collection(
        feature("LineString", "[[7, 7], [7, 7]]", R"(, "way_points": [{"chainage": 9, "x": 1, "y": 2}])")));
    EXPECT_THAT(chainagesOf(network), ElementsAre(0, 100));
}

TEST(Degrees, AreLaidOutInMetresAboutTheirMiddle) {
    const Network network = read(feature("LineString", "[[10, 59], [10, 61], [12, 61]]"));
    const double east = metresPerDegree * std::cos(60 * std::numbers::pi / 180);
    EXPECT_THAT(network.rivers().at(0).vertices,
                ElementsAre(IsAt(-east, -metresPerDegree, 1e-6), IsAt(-east, metresPerDegree, 1e-6),
                            IsAt(east, metresPerDegree, 1e-6)));
    EXPECT_NEAR(east, 55597.54, 0.01);
}

// At 60 degrees a degree to the east is half as long as one to the north; so it is for a river there,
// wherever the middle of the network lies.
TEST(Degrees, HaveTheLengthsOfTheirLatitude) {
    const Network network = read(collection(feature("LineString", "[[10, 60], [11, 60], [11, 61]]") + "," +
                                                feature("LineString", "[[10, 0], [10, 1]]"),
                                            R"("EPSG:4326")"));
    EXPECT_THAT(chainagesOf(network), Pointwise(DoubleNear(0.01), {0.0, 100.0 / 3, 100.0}));
}

TEST(Degrees, MayBeAtAPole) {
    const Network network = read(feature("LineString", "[[0, 90], [90, 90]]"));
    EXPECT_THAT(network.place("R", 50), Optional(IsAt(0, 0, 1e-3)));
}

TEST(Degrees, AreToldByTheCoordinateSystem) {
    const QByteArray line = feature("LineString", "[[0, 0], [2, 0]]");
    EXPECT_EQ(read(collection(line)).bounds().width(), 2);
    EXPECT_NEAR(read(collection(line, R"("urn:ogc:def:crs:OGC:1.3:CRS84")")).bounds().width(),
                2 * metresPerDegree, 1e-6);
    EXPECT_NEAR(read(collection(line, R"("urn:ogc:def:crs:EPSG::4269")")).bounds().width(),
                2 * metresPerDegree, 1e-6);
}

TEST(Degrees, AreWhatCouldBeDegrees) {
    EXPECT_NEAR(read(feature("LineString", "[[0, 0], [0, 90]]")).bounds().height(), 90 * metresPerDegree,
                1e-6);
    EXPECT_EQ(read(feature("LineString", "[[0, 0], [0, 90.5]]")).bounds().height(), 90.5);
    EXPECT_EQ(read(feature("LineString", "[[0, 0], [361, 0]]")).bounds().width(), 361);
}

// Where the rivers "A", "B", ... of given lines come to lie, in degrees of longitude from the west.
std::vector<std::vector<double>> longitudes(std::initializer_list<const char*> lines) {
    QByteArray features;
    for (const char* line : lines)
        features += (features.isEmpty() ? "" : ",") + feature("LineString", line);
    const Network network = read(collection(features, R"("EPSG:4326")"));
    const double east = network.bounds().width(); // all lie at the equator
    std::vector<std::vector<double>> found;
    for (const kota::hub::River& river : network.rivers())
        for (std::vector<double>& of = found.emplace_back(); const QPointF vertex : river.vertices)
            of.push_back(std::round((vertex.x() + east / 2) / metresPerDegree * 1e6) / 1e6);
    return found;
}

TEST(TheDateLine, CutsNoRiver) {
    EXPECT_THAT(longitudes({"[[179, 0], [-179, 0], [-178, 0]]"}), ElementsAre(ElementsAre(0, 2, 3)));
    EXPECT_THAT(longitudes({"[[-179, 0], [179, 0], [-179, 0]]"}), ElementsAre(ElementsAre(2, 0, 2)));
    EXPECT_THAT(longitudes({"[[359, 0], [1, 0]]"}), ElementsAre(ElementsAre(0, 2)));
}

TEST(TheDateLine, PartsNoRivers) {
    EXPECT_THAT(longitudes({"[[179, 0], [178, 0]]", "[[-179, 0], [-178, 0]]"}),
                ElementsAre(ElementsAre(1, 0), ElementsAre(3, 4)));
    EXPECT_THAT(longitudes({"[[-170, 0], [-169, 0]]", "[[170, 0], [-175, 0]]", "[[165, 0], [166, 0]]"}),
                ElementsAre(ElementsAre(25, 26), ElementsAre(5, 20), ElementsAre(0, 1)));
    EXPECT_THAT(longitudes({"[[-1, 0], [0, 0]]", "[[359, 0], [360, 0]]"}),
                ElementsAre(ElementsAre(0, 1), ElementsAre(0, 1)));
}

TEST(TheDateLine, PartsNoWayPointFromItsRiver) {
    const Network network =
        read(feature("LineString", "[[179, 0], [-179, 0]]",
                     R"(, "way_points": [{"chainage": 10, "longitude": -180, "latitude": 0}])"));
    EXPECT_THAT(chainagesOf(network), ElementsAre(0, 10, 100));
}

TEST(AFile, IsReadWithAByteOrderMark) {
    QTemporaryDir folder;
    QFile file(folder.filePath("n.geojson"));
    ASSERT_TRUE(file.open(QIODevice::WriteOnly));
    file.write("\xEF\xBB\xBF" +
               collection(feature("LineString", "[[0, 0], [9, 9]]").replace("\"R\"", "\"ÅN\"")));
    file.close();
    const auto reading = kota::hub::readNetwork(file.fileName());
    ASSERT_TRUE(reading.network) << reading.error.toStdString();
    EXPECT_THAT(reading.network->names(), ElementsAre(QString::fromUtf8("ÅN")));
}

TEST(AFile, MayHaveAHundredThousandVertices) {
    QByteArray coordinates = "[";
    QByteArray wayPoints = "[";
    for (int vertex = 0; vertex <= 100'000; ++vertex) {
        coordinates += (vertex ? ",[" : "[") + QByteArray::number(vertex) + "," + (vertex % 2 ? "0]" : "1]");
        if (vertex % 2 == 0)
            wayPoints += (vertex ? "," : "") + QByteArray(R"({"chainage":)") +
                         QByteArray::number(2 * vertex) + R"(,"x":)" + QByteArray::number(vertex) +
                         R"(,"y":1})";
    }
    const QByteArray properties = R"(, "way_points": )" + wayPoints + "]";
    const Network network = read(collection(feature("LineString", coordinates + "]", properties,
                                                    R"("chainage_start": 0, "chainage_end": 200000)")));
    ASSERT_EQ(network.rivers().at(0).vertices.size(), 100'001U);
    EXPECT_THAT(network.place("R", 123'455), Optional(IsAt(61'727.5, 0.5, 1e-6)));
    EXPECT_NEAR(network.nearest({61'728, 1.2}, 5)->chainage, 123'456, 1e-6);
}

} // namespace
