#include "hub/screen/grid_view.h"

#include <QHeaderView>
#include <QLabel>
#include <QMouseEvent>
#include <QToolTip>

#include <algorithm>

namespace kota::hub {

namespace {

class LineHeader : public QHeaderView {
public:
    explicit LineHeader(GridView& view) : QHeaderView(Qt::Vertical, &view), view_(view) {}

protected:
    void mousePressEvent(QMouseEvent* event) override {
        const int line = logicalIndexAt(event->position().toPoint());
        if (event->button() == Qt::LeftButton && line >= 0 && view_.onLinePress)
            view_.onLinePress(line, event->modifiers());
    }
    void mouseMoveEvent(QMouseEvent* /*event*/) override {}
    void mouseReleaseEvent(QMouseEvent* /*event*/) override {}

private:
    GridView& view_;
};

} // namespace

GridView::GridView() : warning_(new QLabel(viewport())) {
    setFocusPolicy(Qt::TabFocus);
    setEditTriggers(NoEditTriggers);
    setSelectionMode(NoSelection);
    setTabKeyNavigation(false);
    setCornerButtonEnabled(false);
    setWordWrap(false);
    setVerticalScrollMode(ScrollPerItem);
    setHorizontalScrollMode(ScrollPerItem);
    setVerticalHeader(new LineHeader(*this));
    verticalHeader()->setSectionResizeMode(QHeaderView::Fixed);
    verticalHeader()->setDefaultAlignment(Qt::AlignCenter);
    horizontalHeader()->setSectionsClickable(false);
    horizontalHeader()->setHighlightSections(false);
    warning_->setMargin(3);
    warning_->setFrameShape(QFrame::Box);
    warning_->setAutoFillBackground(true);
    warning_->setPalette(QToolTip::palette());
    warning_->setBackgroundRole(QPalette::ToolTipBase);
    warning_->setForegroundRole(QPalette::ToolTipText);
    warning_->hide();
}

int GridView::pageLines() const {
    return std::max(1, viewport()->height() / std::max(1, verticalHeader()->defaultSectionSize()));
}

void GridView::showWarning(const QModelIndex& index, const QString& text) {
    warnedAt_ = index;
    warning_->setText(text);
    warning_->setVisible(!text.isEmpty() && index.isValid());
    placeWarning();
}

// Below the cell, or above it where there is no room.
void GridView::placeWarning() {
    if (warning_->isHidden())
        return;
    warning_->adjustSize();
    const QRect cell = visualRect(warnedAt_);
    const bool below = cell.bottom() + 1 + warning_->height() <= viewport()->height();
    const int right = std::max(0, viewport()->width() - warning_->width());
    warning_->move(std::clamp(cell.left(), 0, right),
                   below ? cell.bottom() + 1 : cell.top() - warning_->height());
    warning_->raise();
}

void GridView::mousePressEvent(QMouseEvent* event) {
    const QModelIndex index = indexAt(event->position().toPoint());
    if (event->button() == Qt::LeftButton && index.isValid() && onPress)
        onPress(index);
}

void GridView::mouseDoubleClickEvent(QMouseEvent* event) {
    const QModelIndex index = indexAt(event->position().toPoint());
    if (event->button() == Qt::LeftButton && index.isValid() && onDoubleClick)
        onDoubleClick(index);
}

void GridView::mouseMoveEvent(QMouseEvent* /*event*/) {}
void GridView::mouseReleaseEvent(QMouseEvent* /*event*/) {}

void GridView::resizeEvent(QResizeEvent* event) {
    QTableView::resizeEvent(event);
    placeWarning();
    if (onViewed)
        onViewed();
}

void GridView::scrollContentsBy(int dx, int dy) {
    QTableView::scrollContentsBy(dx, dy);
    placeWarning();
    if (onViewed)
        onViewed();
}

} // namespace kota::hub
