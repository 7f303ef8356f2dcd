#include "tests/hub/project/shown_map.h"

namespace {

using kota::hub::Location;
using kota::hub::Network;
using kota::test::IsAt;
using kota::test::river;
using kota::test::ShownMap;
using testing::IsEmpty;
using testing::SizeIs;

class AMap : public ShownMap {};

TEST_F(AMap, IsPickedFromByAClickNearARiver) {
    showRiver();
    click(at({2'500, 0}) + QPoint(0, 6));
    ASSERT_THAT(picks, SizeIs(1));
    ASSERT_TRUE(picks[0].has_value());
    EXPECT_EQ(picks[0]->river, "RED");
    EXPECT_NEAR(picks[0]->chainage, 2'500, 10'000 / 500.0);
    EXPECT_EQ(picks[0]->point.y(), 0);
    EXPECT_EQ(map.picked(), picks[0]);
}

TEST_F(AMap, KeepsThePickAtAClickAwayFromRivers) {
    showRiver();
    click(at({2'500, 0}));
    const auto before = map.picked();
    click(at({2'500, 0}) + QPoint(0, 40));
    EXPECT_THAT(picks, SizeIs(1));
    EXPECT_EQ(map.picked(), before);
}

TEST_F(AMap, TakesThePickBackByEscape) {
    showRiver();
    click(at({2'500, 0}));
    press(Qt::Key_Escape);
    ASSERT_THAT(picks, SizeIs(2));
    EXPECT_EQ(picks[1], std::nullopt);
    EXPECT_EQ(map.picked(), std::nullopt);
    press(Qt::Key_Escape);
    EXPECT_THAT(picks, SizeIs(2));
}

TEST_F(AMap, LeavesEscapeToOthersWithoutAPick) {
    showRiver();
    QKeyEvent escape(QEvent::KeyPress, Qt::Key_Escape, {});
    QApplication::sendEvent(&map, &escape);
    EXPECT_FALSE(escape.isAccepted());
    click(at({2'500, 0}));
    escape.accept();
    QApplication::sendEvent(&map, &escape);
    EXPECT_TRUE(escape.isAccepted());
}

TEST_F(AMap, IsMovedByADragWhichPicksNothing) {
    showRiver();
    const QPoint from = at({5'000, 0});
    drag(from, from + QPoint(60, -45));
    EXPECT_THAT(map.viewPort().toScreen({5'000, 0}), IsAt(from.x() + 60, from.y() - 45, 1));
    EXPECT_THAT(picks, IsEmpty());
}

TEST_F(AMap, TakesAClickOfAnUnsteadyHand) {
    showRiver();
    const QPoint from = at({5'000, 0});
    drag(from, from + QPoint(2, 1));
    EXPECT_THAT(picks, SizeIs(1));
    EXPECT_THAT(map.viewPort().toScreen({5'000, 0}), IsAt(from.x(), from.y(), 1));
}

TEST_F(AMap, IsNotPickedFromByTheRightButton) {
    showRiver();
    QTest::mouseClick(&map, Qt::RightButton, {}, at({5'000, 0}));
    EXPECT_THAT(picks, IsEmpty());
}

TEST_F(AMap, KeepsWhatIsUnderTheMouseWhenTheWheelTurns) {
    showRiver();
    const QPointF mouse(180, 230);
    const QPointF there = map.viewPort().toPlane(mouse);
    const double scale = map.viewPort().scale();
    turnWheel(mouse, 3);
    EXPECT_THAT(map.viewPort().toPlane(mouse), IsAt(there.x(), there.y(), 1e-6));
    EXPECT_GT(map.viewPort().scale(), 1.5 * scale);
    turnWheel(mouse, -3);
    EXPECT_NEAR(map.viewPort().scale(), scale, 1e-9);
}

TEST_F(AMap, IsZoomedByKeys) {
    showRiver();
    const double scale = map.viewPort().scale();
    press(Qt::Key_Plus);
    EXPECT_GT(map.viewPort().scale(), scale);
    EXPECT_THAT(map.viewPort().toScreen({5'000, 0}), IsAt(300, 200, 1e-6));
    press(Qt::Key_Minus);
    press(Qt::Key_Minus);
    EXPECT_LT(map.viewPort().scale(), scale);
}

TEST_F(AMap, IsMovedByArrowKeysAndComesHome) {
    showRiver();
    press(Qt::Key_Plus);
    press(Qt::Key_Right);
    EXPECT_LT(map.viewPort().toScreen({5'000, 0}).x(), 299);
    press(Qt::Key_Down);
    EXPECT_LT(map.viewPort().toScreen({5'000, 0}).y(), 199);
    press(Qt::Key_Left);
    press(Qt::Key_Up);
    EXPECT_THAT(map.viewPort().toScreen({5'000, 0}), IsAt(300, 200, 1e-6));
    press(Qt::Key_Up);
    press(Qt::Key_Home);
    EXPECT_TRUE(map.viewPort().showsAll());
    EXPECT_THAT(map.viewPort().toScreen({5'000, 0}), IsAt(300, 200, 1e-6));
}

TEST_F(AMap, DrawsItsRivers) {
    showRiver();
    const QImage image = picture();
    EXPECT_GE(pixelsOf(colours().river, image, around(at({2'050, 0}), 1)), 3);
    EXPECT_EQ(pixelsOf(colours().river, image, around(at({2'050, 0}) + QPoint(0, 60), 8)), 0);
}

TEST_F(AMap, MarksThePickWhereItIs) {
    showRiver();
    const QPoint there = at({2'500, 0});
    EXPECT_EQ(pixelsOf(colours().pin, picture(), map.rect()), 0);
    click(there);
    const QImage image = picture();
    EXPECT_GE(pixelsOf(colours().pin, image, around(there, 1)), 8);
    EXPECT_GE(pixelsOf(colours().pin, image, around(there - QPoint(0, 24), 8)), 60);
    EXPECT_GE(pixelsOf(colours().text, image, QRect(there + QPoint(14, -40), QSize(150, 32))), 40);
    press(Qt::Key_Escape);
    EXPECT_EQ(pixelsOf(colours().pin, picture(), map.rect()), 0);
}

TEST_F(AMap, MarksTheCurrentLocationWhereItIs) {
    showRiver();
    const QPoint there = at({7'500, 0});
    EXPECT_EQ(pixelsOf(colours().current, picture(), map.rect()), 0);
    map.setCurrentLocation("RED", 7'500);
    EXPECT_GE(pixelsOf(colours().current, picture(), around(there, 1)), 8);
    map.setCurrentLocation("RED", 20'000);
    EXPECT_EQ(pixelsOf(colours().current, picture(), map.rect()), 0);
    map.setCurrentLocation("RED", 7'500);
    map.clearCurrentLocation();
    EXPECT_EQ(pixelsOf(colours().current, picture(), map.rect()), 0);
    EXPECT_THAT(picks, IsEmpty());
}

TEST_F(AMap, TellsChainagesInTheUnitGiven) {
    showRiver();
    std::vector<double> told;
    map.setChainageText({[&told](double metres) {
                             told.push_back(metres);
                             return QString::number(metres / 0.3048) + " ft";
                         },
                         0.3048});
    click(at({2'500, 0}));
    picture();
    EXPECT_THAT(told, testing::Contains(map.picked()->chainage));
    EXPECT_THAT(told, testing::Contains(testing::DoubleNear(5'000 * 0.3048, 1e-6)));
}

TEST_F(AMap, ForgetsThePickWithItsNetwork) {
    showRiver();
    click(at({2'500, 0}));
    map.setCurrentLocation("BLUE", 50);
    show({river("BLUE", {{0, 0}, {0, 100}}, {0, 100})});
    EXPECT_EQ(map.picked(), std::nullopt);
    EXPECT_THAT(picks, SizeIs(1));
    EXPECT_GE(pixelsOf(colours().current, picture(), around(at({0, 50}), 1)), 8);
}

TEST_F(AMap, SaysWhatToDoWhenEmpty) {
    map.showNetwork(nullptr);
    EXPECT_GE(pixelsOf(colours().hint, picture(), map.rect()), 100);
    click({300, 200});
    press(Qt::Key_Plus);
    press(Qt::Key_Home);
    turnWheel({10, 10}, -2);
    EXPECT_THAT(picks, IsEmpty());
    showRiver();
    EXPECT_EQ(pixelsOf(colours().hint, picture(), around({300, 150}, 20)), 0);
}

TEST_F(AMap, IsNamedAndTakesTheKeys) {
    EXPECT_EQ(map.accessibleName(), "River map");
    EXPECT_EQ(map.focusPolicy(), Qt::StrongFocus);
}

// What picks may close the map's network at once.
TEST_F(AMap, MayBeGivenAnotherNetworkByItsPick) {
    showRiver();
    map.onPick = [this](const auto&) { map.showNetwork(nullptr); };
    click(at({2'500, 0}));
    EXPECT_EQ(map.picked(), std::nullopt);
    picture();
}

TEST_F(AMap, DrawsOddRivers) {
    show({river("POINT", {{500, 500}, {500, 500}}, {0, 100}), river("STILL", {{0, 0}, {900, 0}}, {5, 5}),
          river("STEEP", {{0, 100}, {900, 100}}, {-1e9, 1e9}),
          river("FALL", {{0, 200}, {900, 200}}, {900, 0}),
          river("TWICE", {{0, 300}, {0, 300}, {900, 300}, {900, 300}}, {0, 0, 0.001, 0.001}),
          river("FAR", {{-1e9, 400}, {1e9, 400}}, {0, 2e9})});
    for (const int steps : {0, 30, 60, -100})
        for (const bool isSmall : {false, true}) {
            map.resize(isSmall ? QSize(1, 1) : QSize(600, 400));
            turnWheel({300, 200}, steps);
            EXPECT_FALSE(picture().isNull());
        }
}

TEST_F(AMap, DrawsARiverOfNoExtent) {
    show({river("POINT", {{500, 500}, {500, 500}}, {0, 100})});
    EXPECT_GE(pixelsOf(colours().river, picture(), around({300, 200}, 2)), 2);
    click({300, 200});
    ASSERT_THAT(picks, SizeIs(1));
    EXPECT_EQ(picks[0], (Location{"POINT", 0, {500, 500}}));
}

} // namespace
