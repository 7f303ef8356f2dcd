#include "hub/screen/grid_heads.h"

#include "hub/screen/grid_model.h"
#include "hub/screen/grid_view.h"

#include <QMouseEvent>
#include <QPainter>
#include <QStyleOptionHeader>

#include <algorithm>

namespace kota::hub {

void paintHead(QPainter& painter, const QRect& rect, const QString& text, const QWidget& widget) {
    QStyleOptionHeader head;
    head.initFrom(&widget);
    head.rect = rect;
    head.position = QStyleOptionHeader::Middle;
    head.text = text;
    head.textAlignment = Qt::Alignment::fromInt(Qt::AlignCenter | static_cast<int>(Qt::TextWordWrap));
    painter.save(); // the style leaves a clip behind
    widget.style()->drawControl(QStyle::CE_Header, &head, &painter, &widget);
    painter.restore();
}

ColumnHead::ColumnHead(GridView& view) : QHeaderView(Qt::Horizontal, &view), view_(view) {
    setSectionsClickable(false);
    setHighlightSections(false);
}

void ColumnHead::paintSection(QPainter* painter, const QRect& rect, int section) const {
    const auto col = static_cast<ROWCOL>(section + 1);
    const CGXRange cells = view_.grid().cover(0, col);
    if (cells == CGXRange(0, col)) {
        QHeaderView::paintSection(
            painter, QRect(rect.topLeft(), QSize(rect.width(), view_.places().headHeight())), section);
        return;
    }
    const QPoint here = geometry().topLeft() - view_.viewport()->geometry().topLeft();
    paintHead(*painter, view_.places().area(cells).translated(-here), view_.grid().look(0, col).text, *this);
}

LineHead::LineHead(GridView& view) : QHeaderView(Qt::Vertical, &view), view_(view) {
    setSectionResizeMode(QHeaderView::Fixed);
    setDefaultAlignment(Qt::AlignCenter);
}

void LineHead::paintSection(QPainter* painter, const QRect& rect, int section) const {
    if (!rect.isEmpty())
        QHeaderView::paintSection(
            painter, QRect(rect.topLeft(), QSize(view_.places().numbersWidth(), rect.height())), section);
}

void LineHead::mousePressEvent(QMouseEvent* event) {
    const int line = logicalIndexAt(event->position().toPoint());
    if (event->button() != Qt::LeftButton || line < 0 || !view_.onLinePress)
        return;
    reached_ = line;
    view_.onLinePress(line, event->modifiers());
}

// Beyond an edge it goes on by a line at each move; the line is brought into view when it is selected.
void LineHead::mouseMoveEvent(QMouseEvent* event) {
    const int y = event->position().toPoint().y();
    const int last = viewport()->height() - 1;
    const int beyond = y < 0 ? -1 : y > last ? 1 : 0;
    const int line = logicalIndexAt(std::clamp(y, 0, last)) + beyond;
    if (reached_ < 0 || line < 0 || line == reached_ || line >= count())
        return;
    reached_ = line;
    view_.onLinePress(line, Qt::ShiftModifier);
}

void LineHead::mouseReleaseEvent(QMouseEvent* /*event*/) {
    reached_ = -1;
}

} // namespace kota::hub
