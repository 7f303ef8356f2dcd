#include "hub/project/network.h"
#include "tests/hub/project/printed.h"

#include <rapidcheck/gtest.h>

namespace {

using kota::hub::Location;
using kota::hub::Network;
using kota::hub::River;
using kota::test::IsAt;
using kota::test::river;
using testing::ElementsAre;
using testing::Optional;

// East 300 m, then north 400 m; chainages twice the length.
River bend() {
    return river("BEND", {{0, 0}, {300, 0}, {300, 400}}, {100, 700, 1500});
}

TEST(ANetwork, NamesEachRiverOnce) {
    const Network network({bend(), river("ARM", {{0, 0}, {0, 5}}, {0, 5}),
                           river("BEND", {{300, 400}, {300, 500}}, {1500, 1700})});
    EXPECT_THAT(network.names(), ElementsAre("BEND", "ARM"));
}

TEST(ANetwork, HasTheBoundsOfItsRivers) {
    const Network network({bend(), river("ARM", {{-20, 50}, {0, -5}}, {0, 5})});
    EXPECT_EQ(network.bounds().left, -20);
    EXPECT_EQ(network.bounds().right, 300);
    EXPECT_EQ(network.bounds().bottom, -5);
    EXPECT_EQ(network.bounds().top, 400);
    EXPECT_TRUE(Network().bounds().isEmpty());
}

TEST(ANetwork, InterpolatesAPlace) {
    const Network network({bend()});
    EXPECT_THAT(network.place("BEND", 100), Optional(IsAt(0, 0, 0)));
    EXPECT_THAT(network.place("BEND", 400), Optional(IsAt(150, 0, 1e-9)));
    EXPECT_THAT(network.place("BEND", 700), Optional(IsAt(300, 0, 0)));
    EXPECT_THAT(network.place("BEND", 900), Optional(IsAt(300, 100, 1e-9)));
    EXPECT_THAT(network.place("BEND", 1500), Optional(IsAt(300, 400, 0)));
}

TEST(ANetwork, HasNoPlaceBeyondARiver) {
    const Network network({bend()});
    EXPECT_EQ(network.place("BEND", 99.99), std::nullopt);
    EXPECT_EQ(network.place("BEND", 1500.01), std::nullopt);
    EXPECT_EQ(network.place("BEND", std::numeric_limits<double>::quiet_NaN()), std::nullopt);
    EXPECT_EQ(network.place("OTHER", 200), std::nullopt);
    EXPECT_EQ(Network().place("BEND", 200), std::nullopt);
}

TEST(ANetwork, TakesItsEndsForReachedWithinAMillimetre) {
    const Network network({bend()});
    EXPECT_EQ(network.place("BEND", 99.9995), network.place("BEND", 100));
    EXPECT_EQ(network.place("BEND", 1500.0000001), network.place("BEND", 1500));
}

TEST(ANetwork, KnowsARiverInCapitalsAndInSmallLetters) {
    const Network network({bend()});
    EXPECT_EQ(network.place("bend", 700), network.place("BEND", 700));
    EXPECT_NE(network.place("bend", 700), std::nullopt);
}

TEST(ANetwork, FindsAPlaceWhereChainagesFall) {
    const Network network({river("FALL", {{0, 0}, {10, 0}, {40, 0}}, {400, 300, 0})});
    EXPECT_THAT(network.place("FALL", 350), Optional(IsAt(5, 0, 1e-9)));
    EXPECT_THAT(network.place("FALL", 100), Optional(IsAt(30, 0, 1e-9)));
    EXPECT_EQ(network.place("FALL", 401), std::nullopt);
    EXPECT_NEAR(network.nearest({30, 2}, 5)->chainage, 100, 1e-9);
}

TEST(ANetwork, FindsAPlaceOnTheReachThatHasIt) {
    const Network network(
        {river("LONG", {{0, 0}, {10, 0}}, {0, 10}), river("LONG", {{100, 0}, {110, 0}}, {20, 30})});
    EXPECT_THAT(network.place("LONG", 25), Optional(IsAt(105, 0, 1e-9)));
    EXPECT_EQ(network.place("LONG", 15), std::nullopt);
}

TEST(ANetwork, SnapsToTheNearestRiver) {
    const Network network({bend(), river("ARM", {{0, 100}, {200, 100}}, {0, 50})});
    EXPECT_EQ(network.nearest({60, 40}, 50), (Location{"BEND", 220, {60, 0}}));
    EXPECT_EQ(network.nearest({60, 70}, 50), (Location{"ARM", 15, {60, 100}}));
    EXPECT_EQ(network.nearest({400, 500}, 150), (Location{"BEND", 1500, {300, 400}}));
}

TEST(ANetwork, SnapsWithinTheDistanceOnly) {
    const Network network({bend()});
    EXPECT_NE(network.nearest({60, 40}, 40), std::nullopt);
    EXPECT_EQ(network.nearest({60, 40}, 39.9), std::nullopt);
    EXPECT_EQ(network.nearest({std::numeric_limits<double>::quiet_NaN(), 0}, 1e9), std::nullopt);
}

TEST(ANetwork, TakesTheFirstRiverWhereTwoMeet) {
    const Network network({bend(), river("ARM", {{300, 400}, {500, 400}}, {0, 200})});
    EXPECT_EQ(network.nearest({300, 400}, 10)->river, "BEND");
}

TEST(ANetwork, TakesRepeatedVerticesAndEqualChainages) {
    const Network network({river("STILL", {{5, 5}, {5, 5}, {5, 5}}, {7, 7, 7}),
                           river("STEP", {{0, 0}, {10, 0}, {10, 0}, {20, 0}}, {0, 10, 30, 40})});
    EXPECT_THAT(network.place("STILL", 7), Optional(IsAt(5, 5, 0)));
    EXPECT_EQ(network.nearest({5, 8}, 4), (Location{"STILL", 7, {5, 5}}));
    EXPECT_THAT(network.place("STEP", 20), Optional(IsAt(10, 0, 0)));
    EXPECT_THAT(network.place("STEP", 35), Optional(IsAt(15, 0, 1e-9)));
}

TEST(ANetwork, LeavesOutWhatIsNoLine) {
    const Network network({river("POINT", {{1, 1}}, {0}), river("NONE", {}, {}),
                           river("SHORT", {{0, 0}, {1, 1}}, {0}), bend()});
    EXPECT_THAT(network.names(), ElementsAre("BEND"));
}

// A line that goes on to the east, so that no two of its places are near each other.
rc::Gen<River> eastwards() {
    return rc::gen::exec([] {
        River line{"R", {{0, 0}}, {0}};
        const int vertices = *rc::gen::inRange(1, 80);
        for (int vertex = 0; vertex < vertices; ++vertex) {
            const QPointF step(*rc::gen::inRange(1, 1000), *rc::gen::inRange(-500, 500));
            line.vertices.push_back(line.vertices.back() + step);
            line.chainages.push_back(line.chainages.back() + *rc::gen::inRange(1, 2000));
        }
        return line;
    });
}

RC_GTEST_PROP(AProperty, ThePlaceOfAChainageHasThatChainage, (int permille, bool falls)) {
    River line = *eastwards();
    if (falls)
        std::ranges::reverse(line.chainages);
    const auto [least, most] = std::minmax({line.firstChainage(), line.lastChainage()});
    const double chainage = least + (most - least) * (std::abs(permille % 1001) / 1000.0);
    const Network network({line});
    const auto place = network.place("R", chainage);
    RC_ASSERT(place.has_value());
    const auto nearest = network.nearest(*place, 1e-3);
    RC_ASSERT(nearest.has_value());
    RC_ASSERT(std::abs(nearest->chainage - chainage) < 1e-3);
}

} // namespace
