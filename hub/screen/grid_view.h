#pragma once

#include "hub/screen/frozen_pane.h"
#include "hub/screen/grid_drag.h"
#include "hub/screen/grid_heads.h"
#include "hub/screen/grid_places.h"

#include <QTableView>

#include <array>
#include <functional>

class QLabel;

namespace kota::hub {

class GridModel;

// A table that tells what the user does with the mouse and does nothing about it itself. Its frozen cells lie
// around the viewport, in places of which the coordinates are below 0.
class GridView : public QTableView {
public:
    GridView();

    std::function<void(const QModelIndex&)> onPress;
    std::function<void(const QModelIndex&)> onDoubleClick;
    // From one cell to another, by dragging or with Shift.
    std::function<void(const QModelIndex& from, const QModelIndex& to)> onSelect;
    std::function<void(int line, Qt::KeyboardModifiers held)> onLinePress;
    // The first line or column in view, or the number of lines in view, has become another.
    std::function<void()> onViewed;

    void showGrid(GridModel& grid);
    const GridModel& grid() const { return *grid_; }
    GridPlaces& places() { return places_; }
    const GridPlaces& places() const { return places_; }
    // Follows the grid's lines, columns, sizes and covered cells.
    void followLayout();
    // Draws all cells anew.
    void redraw();
    // How many whole lines are in view, at least one.
    int pageLines() const;
    // Shows a text at a cell until it is given none.
    void showWarning(const QModelIndex& index, const QString& text);
    // The widget in which the cell is.
    QWidget& widgetAt(const QModelIndex& index);

    // How a cell is drawn, for the frozen ones.
    QStyleOptionViewItem cellOption() const;
    QColor lineColour() const;

    // Room for the headings and a few lines.
    QSize minimumSizeHint() const override;
    QRect visualRect(const QModelIndex& index) const override;
    QModelIndex indexAt(const QPoint& point) const override;
    void scrollTo(const QModelIndex& index, ScrollHint hint = EnsureVisible) override;
    void dataChanged(const QModelIndex& first, const QModelIndex& last, const QList<int>& roles) override;

protected:
    void mousePressEvent(QMouseEvent* event) override;
    void mouseMoveEvent(QMouseEvent* event) override;
    void mouseReleaseEvent(QMouseEvent* event) override;
    void mouseDoubleClickEvent(QMouseEvent* event) override;
    void resizeEvent(QResizeEvent* event) override;
    void scrollContentsBy(int dx, int dy) override;
    void updateGeometries() override;

private:
    void showHeadSizes();
    void showCovers();
    void showAsOne(const CGXRange& cells);
    void placeWarning();

    GridModel* grid_ = nullptr;
    ColumnHead frozenHead_;
    GridPlaces places_;
    std::array<FrozenPane, 3> panes_;
    GridDrag drag_;
    QPersistentModelIndex pressedBox_; // a check box, which changes when the mouse is released on it
    QLabel* warning_;
    QPersistentModelIndex warnedAt_;
};

} // namespace kota::hub
