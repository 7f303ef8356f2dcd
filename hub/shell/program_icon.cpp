#include "hub/shell/program_icon.h"

#include <QPainter>
#include <QPainterPath>

namespace kota::hub {

namespace {

const QColor land(0x2e, 0x7d, 0x32);
const QColor water(0x15, 0x65, 0xc0);
const QColor foam(0xe3, 0xf2, 0xfd);

// In a square of side 1.
QPainterPath wave(qreal height) {
    QPainterPath path(QPointF(-0.1, height));
    path.cubicTo(QPointF(0.25, height - 0.3), QPointF(0.4, height + 0.3), QPointF(0.6, height));
    path.cubicTo(QPointF(0.75, height - 0.2), QPointF(0.95, height - 0.1), QPointF(1.1, height));
    return path;
}

QPixmap draw(int side) {
    QPixmap pixmap(side, side);
    pixmap.fill(Qt::transparent);
    QPainter painter(&pixmap);
    painter.setRenderHint(QPainter::Antialiasing);
    painter.scale(side, side);
    QPainterPath square;
    square.addRoundedRect(QRectF(0.03, 0.03, 0.94, 0.94), 0.18, 0.18);
    painter.setClipPath(square);
    painter.fillPath(square, land);
    painter.setPen(QPen(water, 0.42));
    painter.drawPath(wave(0.5));
    painter.setPen(QPen(foam, 0.05));
    painter.drawPath(wave(0.43));
    painter.drawPath(wave(0.58));
    return pixmap;
}

} // namespace

QIcon programIcon() {
    QIcon icon;
    for (const int side : {16, 24, 32, 48, 64, 128, 256})
        icon.addPixmap(draw(side));
    return icon;
}

} // namespace kota::hub
