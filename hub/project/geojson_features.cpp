#include "hub/project/geojson_features.h"

#include "hub/project/projection.h"

#include <QRegularExpression>

#include <algorithm>
#include <array>
#include <utility>

namespace kota::hub {

namespace {

constexpr double largestNumber = 1e9;
constexpr double largestLongitude = 360;
constexpr double largestLatitude = 90;

double numberUpTo(double largest, const JsonPlace& place, ProjectText expected) {
    const double number = place.number();
    if (std::abs(number) > largest)
        place.misfit(expected);
    return number;
}

double metres(const JsonPlace& place) {
    return numberUpTo(largestNumber, place, ProjectText::ANumberInRange);
}

double chainageWithin(const PinnedLine& line, const JsonPlace& place) {
    const double chainage = place.number();
    const auto [lowest, highest] = std::minmax({line.firstChainage, line.lastChainage});
    if (chainage < lowest || chainage > highest)
        place.misfit(ProjectText::AChainageInSpan);
    return chainage;
}

// Whether the name is that of a usual system of longitudes and latitudes.
bool namesDegrees(const QString& system) {
    constexpr std::array endings = {"CRS84", "CRS83", "CRS27", ":4326", ":4269", ":4267", ":4258",
                                    ":4283", ":4490", ":4612", ":6318", ":6668", ":7844"};
    return std::ranges::any_of(endings, [&system](const char* ending) {
        return system.endsWith(QLatin1String(ending), Qt::CaseInsensitive);
    });
}

// Whether the name is an EPSG number of five digits, all of which are of systems in metres or the like, or
// that of the web's maps.
bool namesMetres(const QString& system) {
    static const QRegularExpression numbers(":([1-9][0-9]{4}|3857)$");
    return numbers.match(system).hasMatch();
}

bool couldBeDegrees(QPointF point) {
    return std::abs(point.x()) <= largestLongitude && std::abs(point.y()) <= largestLatitude;
}

} // namespace

std::vector<River> GeoJsonFeatures::read() {
    readCoordinateSystem();
    readAll();
    if (areDegrees())
        projectDegrees(lines_);
    return chained();
}

QString GeoJsonFeatures::current() const {
    if (number_ == 0)
        return {};
    const QString number = QString::number(number_);
    return name_.isEmpty() ? projectText(ProjectText::Feature).arg(number)
                           : projectText(ProjectText::NamedFeature).arg(number, name_);
}

void GeoJsonFeatures::readCoordinateSystem() {
    const JsonPlace system = root_["crs"];
    if (!system.isThere() || system.isNull())
        return;
    const JsonPlace properties = system["properties"];
    const QString name = properties["name"].text();
    if (namesDegrees(name))
        coordinates_ = Coordinates::Degrees;
    else if (namesMetres(name))
        coordinates_ = Coordinates::Metres;
}

void GeoJsonFeatures::readAll() {
    const JsonPlace type = root_["type"];
    const QString is = type.text();
    if (is == QLatin1String("Feature"))
        return readFeature(root_);
    if (is != QLatin1String("FeatureCollection"))
        type.misfit(ProjectText::ACollectionOrFeature);
    const JsonPlace features = root_["features"];
    const qsizetype count = features.size();
    if (count == 0)
        features.misfit(ProjectText::AFeature);
    for (qsizetype feature = 0; feature < count; ++feature)
        readFeature(features.at(feature).asRoot());
}

void GeoJsonFeatures::readFeature(const JsonPlace& feature) {
    number_ = lines_.size() + 1;
    name_.clear();
    const JsonPlace properties = feature["properties"];
    const JsonPlace river = properties["river"];
    const JsonPlace name = properties["name"];
    const bool isNameless = !river.isThere() && name.isThere();
    name_ = (isNameless ? name : river).text();
    PinnedLine line;
    line.name = name_;
    line.firstChainage = metres(properties["chainage_start"]);
    line.lastChainage = metres(properties["chainage_end"]);
    readGeometry(feature["geometry"], line);
    const JsonPlace wayPoints = properties["way_points"];
    if (wayPoints.isThere())
        readWayPoints(wayPoints, line);
    lines_.push_back(std::move(line));
    number_ = 0;
}

void GeoJsonFeatures::readGeometry(const JsonPlace& geometry, PinnedLine& line) const {
    const JsonPlace type = geometry["type"];
    const QString is = type.text();
    const JsonPlace coordinates = geometry["coordinates"];
    if (is == QLatin1String("LineString")) {
        line.parts.push_back(readLine(coordinates));
        return;
    }
    if (is != QLatin1String("MultiLineString"))
        type.misfit(ProjectText::ALine);
    const qsizetype count = coordinates.size();
    if (count == 0)
        coordinates.misfit(ProjectText::ALineOrMore);
    for (qsizetype part = 0; part < count; ++part)
        line.parts.push_back(readLine(coordinates.at(part)));
}

std::vector<QPointF> GeoJsonFeatures::readLine(const JsonPlace& coordinates) const {
    const qsizetype count = coordinates.size();
    if (count < 2)
        coordinates.misfit(ProjectText::TwoPlaces);
    std::vector<QPointF> line;
    line.reserve(static_cast<std::size_t>(count));
    for (qsizetype vertex = 0; vertex < count; ++vertex) {
        const JsonPlace place = coordinates.at(vertex);
        line.push_back(readPoint(place.at(0), place.at(1)));
    }
    return line;
}

QPointF GeoJsonFeatures::readPoint(const JsonPlace& x, const JsonPlace& y) const {
    if (coordinates_ != Coordinates::Degrees)
        return {metres(x), metres(y)};
    return {numberUpTo(largestLongitude, x, ProjectText::ALongitude),
            numberUpTo(largestLatitude, y, ProjectText::ALatitude)};
}

void GeoJsonFeatures::readWayPoints(const JsonPlace& wayPoints, PinnedLine& line) const {
    const qsizetype count = wayPoints.size();
    for (qsizetype place = 0; place < count; ++place) {
        const JsonPlace wayPoint = wayPoints.at(place);
        const bool isProjected = wayPoint["x"].isThere();
        const QPointF point =
            readPoint(wayPoint[isProjected ? "x" : "longitude"], wayPoint[isProjected ? "y" : "latitude"]);
        line.pins.push_back({point, chainageWithin(line, wayPoint["chainage"])});
    }
}

bool GeoJsonFeatures::areDegrees() const {
    if (coordinates_ != Coordinates::Unknown)
        return coordinates_ == Coordinates::Degrees;
    return std::ranges::all_of(lines_, [](const PinnedLine& line) {
        return std::ranges::all_of(
            line.parts, [](const auto& part) { return std::ranges::all_of(part, couldBeDegrees); });
    });
}

std::vector<River> GeoJsonFeatures::chained() {
    std::vector<River> rivers;
    for (PinnedLine& line : lines_) {
        ++number_;
        name_ = line.name;
        std::vector<ChainagePin> pins = line.pins;
        Chained chained = chain(std::move(line));
        if (const std::optional<std::size_t> pin = chained.misplacedPin)
            throw JsonMisfit(QStringLiteral("properties.way_points[%1].chainage").arg(*pin),
                             projectText(ProjectText::AChainageInOrder),
                             QString::number(pins[*pin].chainage, 'g', QLocale::FloatingPointShortest));
        std::ranges::move(chained.reaches, std::back_inserter(rivers));
    }
    number_ = 0;
    return rivers;
}

} // namespace kota::hub
