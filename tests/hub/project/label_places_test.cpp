#include "hub/project/label_places.h"
#include "hub/project/round_step.h"

#include <gtest/gtest.h>

#include <limits>

namespace {

using kota::hub::LabelPlaces;
using kota::hub::roundStep;

TEST(PlacesOfLabels, AreFreeUntilTaken) {
    LabelPlaces places({200, 100});
    EXPECT_TRUE(places.isFree({10, 10, 50, 20}));
    places.take({10, 10, 50, 20});
    EXPECT_FALSE(places.isFree({40, 20, 50, 20}));
    EXPECT_FALSE(places.isFree({40, 20, 50, 20}, LabelPlaces::On::LinesAtMost));
    EXPECT_TRUE(places.isFree({80, 10, 50, 20}));
}

TEST(PlacesOfLabels, AreNotFreeOnLines) {
    LabelPlaces places({200, 100});
    places.takeLine({0, 0, 200, 100});
    EXPECT_FALSE(places.isFree({90, 40, 20, 20}));
    EXPECT_TRUE(places.isFree({90, 40, 20, 20}, LabelPlaces::On::LinesAtMost));
    EXPECT_TRUE(places.isFree({10, 60, 20, 20}));
}

TEST(PlacesOfLabels, LieWithinThePicture) {
    LabelPlaces places({200, 100});
    EXPECT_FALSE(places.isFree({-1, 10, 50, 20}));
    EXPECT_FALSE(places.isFree({160, 10, 50, 20}));
    EXPECT_FALSE(places.isFree({10, 90, 50, 20}));
    places.takeLine({-1e9, -1e9, -1e9, -1e9}); // beside it
    places.take({-50, -50, 1000, 60});
    EXPECT_FALSE(places.isFree({150, 5, 20, 10}));
    EXPECT_TRUE(places.isFree({150, 20, 20, 10}));
}

TEST(PlacesOfLabels, MayBeNone) {
    LabelPlaces places({0, 0});
    places.take({0, 0, 5, 5});
    EXPECT_FALSE(places.isFree({0, 0, 5, 5}));
}

TEST(ARoundStep, IsTheNextOfOneTwoAndFive) {
    EXPECT_EQ(roundStep(1), 1);
    EXPECT_EQ(roundStep(1.01), 2);
    EXPECT_EQ(roundStep(2), 2);
    EXPECT_EQ(roundStep(3), 5);
    EXPECT_EQ(roundStep(5.1), 10);
    EXPECT_EQ(roundStep(1000), 1000);
    EXPECT_EQ(roundStep(15'700), 20'000);
    EXPECT_EQ(roundStep(0.001), 1);
    EXPECT_EQ(roundStep(std::numeric_limits<double>::quiet_NaN()), 1);
}

} // namespace
