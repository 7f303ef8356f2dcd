#include "hub/project/map_colours.h"

namespace kota::hub {

namespace {

// `share` of the first colour, the rest of the second.
QColor mixed(const QColor& first, const QColor& second, float share) {
    const auto part = [share](float one, float other) { return share * one + (1 - share) * other; };
    return QColor::fromRgbF(part(first.redF(), second.redF()), part(first.greenF(), second.greenF()),
                            part(first.blueF(), second.blueF()));
}

} // namespace

MapColours::MapColours(const QPalette& palette)
    : ground(palette.color(QPalette::Base)), text(palette.color(QPalette::Text)),
      focus(palette.color(QPalette::Highlight)) {
    const bool isDark = ground.lightnessF() < 0.5F;
    river = isDark ? QColor(0x5f, 0xa3, 0xdc) : QColor(0x3f, 0x84, 0xc4);
    riverName = isDark ? QColor(0x9c, 0xc9, 0xf0) : QColor(0x1c, 0x55, 0x8c);
    pin = isDark ? QColor(0xff, 0x7a, 0x66) : QColor(0xc8, 0x32, 0x2b);
    current = isDark ? QColor(0xf2, 0xb8, 0x4b) : QColor(0xc7, 0x7c, 0x02);
    mark = mixed(text, ground, 0.62F);
    markText = mixed(text, ground, 0.72F);
    hint = mixed(text, ground, 0.58F);
}

} // namespace kota::hub
