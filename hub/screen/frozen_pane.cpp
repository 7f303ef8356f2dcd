#include "hub/screen/frozen_pane.h"

#include "hub/screen/grid_heads.h"
#include "hub/screen/grid_model.h"
#include "hub/screen/grid_view.h"

#include <QCoreApplication>
#include <QHelpEvent>
#include <QMouseEvent>
#include <QPaintEvent>
#include <QPainter>

#include <algorithm>

namespace kota::hub {

FrozenPane::FrozenPane(GridView& view, Keeps keeps) : QWidget(&view), view_(view), keeps_(keeps) {
    hide();
}

void FrozenPane::place() {
    const GridPlaces& places = view_.places();
    QRect around = view_.viewport()->geometry();
    const int top = around.top() - places.frozenHeight();
    const int left = around.left() - places.frozenWidth();
    if (keeps_ != Keeps::Columns)
        around.setRect(around.left(), top, around.width(), places.frozenHeight());
    if (keeps_ == Keeps::Columns)
        around.setRect(left, around.top(), places.frozenWidth(), around.height());
    if (keeps_ == Keeps::Both)
        around.setRect(left - places.numbersWidth(), top, places.frozenWidth() + places.numbersWidth(),
                       places.frozenHeight());
    setGeometry(around);
    setVisible(!around.isEmpty());
}

QPoint FrozenPane::inViewport() const {
    return geometry().topLeft() - view_.viewport()->geometry().topLeft();
}

bool FrozenPane::event(QEvent* event) {
    const QPoint shift = inViewport();
    switch (event->type()) {
    case QEvent::MouseButtonPress:
    case QEvent::MouseButtonRelease:
    case QEvent::MouseButtonDblClick:
    case QEvent::MouseMove: {
        const auto& mouse = static_cast<const QMouseEvent&>(*event);
        QMouseEvent same(mouse.type(), mouse.position() + shift, mouse.globalPosition(), mouse.button(),
                         mouse.buttons(), mouse.modifiers());
        return QCoreApplication::sendEvent(view_.viewport(), &same);
    }
    case QEvent::Wheel:
        return QCoreApplication::sendEvent(view_.viewport(), event);
    case QEvent::ToolTip: {
        const auto& help = static_cast<const QHelpEvent&>(*event);
        QHelpEvent same(QEvent::ToolTip, help.pos() + shift, help.globalPos());
        return QCoreApplication::sendEvent(view_.viewport(), &same);
    }
    default:
        return QWidget::event(event);
    }
}

FrozenPane::Bounds FrozenPane::rowsIn(const QRect& rect) const {
    if (keeps_ != Keeps::Columns)
        return {1, view_.places().frozenRows()};
    const auto last = static_cast<ROWCOL>(view_.model()->rowCount());
    return {view_.places().rowAt(rect.top()), std::min(view_.places().rowAt(rect.bottom()), last)};
}

FrozenPane::Bounds FrozenPane::colsIn(const QRect& rect) const {
    if (keeps_ != Keeps::Lines)
        return {keeps_ == Keeps::Both ? 0 : 1, view_.places().frozenCols()};
    const auto last = static_cast<ROWCOL>(view_.model()->columnCount());
    return {view_.places().colAt(rect.left()), std::min(view_.places().colAt(rect.right()), last)};
}

void FrozenPane::paintEvent(QPaintEvent* event) {
    QPainter painter(this);
    const QPoint shift = inViewport();
    painter.translate(-shift);
    const QRect dirty = event->rect().translated(shift);
    painter.fillRect(dirty, palette().color(keeps_ == Keeps::Columns ? QPalette::Base : QPalette::Window));
    const auto [firstRow, lastRow] = rowsIn(dirty);
    const auto [firstCol, lastCol] = colsIn(dirty);
    for (ROWCOL row = firstRow; row <= lastRow; ++row)
        for (ROWCOL col = firstCol; col <= lastCol; ++col) {
            const CGXRange cells = view_.grid().cover(row, col);
            const bool isFirst =
                row == std::max(cells.top, firstRow) && col == std::max(cells.left, firstCol);
            if (isFirst)
                paintCells(painter, cells);
        }
}

// One cell, or those that are shown as one.
void FrozenPane::paintCells(QPainter& painter, const CGXRange& cells) const {
    const QRect area = view_.places().area(cells);
    if (view_.grid().isHeader(cells.top, cells.left)) {
        paintHead(painter, area, view_.grid().look(cells.top, cells.left).text, view_);
        return;
    }
    QStyleOptionViewItem option = view_.cellOption();
    painter.setPen(view_.lineColour());
    painter.drawLine(area.topRight(), area.bottomRight());
    painter.drawLine(area.bottomLeft(), area.bottomRight());
    option.rect = area.adjusted(0, 0, -1, -1);
    view_.itemDelegate()->paint(&painter, option, view_.grid().indexOf(cells.top, cells.left));
}

} // namespace kota::hub
