#pragma once

#include "platform/grid/range.h"

#include <QWidget>

#include <utility>

namespace kota::hub {

class GridView;

// A part of a grid that stays in view when the rest scrolls: frozen lines, frozen columns, or the cells that
// are both, with the headers of the frozen lines. What the mouse does here goes to the grid's view.
class FrozenPane : public QWidget {
public:
    enum class Keeps { Lines, Columns, Both };

    FrozenPane(GridView& view, Keeps keeps);

    // Where it lies, now that sizes have changed.
    void place();

protected:
    bool event(QEvent* event) override;
    void paintEvent(QPaintEvent* event) override;

private:
    using Bounds = std::pair<ROWCOL, ROWCOL>;

    // What is to be seen of the grid in a rectangle of its viewport.
    Bounds rowsIn(const QRect& rect) const;
    Bounds colsIn(const QRect& rect) const;
    void paintCells(QPainter& painter, const CGXRange& cells) const;
    QPoint inViewport() const;

    GridView& view_;
    Keeps keeps_;
};

} // namespace kota::hub
