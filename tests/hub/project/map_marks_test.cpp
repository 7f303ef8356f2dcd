#include "hub/project/chainage_marks.h"
#include "hub/project/drawn_stretch.h"
#include "hub/project/map_signs.h"
#include "tests/hub/project/printed.h"

namespace {

using kota::hub::ChainageMarks;
using kota::hub::ChainageText;
using kota::hub::DrawnStretch;
using kota::hub::DrawnStretches;
using kota::hub::MapScene;
using kota::hub::MapViewPort;
using kota::hub::Network;
using kota::test::IsAt;
using kota::test::river;
using testing::ElementsAre;
using testing::IsEmpty;

// A network in a view of 400 to 300 pixels, of 1 pixel for each 10 metres, with (0, 0) in the middle.
class InView : public testing::Test {
protected:
    void show(std::vector<kota::hub::River> rivers) {
        network = Network(std::move(rivers));
        kota::hub::Box area;
        area.add(QPointF(-20'000, -20'000));
        area.add(QPointF(20'000, 20'000));
        port.resize({400, 300});
        port.setArea(area);
        port.zoom(0.1 / port.scale(), {200, 150});
    }
    DrawnStretches stretches(double closest = 1) const { return {network, {port, 0, closest}}; }
    MapScene scene() const {
        return {.network = network,
                .port = port,
                .chainages = text,
                .palette = {},
                .font = {},
                .pixelRatio = 1,
                .picked = {},
                .current = {}};
    }
    std::vector<double> of(std::vector<double> (ChainageMarks::*what)() const) const {
        const DrawnStretches found = stretches();
        const DrawnStretch first = found[0];
        return (ChainageMarks(scene(), first).*what)();
    }
    std::vector<double> marks() const { return of(&ChainageMarks::marks); }
    std::vector<double> arrows() const { return of(&ChainageMarks::arrows); }

