#include "hub/screen/grid_delegate.h"

#include "hub/screen/grid_model.h"

#include <QAbstractItemView>
#include <QApplication>
#include <QHelpEvent>
#include <QLineEdit>
#include <QPainter>
#include <QToolTip>

#include <algorithm>
#include <utility>

namespace kota::hub {

namespace {

constexpr int padding = 3;
constexpr int arrowWidth = 14;
constexpr int frameWidth = 2;

bool isSelected(const CGXGridCore* grid, ROWCOL row, ROWCOL col) {
    return grid && std::ranges::any_of(grid->GetParam()->GetRangeList()->Ranges(),
                                       [=](const CGXRange& range) { return range.IsCellInRange(row, col); });
}

// The colour of a cell that the user cannot change.
QColor barred(const QPalette& palette) {
    return palette.color(QPalette::Active, QPalette::Window).darker(106);
}

// How light a colour is to the eye, which green reaches more than red and blue.
float brightness(const QColor& colour) {
    return 0.299F * colour.redF() + 0.587F * colour.greenF() + 0.114F * colour.blueF();
}

QColor textOn(const QColor& background) {
    return brightness(background) > 0.5F ? QColor(Qt::black) : QColor(Qt::white);
}

// The frame of the current cell stands out from what is selected and from what is not.
QColor frameOn(const QColor& background, const QPalette& palette) {
    const QColor highlight = palette.color(QPalette::Active, QPalette::Highlight);
    if (background == highlight)
        return textOn(background);
    return brightness(background) > 0.5F ? highlight.darker() : highlight.lighter(150);
}

bool opensList(const CellLook& cell) {
    return cell.takesInput && (cell.kind == CellKind::Choice || cell.kind == CellKind::FreeChoice);
}

QRect textRoom(const QRect& cell, const CellLook& look) {
    return cell.adjusted(padding, 0, opensList(look) ? -arrowWidth : -padding, 0);
}

QColor backgroundOf(const CellLook& cell, bool selected, const QPalette& palette) {
    if (selected)
        return palette.color(QPalette::Active, QPalette::Highlight);
    if (cell.interior.isValid())
        return cell.interior;
    return cell.takesInput ? palette.color(QPalette::Active, QPalette::Base) : barred(palette);
}

QStyle& styleOf(const QStyleOptionViewItem& option) {
    return option.widget ? *option.widget->style() : *QApplication::style();
}

} // namespace

GridDelegate::GridDelegate(const GridModel& model, MakeEditor makeEditor)
    : model_(model), makeEditor_(std::move(makeEditor)) {}

void GridDelegate::paint(QPainter* painter, const QStyleOptionViewItem& option,
                         const QModelIndex& index) const {
    const ROWCOL row = GridModel::rowOf(index);
    const ROWCOL col = GridModel::colOf(index);
    const CellLook cell = model_.look(row, col);
    const QColor background = backgroundOf(cell, isSelected(model_.grid(), row, col), option.palette);
    painter->save();
    painter->fillRect(option.rect, background);
    painter->setPen(textOn(background));
    if (cell.kind == CellKind::CheckBox)
        paintCheckBox(painter, option, cell);
    else if (opensList(cell))
        paintArrow(painter, option);
    const QRect room = textRoom(option.rect, cell);
    painter->drawText(room, static_cast<int>(cell.alignment) | Qt::TextSingleLine,
                      option.fontMetrics.elidedText(cell.text, Qt::ElideRight, room.width()));
    if (model_.isCurrent(row, col)) {
        painter->setPen(QPen(frameOn(background, option.palette), frameWidth));
        painter->drawRect(option.rect.adjusted(1, 1, -1, -1));
    }
    painter->restore();
}

void GridDelegate::paintCheckBox(QPainter* painter, const QStyleOptionViewItem& option,
                                 const CellLook& cell) const {
    QStyle& style = styleOf(option);
    QStyleOptionViewItem box = option;
    const QSize size(style.pixelMetric(QStyle::PM_IndicatorWidth, &option, option.widget),
                     style.pixelMetric(QStyle::PM_IndicatorHeight, &option, option.widget));
    box.rect = QStyle::alignedRect(option.direction, Qt::AlignCenter, size, option.rect);
    box.state = QStyle::State_Enabled | (cell.checked ? QStyle::State_On : QStyle::State_Off);
    style.drawPrimitive(QStyle::PE_IndicatorItemViewItemCheck, &box, painter, option.widget);
    // The style's own outline is hardly seen, and on a dark cell not at all.
    QColor outline = painter->pen().color();
    outline.setAlphaF(0.6F);
    painter->setPen(outline);
    painter->drawRect(box.rect.adjusted(0, 0, -1, -1));
}

void GridDelegate::paintArrow(QPainter* painter, const QStyleOptionViewItem& option) const {
    QStyleOptionViewItem arrow = option;
    arrow.rect = QStyle::alignedRect(option.direction, Qt::AlignRight | Qt::AlignVCenter,
                                     QSize(arrowWidth, arrowWidth), option.rect);
    arrow.state = QStyle::State_Enabled;
    for (const QPalette::ColorRole role : {QPalette::Text, QPalette::WindowText, QPalette::ButtonText})
        arrow.palette.setColor(role, painter->pen().color());
    styleOf(option).drawPrimitive(QStyle::PE_IndicatorArrowDown, &arrow, painter, option.widget);
}

QWidget* GridDelegate::createEditor(QWidget* /*parent*/, const QStyleOptionViewItem& /*option*/,
                                    const QModelIndex& index) const {
    return makeEditor_(index);
}

// The editor's text goes between platform and widget by itself.
void GridDelegate::setEditorData(QWidget* /*editor*/, const QModelIndex& /*index*/) const {}
void GridDelegate::setModelData(QWidget* /*editor*/, QAbstractItemModel* /*model*/,
                                const QModelIndex& /*index*/) const {}

void GridDelegate::updateEditorGeometry(QWidget* editor, const QStyleOptionViewItem& option,
                                        const QModelIndex& /*index*/) const {
    // A line of text stands inside the frame of the current cell. A list needs room for its arrow; that of a
    // narrow cell may stand out to the right.
    const int frame = qobject_cast<QLineEdit*>(editor) ? frameWidth : 0;
    QRect place = option.rect.adjusted(frame, frame, -frame, -frame);
    place.setWidth(std::max(place.width(), editor->minimumSizeHint().width()));
    // The widget around the editor of a frozen cell is not the viewport.
    if (const auto* const view = qobject_cast<const QAbstractItemView*>(option.widget))
        place.translate(view->viewport()->pos() - editor->parentWidget()->mapTo(view, QPoint()));
    editor->setGeometry(place);
}

bool GridDelegate::helpEvent(QHelpEvent* event, QAbstractItemView* view, const QStyleOptionViewItem& option,
                             const QModelIndex& index) {
    const CellLook cell = model_.look(GridModel::rowOf(index), GridModel::colOf(index));
    const bool isCut = option.fontMetrics.horizontalAdvance(cell.text) > textRoom(option.rect, cell).width();
    if (event->type() != QEvent::ToolTip || !index.isValid() || !cell.toolTip.isEmpty() || !isCut)
        return QStyledItemDelegate::helpEvent(event, view, option, index);
    QToolTip::showText(event->globalPos(), cell.text, view);
    return true;
}

// The base would close the editor by keys and by a loss of focus.
bool GridDelegate::eventFilter(QObject* /*watched*/, QEvent* /*event*/) {
    return false;
}

} // namespace kota::hub
