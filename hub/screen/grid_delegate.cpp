#include "hub/screen/grid_delegate.h"

#include "hub/screen/grid_model.h"

#include <QApplication>
#include <QLineEdit>
#include <QPainter>

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

QColor textOn(const QColor& background) {
    return background.lightnessF() > 0.45F ? QColor(Qt::black) : QColor(Qt::white);
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
    const bool opens = cell.takesInput && cell.kind != CellKind::Text && cell.kind != CellKind::CheckBox;
    if (cell.kind == CellKind::CheckBox)
        paintCheckBox(painter, option, cell);
    else if (opens)
        paintArrow(painter, option);
    const QRect room = option.rect.adjusted(padding, 0, opens ? -arrowWidth : -padding, 0);
    painter->drawText(room, static_cast<int>(cell.alignment) | Qt::TextSingleLine,
                      option.fontMetrics.elidedText(cell.text, Qt::ElideRight, room.width()));
    if (index == model_.currentIndex()) {
        painter->setPen(
            QPen(option.palette.color(QPalette::Active, QPalette::Highlight).darker(), frameWidth));
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
}

void GridDelegate::paintArrow(QPainter* painter, const QStyleOptionViewItem& option) const {
    QStyleOptionViewItem arrow = option;
    arrow.rect = QStyle::alignedRect(option.direction, Qt::AlignRight | Qt::AlignVCenter,
                                     QSize(arrowWidth, arrowWidth), option.rect);
    arrow.state = QStyle::State_Enabled;
    styleOf(option).drawPrimitive(QStyle::PE_IndicatorArrowDown, &arrow, painter, option.widget);
}

QWidget* GridDelegate::createEditor(QWidget* parent, const QStyleOptionViewItem& /*option*/,
                                    const QModelIndex& index) const {
    return makeEditor_(parent, index);
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
    editor->setGeometry(place);
}

// The base would close the editor by keys and by a loss of focus.
bool GridDelegate::eventFilter(QObject* /*watched*/, QEvent* /*event*/) {
    return false;
}

} // namespace kota::hub
