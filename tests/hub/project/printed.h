#pragma once

#include "hub/project/network.h"

#include <QPointF>
#include <QString>

#include <gmock/gmock.h>

#include <ostream>

// How values read in a failed test.

QT_BEGIN_NAMESPACE
inline void PrintTo(const QString& text, std::ostream* out) {
    *out << '"' << text.toStdString() << '"';
}
inline void PrintTo(QPointF point, std::ostream* out) {
    *out << '(' << point.x() << ", " << point.y() << ')';
}
QT_END_NAMESPACE

namespace kota::hub {
inline void PrintTo(const Location& location, std::ostream* out) {
    *out << location.river.toStdString() << ' ' << location.chainage << " at ";
    PrintTo(location.point, out);
}
} // namespace kota::hub

namespace kota::test {

MATCHER_P3(IsAt, x, y, tolerance, "") {
    return std::abs(arg.x() - x) <= tolerance && std::abs(arg.y() - y) <= tolerance;
}

inline hub::River river(const char* name, std::vector<QPointF> vertices, std::vector<double> chainages) {
    return {name, std::move(vertices), std::move(chainages)};
}

} // namespace kota::test
