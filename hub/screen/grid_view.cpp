#include "hub/screen/grid_view.h"

#include "hub/screen/grid_model.h"

#include <QHeaderView>
#include <QLabel>
#include <QMouseEvent>
#include <QScrollBar>
#include <QToolTip>

#include <algorithm>

namespace kota::hub {

GridView::GridView()
    : frozenHead_(*this), places_(*this, frozenHead_), panes_{FrozenPane(*this, FrozenPane::Keeps::Lines),
                                                              FrozenPane(*this, FrozenPane::Keeps::Columns),
                                                              FrozenPane(*this, FrozenPane::Keeps::Both)},
      drag_(*this), warning_(new QLabel(this)) {
    drag_.onReach = [this](const QModelIndex& from, const QModelIndex& to) {
        if (onSelect)
            onSelect(from, to);
    };
    setFocusPolicy(Qt::TabFocus);
    setEditTriggers(NoEditTriggers);
    setSelectionMode(NoSelection);
    setTabKeyNavigation(false);
    setCornerButtonEnabled(false);
    setWordWrap(false);
    setVerticalScrollMode(ScrollPerItem);
    setHorizontalScrollMode(ScrollPerItem);
    setVerticalHeader(new LineHead(*this));
    setHorizontalHeader(new ColumnHead(*this));
    frozenHead_.raise();
    for (FrozenPane& pane : panes_)
        pane.raise();
    QObject::connect(&frozenHead_, &QHeaderView::sectionResized, this, [this] { showHeadSizes(); });
    warning_->setMargin(3);
    warning_->setFrameShape(QFrame::Box);
    warning_->setAutoFillBackground(true);
    warning_->setPalette(QToolTip::palette());
    warning_->setBackgroundRole(QPalette::ToolTipBase);
    warning_->setForegroundRole(QPalette::ToolTipText);
    warning_->hide();
}

void GridView::showGrid(GridModel& grid) {
    grid_ = &grid;
    setModel(&grid);
    frozenHead_.setModel(&grid);
}

void GridView::followLayout() {
    clearSpans();
    showCovers();
    showHeadSizes();
    redraw();
}

// The headers hold room for the frozen cells, which lie over them.
void GridView::showHeadSizes() {
    verticalHeader()->setFixedWidth(places_.numbersWidth() + places_.frozenWidth());
    horizontalHeader()->setFixedHeight(places_.headHeight() + places_.frozenHeight());
    updateGeometries();
}

void GridView::updateGeometries() {
    QScrollBar& bar = *verticalScrollBar();
    const bool atTop = bar.value() == bar.minimum();
    QTableView::updateGeometries();
    const auto frozen = static_cast<int>(places_.frozenRows());
    bar.setMinimum(bar.maximum() > frozen ? frozen : 0); // those lines are 0 high
    if (atTop)
        bar.setValue(bar.minimum());
    const QPoint corner = viewport()->geometry().topLeft();
    frozenHead_.setGeometry(corner.x() - places_.frozenWidth(), horizontalHeader()->y(),
                            places_.frozenWidth(), places_.headHeight());
    frozenHead_.setVisible(places_.frozenCols() > 0);
    for (FrozenPane& pane : panes_)
        pane.place();
    placeWarning();
}

void GridView::redraw() {
    viewport()->update();
    for (FrozenPane& pane : panes_)
        pane.update();
}

void GridView::dataChanged(const QModelIndex& first, const QModelIndex& last, const QList<int>& roles) {
    QTableView::dataChanged(first, last, roles);
    if (places_.isFrozen(GridModel::rowOf(first), GridModel::colOf(first)))
        for (FrozenPane& pane : panes_)
            pane.update();
}

// Covered cells are looked for among those in view, since there may be a million others.
void GridView::showCovers() {
    const ROWCOL firstRow = std::max(places_.rowAt(0), places_.frozenRows() + 1);
    const ROWCOL lastRow =
        std::min(firstRow + static_cast<ROWCOL>(pageLines()) + 1, static_cast<ROWCOL>(model()->rowCount()));
    const ROWCOL firstCol = places_.frozenCols() + 1;
    const auto lastCol = static_cast<ROWCOL>(model()->columnCount());
    for (ROWCOL row = firstRow; row <= lastRow; ++row)
        for (ROWCOL col = firstCol; col <= lastCol; ++col)
            if (const CGXRange cells = grid_->cover(row, col); cells != CGXRange(row, col))
                showAsOne({std::max(cells.top, places_.frozenRows() + 1), std::max(cells.left, firstCol),
                           cells.bottom, cells.right});
}

void GridView::showAsOne(const CGXRange& cells) {
    const QModelIndex first = grid_->indexOf(cells.top, cells.left);
    const int height = static_cast<int>(cells.bottom - cells.top) + 1;
    const int width = static_cast<int>(cells.right - cells.left) + 1;
    const bool isShown =
        rowSpan(first.row(), first.column()) == height && columnSpan(first.row(), first.column()) == width;
    if (!isShown)
        setSpan(first.row(), first.column(), height, width);
}

QWidget& GridView::widgetAt(const QModelIndex& index) {
    const bool row = GridModel::rowOf(index) <= places_.frozenRows();
    const bool col = GridModel::colOf(index) <= places_.frozenCols();
    if (!row && !col)
        return *viewport();
    return panes_[row && col ? 2 : col ? 1 : 0];
}

QStyleOptionViewItem GridView::cellOption() const {
    QStyleOptionViewItem option;
    initViewItemOption(&option);
    return option;
}

QColor GridView::lineColour() const {
    const QStyleOptionViewItem option = cellOption();
    return QColor::fromRgba(
        static_cast<QRgb>(style()->styleHint(QStyle::SH_Table_GridLineColor, &option, this)));
}

QSize GridView::minimumSizeHint() const {
    constexpr int fewLines = 5;
    const int height = horizontalHeader()->height() + fewLines * verticalHeader()->defaultSectionSize();
    return {QTableView::minimumSizeHint().width(), height};
}

QRect GridView::visualRect(const QModelIndex& index) const {
    if (!index.isValid())
        return {};
    const CGXRange cells = grid_->cover(GridModel::rowOf(index), GridModel::colOf(index));
    return places_.area(cells).adjusted(0, 0, -1, -1);
}

QModelIndex GridView::indexAt(const QPoint& point) const {
    const CGXRange cells = grid_->cover(places_.rowAt(point.y()), places_.colAt(point.x()));
    return grid_->indexOf(cells.top, cells.left);
}

// In a direction in which the cell is frozen, nothing is scrolled.
void GridView::scrollTo(const QModelIndex& index, ScrollHint hint) {
    const bool frozenRow = GridModel::rowOf(index) <= places_.frozenRows();
    const bool frozenCol = GridModel::colOf(index) <= places_.frozenCols();
    if (!frozenRow && !frozenCol) {
        QTableView::scrollTo(index, hint);
        return;
    }
    QScrollBar& kept = frozenCol ? *horizontalScrollBar() : *verticalScrollBar();
    const int before = kept.value();
    if (!frozenRow)
        QTableView::scrollTo(index.siblingAtColumn(columnAt(0)), hint);
    else if (!frozenCol)
        QTableView::scrollTo(index.siblingAtRow(rowAt(0)), hint);
    kept.setValue(before);
}

int GridView::pageLines() const {
    return std::max(1, viewport()->height() / std::max(1, verticalHeader()->defaultSectionSize()));
}

void GridView::showWarning(const QModelIndex& index, const QString& text) {
    warnedAt_ = text.isEmpty() ? QModelIndex() : index;
    warning_->setText(text);
    placeWarning();
}

// Below the cell, or above it where there is no room.
void GridView::placeWarning() {
    const QRect view = viewport()->geometry();
    const QRect cell = visualRect(warnedAt_).translated(view.topLeft());
    const bool isInView = warnedAt_.isValid() && cell.intersects(widgetAt(warnedAt_).geometry());
    warning_->setVisible(isInView);
    if (!isInView)
        return;
    warning_->adjustSize();
    const bool below = cell.bottom() + 1 + warning_->height() <= view.bottom() + 1;
    const int right = std::max(view.left(), view.right() + 1 - warning_->width());
    warning_->move(std::clamp(cell.left(), std::min(frozenHead_.x(), right), right),
                   below ? cell.bottom() + 1 : cell.top() - warning_->height());
    warning_->raise();
}

void GridView::mousePressEvent(QMouseEvent* event) {
    const QPoint place = event->position().toPoint();
    const QModelIndex index = indexAt(place);
    if (event->button() != Qt::LeftButton || !index.isValid() || !onPress)
        return;
    const QModelIndex current = grid_->currentIndex();
    if (event->modifiers().testFlag(Qt::ShiftModifier) && current.isValid()) {
        drag_.begin(current);
        drag_.follow(place);
        return;
    }
    drag_.begin(index);
    if (grid_->look(GridModel::rowOf(index), GridModel::colOf(index)).kind == CellKind::CheckBox)
        pressedBox_ = index;
    else
        onPress(index);
}

void GridView::mouseMoveEvent(QMouseEvent* event) {
    if (event->buttons().testFlag(Qt::LeftButton))
        drag_.follow(event->position().toPoint());
}

void GridView::mouseReleaseEvent(QMouseEvent* event) {
    if (event->button() != Qt::LeftButton)
        return;
    if (pressedBox_.isValid() && drag_.isClick())
        onPress(pressedBox_);
    pressedBox_ = QModelIndex();
    drag_.end();
}

void GridView::mouseDoubleClickEvent(QMouseEvent* event) {
    const QModelIndex index = indexAt(event->position().toPoint());
    if (event->button() == Qt::LeftButton && index.isValid() && onDoubleClick)
        onDoubleClick(index);
}

void GridView::resizeEvent(QResizeEvent* event) {
    QTableView::resizeEvent(event);
    if (grid_)
        showCovers();
    if (onViewed)
        onViewed();
}

void GridView::scrollContentsBy(int dx, int dy) {
    QTableView::scrollContentsBy(dx, dy);
    showCovers();
    for (FrozenPane& pane : panes_)
        pane.update();
    placeWarning();
    if (onViewed)
        onViewed();
}

} // namespace kota::hub
