#pragma once

#include <QColor>
#include <QPalette>

namespace kota::hub {

// The colours of a map, from those of the windows, so that it can be read on a light and on a dark ground.
struct MapColours {
    explicit MapColours(const QPalette& palette);

    QColor ground;
    QColor river;
    QColor riverName;
    QColor mark; // ticks, scale bar
    QColor markText;
    QColor text;
    QColor hint;    // on an empty map
    QColor pin;     // the picked location
    QColor current; // the current location of the editor
    QColor focus;
};

} // namespace kota::hub
