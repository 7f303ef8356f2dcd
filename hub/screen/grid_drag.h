#pragma once

#include <QPersistentModelIndex>
#include <QPoint>
#include <QTimer>

#include <functional>

namespace kota::hub {

class GridView;

// Follows the mouse from the cell where it was pressed over other cells, and scrolls for as long as it is
// beyond an edge.
class GridDrag {
public:
    explicit GridDrag(GridView& view);

    // Called for each other cell that is reached.
    std::function<void(const QModelIndex& from, const QModelIndex& to)> onReach;

    void begin(const QModelIndex& from);
    // In the coordinates of the viewport.
    void follow(const QPoint& place);
    void end();
    // Whether the mouse is still where it was pressed.
    bool isClick() const { return from_ == to_; }

private:
    void step();
    QModelIndex reached() const;

    GridView& view_;
    QTimer timer_;
    QPersistentModelIndex from_; // invalid while nothing is dragged
    QPersistentModelIndex to_;
    QPoint place_;
};

} // namespace kota::hub
