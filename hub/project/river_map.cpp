#include "hub/project/river_map.h"

#include "hub/project/map_colours.h"
#include "hub/project/map_painter.h"
#include "hub/project/project_texts.h"

#include <QApplication>
#include <QKeyEvent>
#include <QMouseEvent>
#include <QPainter>
#include <QWheelEvent>

#include <cmath>
#include <utility>

namespace kota::hub {

namespace {

constexpr double pickDistance = 12; // pixels from a river
constexpr double keyZoom = 1.4;     // by + and -
constexpr double wheelZoom = 1.25;  // by one step of the wheel
constexpr double wheelStep = 120;   // of the wheel's angle
constexpr double keyPan = 0.125;    // of the map's size, by an arrow key

QString wholeMetres(double metres) {
    return projectText(ProjectText::Metres).arg(QString::number(metres, 'f', 0));
}

} // namespace

RiverMap::RiverMap(QWidget* parent)
    : QWidget(parent), network_(std::make_shared<const Network>()), chainages_{wholeMetres, 1} {
    setFocusPolicy(Qt::StrongFocus);
    setAccessibleName(projectText(ProjectText::MapName));
    setBackgroundRole(QPalette::Base);
    setAutoFillBackground(true);
}

QSize RiverMap::sizeHint() const {
    return {640, 480};
}

QSize RiverMap::minimumSizeHint() const {
    return {160, 120};
}

void RiverMap::showNetwork(std::shared_ptr<const Network> network) {
    network_ = network ? std::move(network) : std::make_shared<const Network>();
    picked_.reset();
    press_.reset();
    port_.setArea(network_->bounds());
    update();
}

void RiverMap::setChainageText(ChainageText chainages) {
    chainages_ = std::move(chainages);
    update();
}

void RiverMap::setCurrentLocation(const QString& river, double chainage) {
    currentRiver_ = river;
    currentChainage_ = chainage;
    update();
}

void RiverMap::clearCurrentLocation() {
    currentChainage_.reset();
    update();
}

void RiverMap::paintEvent(QPaintEvent* /*event*/) {
    QPainter painter(this);
    if (isEmpty())
        paintHint(painter);
    else
        paintMap(painter, {.network = *network_,
                           .port = port_,
                           .chainages = chainages_,
                           .palette = palette(),
                           .font = font(),
                           .pixelRatio = devicePixelRatioF(),
                           .picked = picked_,
                           .current = currentChainage_ ? network_->place(currentRiver_, *currentChainage_)
                                                       : std::nullopt});
    if (!hasFocus())
        return;
    painter.setRenderHint(QPainter::Antialiasing, false);
    painter.setBrush(Qt::NoBrush);
    painter.setPen(MapColours(palette()).focus);
    painter.drawRect(rect().adjusted(0, 0, -1, -1));
}

void RiverMap::paintHint(QPainter& painter) {
    constexpr int edge = 16;
    painter.setPen(MapColours(palette()).hint);
    painter.drawText(rect().adjusted(edge, edge, -edge, -edge), Qt::AlignCenter | Qt::TextWordWrap,
                     projectText(ProjectText::EmptyMap));
}

void RiverMap::resizeEvent(QResizeEvent* /*event*/) {
    port_.resize(size());
}

void RiverMap::pan(QPointF pixels) {
    port_.pan(pixels);
    update();
}

void RiverMap::zoom(double factor, QPointF about) {
    port_.zoom(factor, about);
    update();
}

void RiverMap::wheelEvent(QWheelEvent* event) {
    zoom(std::pow(wheelZoom, event->angleDelta().y() / wheelStep), event->position());
    event->accept();
}

void RiverMap::mousePressEvent(QMouseEvent* event) {
    if (event->button() == Qt::LeftButton)
        press_ = {.last = event->position(), .start = event->position()};
}

void RiverMap::mouseMoveEvent(QMouseEvent* event) {
    if (!press_ || !event->buttons().testFlag(Qt::LeftButton))
        return;
    const double moved = (event->position() - press_->start).manhattanLength();
    if (!press_->isDrag && moved < QApplication::startDragDistance())
        return;
    press_->isDrag = true;
    setCursor(Qt::ClosedHandCursor);
    pan(event->position() - std::exchange(press_->last, event->position()));
}

void RiverMap::mouseReleaseEvent(QMouseEvent* event) {
    if (event->button() != Qt::LeftButton || !press_)
        return;
    const bool isClick = !press_->isDrag;
    press_.reset();
    unsetCursor();
    if (isClick)
        pickAt(event->position());
}

void RiverMap::pickAt(QPointF screen) {
    const QPointF point = port_.toPlane(screen);
    if (const std::optional<Location> found = network_->nearest(point, pickDistance / port_.scale()))
        setPicked(found);
}

void RiverMap::dropPick() {
    if (picked_)
        setPicked(std::nullopt);
}

// The receiver may show another network or pick anew.
void RiverMap::setPicked(std::optional<Location> location) {
    picked_ = std::move(location);
    update();
    if (onPick)
        onPick(std::optional<Location>(picked_));
}

bool RiverMap::moveByKey(int key) {
    const QPointF middle(width() / 2.0, height() / 2.0);
    const QPointF step(width() * keyPan, height() * keyPan);
    switch (key) {
    case Qt::Key_Plus:
    case Qt::Key_Equal:
        zoom(keyZoom, middle);
        return true;
    case Qt::Key_Minus:
        zoom(1 / keyZoom, middle);
        return true;
    case Qt::Key_Left:
        pan({step.x(), 0});
        return true;
    case Qt::Key_Right:
        pan({-step.x(), 0});
        return true;
    case Qt::Key_Up:
        pan({0, step.y()});
        return true;
    case Qt::Key_Down:
        pan({0, -step.y()});
        return true;
    case Qt::Key_Home:
        port_.showAll();
        update();
        return true;
    default:
        return false;
    }
}

void RiverMap::keyPressEvent(QKeyEvent* event) {
    if (event->key() == Qt::Key_Escape && picked_)
        setPicked(std::nullopt);
    else if (!moveByKey(event->key()))
        QWidget::keyPressEvent(event);
}

} // namespace kota::hub
