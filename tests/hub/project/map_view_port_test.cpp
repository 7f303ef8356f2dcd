#include "hub/project/map_view_port.h"
#include "tests/hub/project/printed.h"

namespace {

using kota::hub::Box;
using kota::hub::MapViewPort;
using kota::test::IsAt;

Box boxOf(QPointF first, QPointF second) {
    Box box;
    box.add(first);
    box.add(second);
    return box;
}

MapViewPort portOf(const Box& area, QSizeF size = {400, 300}) {
    MapViewPort port;
    port.resize(size);
    port.setArea(area);
    return port;
}

TEST(AViewPort, ShowsTheWholeAreaNorthUp) {
    const MapViewPort port = portOf(boxOf({1000, 1000}, {3000, 2000}));
    EXPECT_THAT(port.toScreen({2000, 1500}), IsAt(200, 150, 1e-9));
    EXPECT_LT(port.toScreen({2000, 2000}).y(), 150);
    EXPECT_GE(port.toScreen({1000, 1000}).x(), 30);
    EXPECT_LE(port.toScreen({3000, 2000}).x(), 370);
    EXPECT_GE(port.toScreen({3000, 2000}).y(), 30);
    EXPECT_DOUBLE_EQ(port.magnification(), 1);
}

TEST(AViewPort, ComesBackFromTheScreen) {
    MapViewPort port = portOf(boxOf({1000, 1000}, {3000, 2000}));
    port.zoom(3, {10, 20});
    EXPECT_THAT(port.toPlane(port.toScreen({1234, 1567})), IsAt(1234, 1567, 1e-9));
}

TEST(AViewPort, KeepsWhatIsUnderThePlaceOfAZoom) {
    MapViewPort port = portOf(boxOf({0, 0}, {10'000, 10'000}));
    const QPointF kept = port.toPlane({250, 100});
    for (const double factor : {2.0, 1.7, 0.6, 5.0}) {
        port.zoom(factor, {250, 100});
        EXPECT_THAT(port.toPlane({250, 100}), IsAt(kept.x(), kept.y(), 1e-6));
    }
}

TEST(AViewPort, HasLimitsOfItsScale) {
    MapViewPort port = portOf(boxOf({0, 0}, {10'000, 10'000}));
    port.zoom(1e30, {200, 150});
    EXPECT_DOUBLE_EQ(port.scale(), 10);
    port.zoom(1e-30, {200, 150});
    EXPECT_DOUBLE_EQ(port.magnification(), 0.5);
    port.zoom(0, {200, 150});
    EXPECT_GT(port.scale(), 0);
}

TEST(AViewPort, CannotLoseTheArea) {
    MapViewPort port = portOf(boxOf({0, 0}, {10'000, 10'000}));
    port.pan({1e6, -1e6});
    const QPointF corner = port.toScreen({0, 0});
    EXPECT_THAT(corner, IsAt(360, 40, 1e-6));
}

TEST(AViewPort, FollowsItsSizeWhileAllIsShown) {
    MapViewPort port = portOf(boxOf({0, 0}, {10'000, 10'000}));
    const double scale = port.scale();
    port.resize({800, 600});
    EXPECT_GT(port.scale(), scale);
    EXPECT_THAT(port.toScreen({5'000, 5'000}), IsAt(400, 300, 1e-9));
    port.zoom(2, {400, 300});
    const double larger = port.scale();
    port.resize({500, 500});
    EXPECT_EQ(port.scale(), larger);
    EXPECT_THAT(port.toScreen({5'000, 5'000}), IsAt(250, 250, 1e-9));
}

TEST(AViewPort, TakesAreasAndSizesOfNothing) {
    for (const Box& area : {Box(), boxOf({5, 5}, {5, 5}), boxOf({-1e9, 0}, {1e9, 0})})
        for (const QSizeF size : {QSizeF(0, 0), QSizeF(1, 500), QSizeF(400, 300)}) {
            MapViewPort port = portOf(area, size);
            port.pan({3, 3});
            port.zoom(2, {0, 0});
            EXPECT_TRUE(std::isfinite(port.toScreen({1, 1}).x()));
            EXPECT_TRUE(std::isfinite(port.toPlane({1, 1}).y()));
            EXPECT_GT(port.scale(), 0);
        }
}

} // namespace
