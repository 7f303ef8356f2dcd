#include "hub/screen/grid_drag.h"

#include "hub/screen/grid_model.h"
#include "hub/screen/grid_view.h"

#include <QScrollBar>

#include <algorithm>

namespace kota::hub {

namespace {

constexpr int scrollInterval = 60; // ms

// Scrolls by one when the mouse is beyond an edge. False when there is nothing more to be scrolled to.
bool scrollTowards(int place, int size, QScrollBar& bar) {
    const int before = bar.value();
    bar.setValue(before + (place < 0 ? -1 : place >= size ? 1 : 0));
    return bar.value() != before;
}

// The place in view that is nearest. Frozen cells, which are below 0, are reached when all is scrolled back.
int nearest(int place, int size, bool reachesFrozen) {
    return std::clamp(place, reachesFrozen ? place : 0, size - 1);
}

} // namespace

GridDrag::GridDrag(GridView& view) : view_(view) {
    timer_.setInterval(scrollInterval);
    QObject::connect(&timer_, &QTimer::timeout, &timer_, [this] { step(); });
}

void GridDrag::begin(const QModelIndex& from) {
    from_ = to_ = from;
}

void GridDrag::follow(const QPoint& place) {
    place_ = place;
    step();
}

void GridDrag::end() {
    timer_.stop();
    from_ = to_ = QModelIndex();
}

void GridDrag::step() {
    if (!from_.isValid()) {
        end();
        return;
    }
    const QSize size = view_.viewport()->size();
    const bool frozenRow = GridModel::rowOf(from_) <= view_.places().frozenRows();
    const bool frozenCol = GridModel::colOf(from_) <= view_.places().frozenCols();
    bool scrolled = false;
    if (place_.y() >= 0 || !frozenRow)
        scrolled = scrollTowards(place_.y(), size.height(), *view_.verticalScrollBar());
    if (place_.x() >= 0 || !frozenCol)
        scrolled = scrollTowards(place_.x(), size.width(), *view_.horizontalScrollBar()) || scrolled;
    if (!scrolled)
        timer_.stop();
    else if (!timer_.isActive())
        timer_.start();
    const QModelIndex now = reached();
    if (now == to_)
        return;
    to_ = now;
    onReach(from_, to_);
}

QModelIndex GridDrag::reached() const {
    const GridPlaces& places = view_.places();
    const auto atStart = [](const QScrollBar* bar) { return bar->value() == bar->minimum(); };
    const bool frozenRow = GridModel::rowOf(from_) <= places.frozenRows();
    const bool frozenCol = GridModel::colOf(from_) <= places.frozenCols();
    const QSize size = view_.viewport()->size();
    const int y = nearest(place_.y(), size.height(), frozenRow || atStart(view_.verticalScrollBar()));
    const int x = nearest(place_.x(), size.width(), frozenCol || atStart(view_.horizontalScrollBar()));
    const auto rows = static_cast<ROWCOL>(view_.model()->rowCount());
    const auto cols = static_cast<ROWCOL>(view_.model()->columnCount());
    return view_.grid().indexOf(std::clamp(places.rowAt(y), 1U, rows), std::clamp(places.colAt(x), 1U, cols));
}

} // namespace kota::hub
