#pragma once

#include "hub/project/map_scene.h"

#include <QWidget>

#include <memory>

namespace kota::hub {

// A river network drawn to scale, on which a location is picked by a click.
//
// The wheel and + and - zoom, a drag and the arrow keys move the map, Home shows all of it. A click near a
// river picks the place on it; Escape takes the pick back.
class RiverMap : public QWidget {
public:
    explicit RiverMap(QWidget* parent = nullptr);

    // Shows all of a network, or, for null, what to do to see one. Drops the picked location without a word;
    // the current location is looked up anew.
    void showNetwork(std::shared_ptr<const Network> network);
    // How chainages and distances are told; in whole metres until this is set. Units are greater than 0
    // metres.
    void setChainageText(ChainageText chainages);

    // Marks where the editor is; not a place on the map when the network does not have it.
    void setCurrentLocation(const QString& river, double chainage);
    void clearCurrentLocation();

    const std::optional<Location>& picked() const { return picked_; }
    // Takes the pick back, as Escape does.
    void dropPick();
    // The user picked a location, or took the pick back.
    std::function<void(const std::optional<Location>&)> onPick;

    const Network& network() const { return *network_; }
    const MapViewPort& viewPort() const { return port_; }

    QSize sizeHint() const override;
    QSize minimumSizeHint() const override;

protected:
    void paintEvent(QPaintEvent* event) override;
    void resizeEvent(QResizeEvent* event) override;
    void wheelEvent(QWheelEvent* event) override;
    void mousePressEvent(QMouseEvent* event) override;
    void mouseMoveEvent(QMouseEvent* event) override;
    void mouseReleaseEvent(QMouseEvent* event) override;
    void keyPressEvent(QKeyEvent* event) override;

private:
    // A press of the mouse that is a click until it has moved far enough for a drag.
    struct Press {
        QPointF last;
        QPointF start;
        bool isDrag = false;
    };

    bool isEmpty() const { return network_->rivers().empty(); }
    void paintHint(QPainter& painter);
    void pan(QPointF pixels);
    void zoom(double factor, QPointF about);
    void pickAt(QPointF screen);
    void setPicked(std::optional<Location> location);
    bool moveByKey(int key);

    std::shared_ptr<const Network> network_; // never null
    MapViewPort port_;
    ChainageText chainages_;
    std::optional<Location> picked_;
    QString currentRiver_;
    std::optional<double> currentChainage_; // none for no current location
    std::optional<Press> press_;
};

} // namespace kota::hub
