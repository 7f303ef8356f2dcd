#pragma once

#include <QPalette>

#include <algorithm>
#include <cmath>

namespace kota::test {

inline QPalette darkPalette() {
    QPalette palette(QColor(0x35, 0x35, 0x35));
    palette.setColor(QPalette::Base, QColor(0x23, 0x23, 0x23));
    palette.setColor(QPalette::Highlight, QColor(0x2a, 0x82, 0xda));
    for (const QPalette::ColorRole role : {QPalette::Text, QPalette::WindowText, QPalette::ButtonText})
        palette.setColor(role, Qt::white);
    return palette;
}

// By the usual formula: 1 for equal colours, 21 for black and white.
inline double contrast(const QColor& left, const QColor& right) {
    const auto linear = [](double part) {
        return part <= 0.04045 ? part / 12.92 : std::pow((part + 0.055) / 1.055, 2.4);
    };
    const auto luminance = [&](const QColor& colour) {
        return 0.2126 * linear(colour.redF()) + 0.7152 * linear(colour.greenF()) +
               0.0722 * linear(colour.blueF());
    };
    const double lighter = std::max(luminance(left), luminance(right));
    const double darker = std::min(luminance(left), luminance(right));
    return (lighter + 0.05) / (darker + 0.05);
}

} // namespace kota::test
