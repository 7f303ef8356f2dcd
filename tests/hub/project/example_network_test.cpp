#include "hub/project/geojson.h"
#include "tests/hub/project/printed.h"

#include <numbers>

namespace {

using kota::hub::Network;
using testing::ElementsAre;

class TheExample : public testing::Test {
protected:
    TheExample() {
        const auto reading = kota::hub::readNetwork(KOTA_EXAMPLES "/missouri/network.geojson");
        EXPECT_EQ(reading.error, "");
        if (reading.network)
            network = *reading.network;
    }

    // By the middle of the vertices' longitudes and latitudes, from -96.414 to -95.789 and from 41.0011
    // to 42.4875.
    static QPointF onPlane(double longitude, double latitude) {
        constexpr double radian = std::numbers::pi / 180;
        constexpr double radius = 6371008.8;
        const double middle = (41.0011 + 42.4875) / 2 * radian;
        return {(longitude - (-96.414 - 95.789) / 2) * radian * radius * std::cos(middle),
                latitude * radian * radius - middle * radius};
    }

    Network network;
};

TEST_F(TheExample, HasItsRivers) {
    EXPECT_THAT(network.names(), ElementsAre("MISSOURI", "LITTLE SIOUX", "BOYER", "PLATTE"));
}

TEST_F(TheExample, HasItsWayPointsWhereTheyLie) {
    struct WayPoint {
        double chainage, longitude, latitude;
    };
    for (const WayPoint& point : {WayPoint{0, -96.4136, 42.4875}, WayPoint{66466, -96.2419, 42.0067},
                                  WayPoint{135185, -96.0956, 41.5511}, WayPoint{187328, -95.9222, 41.2589},
                                  WayPoint{226596, -95.8667, 41.0011}}) {
        const QPointF there = onPlane(point.longitude, point.latitude);
        const auto place = network.place("MISSOURI", point.chainage);
        ASSERT_TRUE(place.has_value()) << point.chainage;
        EXPECT_THAT(*place, kota::test::IsAt(there.x(), there.y(), 0.01)) << point.chainage;
    }
}

TEST_F(TheExample, HasOmahaAtItsChainage) {
    const auto omaha = network.nearest(onPlane(-95.9222, 41.2589), 10);
    ASSERT_TRUE(omaha.has_value());
    EXPECT_EQ(omaha->river, "MISSOURI");
    EXPECT_NEAR(omaha->chainage, 187328, 0.01);
}

// The mouths' chainages are worked out along the drawn line between way points.
TEST_F(TheExample, HasTheMouthsAtTheirChainages) {
    struct Mouth {
        const char* river;
        double own, onMissouri;
    };
    for (const Mouth& mouth : {Mouth{"LITTLE SIOUX", 26440, 100572}, Mouth{"BOYER", 24670, 156356},
                               Mouth{"PLATTE", 25254, 219633}}) {
        const auto place = network.place(mouth.river, mouth.own);
        ASSERT_TRUE(place.has_value()) << mouth.river;
        const auto there = network.nearest(*place, 1);
        ASSERT_TRUE(there.has_value()) << mouth.river;
        EXPECT_EQ(there->river, "MISSOURI");
        EXPECT_NEAR(there->chainage, mouth.onMissouri, 5) << mouth.river;
    }
}

} // namespace
