#pragma once

#include "hub/project/map_colours.h"
#include "hub/project/river_map.h"
#include "tests/hub/project/printed.h"

#include <QApplication>
#include <QDir>
#include <QTest>
#include <QWheelEvent>

namespace kota::test {

// A map of 600 to 400 pixels, shown, and its user.
class ShownMap : public testing::Test {
protected:
    ShownMap() {
        map.resize(600, 400);
        map.onPick = [this](const std::optional<hub::Location>& location) { picks.push_back(location); };
    }

    void show(std::vector<hub::River> rivers) {
        map.showNetwork(std::make_shared<const hub::Network>(std::move(rivers)));
        map.show();
        map.setFocus();
    }
    // A river of 10 km to the east, of chainages 0 to 10,000, in the middle of the map.
    void showRiver() { show({river("RED", {{0, 0}, {10'000, 0}}, {0, 10'000})}); }

    QPoint at(QPointF plane) const { return map.viewPort().toScreen(plane).toPoint(); }
    void click(QPoint pixel) { QTest::mouseClick(&map, Qt::LeftButton, {}, pixel); }
    void press(Qt::Key key) { QTest::keyClick(&map, key); }
    void drag(QPoint from, QPoint to) {
        QTest::mousePress(&map, Qt::LeftButton, {}, from);
        QTest::mouseMove(&map, (from + to) / 2);
        QTest::mouseMove(&map, to);
        QTest::mouseRelease(&map, Qt::LeftButton, {}, to);
    }
    void turnWheel(QPointF pixel, int steps) {
        QWheelEvent event(pixel, map.mapToGlobal(pixel), {}, {0, 120 * steps}, Qt::NoButton, {},
                          Qt::NoScrollPhase, false);
        QApplication::sendEvent(&map, &event);
    }

    QImage picture() { return map.grab().toImage(); }
    hub::MapColours colours() const { return hub::MapColours(map.palette()); }
    // How many pixels of a rectangle have nearly a colour.
    static int pixelsOf(const QColor& colour, const QImage& image, QRect rect) {
        rect &= image.rect();
        int count = 0;
        for (int y = rect.top(); y <= rect.bottom(); ++y)
            for (int x = rect.left(); x <= rect.right(); ++x) {
                const QColor pixel = image.pixelColor(x, y);
                const int away = std::abs(pixel.red() - colour.red()) +
                                 std::abs(pixel.green() - colour.green()) +
                                 std::abs(pixel.blue() - colour.blue());
                count += away < 24 ? 1 : 0;
            }
        return count;
    }
    static QRect around(QPoint pixel, int reach) {
        return {pixel - QPoint(reach, reach), pixel + QPoint(reach, reach)};
    }

    hub::RiverMap map;
    std::vector<std::optional<hub::Location>> picks;
};

} // namespace kota::test
