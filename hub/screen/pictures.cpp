#include "hub/screen/pictures.h"

#include <QGuiApplication>
#include <QImage>
#include <QPalette>

#include <vector>

namespace kota::hub {

namespace {

// Turns dark colours light, for a dark background.
QImage lightened(QImage picture) {
    picture.convertTo(QImage::Format_ARGB32);
    for (int y = 0; y < picture.height(); ++y)
        for (int x = 0; x < picture.width(); ++x) {
            const QColor colour = picture.pixelColor(x, y);
            const float lightness = colour.lightnessF();
            if (colour.alpha() > 0 && lightness < 0.5F)
                picture.setPixelColor(x, y,
                                      QColor::fromHslF(colour.hslHueF(), colour.hslSaturationF(),
                                                       1 - lightness, colour.alphaF()));
        }
    return picture;
}

} // namespace

QPixmap pictureOf(const BitmapResource* bitmap) {
    if (!bitmap)
        return {};
    std::vector<const char*> rows(bitmap->rows.begin(), bitmap->rows.end());
    const QImage picture(rows.data());
    const bool onDark = QGuiApplication::palette().color(QPalette::Window).lightnessF() < 0.5F;
    return QPixmap::fromImage(onDark ? lightened(picture) : picture);
}

QPixmap buttonPicture(const BitmapResource* bitmap, const ToolBarTemplate& bar, int button) {
    return pictureOf(bitmap).copy(button * bar.buttonWidth, 0, bar.buttonWidth, bar.buttonHeight);
}

} // namespace kota::hub