    Network network;
    MapViewPort port;
    ChainageText text{[](double metres) { return QString::number(metres); }, 1};
};

TEST_F(InView, ALineIsCutOffAtTheEdges) {
    show({river("R", {{-10'000, 500}, {10'000, 500}}, {0, 20'000})});
    const DrawnStretches found = stretches();
    ASSERT_EQ(found.size(), 1U);
    EXPECT_THAT(found[0].points, ElementsAre(IsAt(0, 100, 1e-9), IsAt(400, 100, 1e-9)));
    EXPECT_THAT(found[0].chainages, ElementsAre(8'000, 12'000));
    EXPECT_EQ(found[0].length(), 400);
}

TEST_F(InView, ALineThatLeavesAndComesBackIsTwoStretches) {
    show({river("R", {{0, 0}, {0, 3'000}, {1'000, 3'000}, {1'000, 0}}, {0, 3'000, 4'000, 7'000})});
    const DrawnStretches found = stretches();
    ASSERT_EQ(found.size(), 2U);
    EXPECT_THAT(found[0].points, ElementsAre(IsAt(200, 150, 1e-9), IsAt(200, 0, 1e-9)));
    EXPECT_THAT(found[1].points, ElementsAre(IsAt(300, 0, 1e-9), IsAt(300, 150, 1e-9)));
    EXPECT_THAT(found[1].chainages, ElementsAre(5'500, 7'000));
}

TEST_F(InView, ALineBesideTheViewIsNotDrawn) {
    show({river("R", {{-10'000, 2'000}, {10'000, 2'000}}, {0, 1}),
          river("S", {{1'000, 3'000}, {3'500, 0}}, {0, 1})});
    EXPECT_EQ(stretches().size(), 0U);
}

TEST_F(InView, VerticesCloserThanAPixelAreNotDrawn) {
    std::vector<QPointF> vertices;
    std::vector<double> chainages;
    for (int vertex = 0; vertex <= 1'000; ++vertex) {
        vertices.emplace_back(vertex, 0);
        chainages.push_back(vertex);
    }
    show({river("R", vertices, chainages)});
    const DrawnStretches found = stretches();
    ASSERT_EQ(found.size(), 1U);
    EXPECT_LE(found[0].points.size(), 102U);
    EXPECT_THAT(found[0].points.back(), IsAt(300, 150, 1e-9));
    EXPECT_EQ(found[0].chainages.back(), 1'000);
    EXPECT_NEAR(found[0].length(), 100, 1e-6);
    EXPECT_NEAR(found[0].lengthAt(505), 50.5, 1e-6);
}

TEST_F(InView, ALineOfOnePointIsAStretchOfNoLength) {
    show({river("R", {{0, 0}, {0, 0}, {0, 0}}, {0, 5, 10})});
    const DrawnStretches found = stretches();
    ASSERT_EQ(found.size(), 1U);
    EXPECT_EQ(found[0].length(), 0);
    EXPECT_EQ(found[0].directionAt(0), QPointF());
    EXPECT_THAT(marks(), IsEmpty());
    EXPECT_THAT(arrows(), IsEmpty());
}

TEST_F(InView, MarksStandAtRoundChainages) {
    show({river("R", {{-1'500, 0}, {1'500, 0}}, {100, 3'100})});
    EXPECT_THAT(marks(), ElementsAre(1'000, 2'000, 3'000));
    EXPECT_THAT(arrows(), ElementsAre(40, 140, 240));
}

TEST_F(InView, MarksStandAtRoundNumbersOfTheUnit) {
    text.metresPerUnit = 0.3048;
    show({river("R", {{-1'500, 0}, {1'500, 0}}, {100, 3'100})});
    EXPECT_THAT(marks(), ElementsAre(testing::DoubleEq(1'524), testing::DoubleEq(3'048)));
}

TEST_F(InView, MarksKeepTheirDistanceWhateverTheChainages) {
    for (const double span : {1e-6, 0.5, 30.0, 7'000.0, 1e9}) {
        show({river("R", {{-1'500, 0}, {1'500, 0}}, {0, span})});
        EXPECT_LE(marks().size(), 6U) << span;
        EXPECT_GE(arrows().size(), 1U) << span;
    }
}

TEST_F(InView, MarksFollowFallingChainages) {
    show({river("R", {{-1'500, 0}, {1'500, 0}}, {3'000, 0})});
    EXPECT_THAT(marks(), ElementsAre(0, 1'000, 2'000, 3'000));
    const DrawnStretches found = stretches();
    EXPECT_EQ(found[0].lengthAt(1'000), 200);
}

TEST_F(InView, EqualChainagesHaveNoMarksAndNoDirection) {
    show({river("R", {{-1'500, 0}, {1'500, 0}}, {7, 7})});
    EXPECT_THAT(marks(), IsEmpty());
    EXPECT_THAT(arrows(), IsEmpty());
}

TEST_F(InView, ThePinOfAPickIsReadInEveryCorner) {
    show({river("R", {{-1'500, 0}, {1'500, 0}}, {0, 3'000})});
    const QRectF view({0, 0}, port.size());
    for (const QPointF corner : {QPointF(1, 1), QPointF(399, 1), QPointF(1, 299), QPointF(399, 299)}) {
        const kota::hub::Pin pin(scene(), {"MISSOURI", 187'328, port.toPlane(corner)});
        EXPECT_TRUE(view.contains(pin.textRect())) << corner.x() << ", " << corner.y();
        EXPECT_FALSE(pin.textRect().contains(corner));
        EXPECT_TRUE(pin.rect().contains(corner));
    }
}

TEST_F(InView, TheScaleBarHasARoundLength) {
    show({river("R", {{-1'500, 0}, {1'500, 0}}, {0, 3'000})});
    std::vector<double> told;
    text.text = [&told](double metres) {
        told.push_back(metres);
        return QString::number(metres);
    };
    const kota::hub::ScaleBar bar(scene());
    EXPECT_THAT(told, ElementsAre(1'000));
    text.metresPerUnit = 0.3048;
    const kota::hub::ScaleBar barInFeet(scene());
    EXPECT_THAT(told, ElementsAre(1'000, testing::DoubleEq(609.6)));
}

} // namespace
