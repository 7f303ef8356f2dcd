#include "hub/project/line_index.h"
#include "tests/hub/project/printed.h"

#include <rapidcheck/gtest.h>

namespace {

using kota::hub::Box;
using kota::hub::LineIndex;
using Line = std::vector<QPointF>;

double distanceTo(QPointF first, QPointF second, QPointF point) {
    double least = std::hypot(first.x() - point.x(), first.y() - point.y());
    const QPointF step = second - first;
    for (int share = 0; share <= 1000; ++share) {
        const QPointF away = first + step * (share / 1000.0) - point;
        least = std::min(least, std::hypot(away.x(), away.y()));
    }
    return least;
}

Line anyLine() {
    Line line;
    const int vertices = *rc::gen::inRange(2, 150);
    for (int vertex = 0; vertex < vertices; ++vertex)
        line.emplace_back(*rc::gen::inRange(-100, 100), *rc::gen::inRange(-100, 100));
    return line;
}

RC_GTEST_PROP(ALineIndex, FindsTheNearestOfAllSegments, ()) {
    const Line line = anyLine();
    const QPointF point(*rc::gen::inRange(-200, 200), *rc::gen::inRange(-200, 200));
    double least = std::numeric_limits<double>::infinity();
    for (std::size_t segment = 0; segment + 1 < line.size(); ++segment)
        least = std::min(least, distanceTo(line[segment], line[segment + 1], point));
    const auto found = LineIndex(line).nearest(line, point, 1e6);
    RC_ASSERT(found.has_value());
    RC_ASSERT(std::abs(found->distance - least) < 0.3);
}

RC_GTEST_PROP(ALineIndex, LeavesOutNoSegmentThatMeetsAnArea, ()) {
    const Line line = anyLine();
    Box area;
    area.add(QPointF(*rc::gen::inRange(-100, 100), *rc::gen::inRange(-100, 100)));
    area.add(area.centre() + QPointF(*rc::gen::inRange(0, 60), *rc::gen::inRange(0, 60)));
    std::vector<bool> isGiven(line.size(), false);
    std::size_t before = 0;
    LineIndex(line).stretchesIn(area, [&](std::size_t first, std::size_t end) {
        RC_ASSERT(first >= before && first < end && end < line.size());
        before = end;
        for (std::size_t segment = first; segment < end; ++segment)
            isGiven[segment] = true;
    });
    for (std::size_t segment = 0; segment + 1 < line.size(); ++segment) {
        Box box;
        box.add(line[segment]);
        box.add(line[segment + 1]);
        RC_ASSERT(isGiven[segment] || !box.meets(area));
    }
}

TEST(ALineIndex, GivesNothingOfALineWithoutSegments) {
    for (const Line& line : {Line{}, Line{{1, 2}}}) {
        const LineIndex index(line);
        EXPECT_FALSE(index.nearest(line, {1, 2}, 10).has_value());
        EXPECT_TRUE(index.bounds().isEmpty());
    }
}

TEST(ALineIndex, GivesTheFirstOfTwoPlacesEquallyNear) {
    const Line line = {{0, 0}, {0, 10}, {10, 10}, {10, 0}};
    EXPECT_EQ(LineIndex(line).nearest(line, {5, 5}, 10)->segment, 0U);
}

} // namespace
