#pragma once

#include <QHeaderView>

namespace kota::hub {

class GridView;

// Draws a header cell with its text.
void paintHead(QPainter& painter, const QRect& rect, const QString& text, const QWidget& widget);

// The headers of the columns, of the frozen ones or of the others, with headings over several columns.
class ColumnHead : public QHeaderView {
public:
    explicit ColumnHead(GridView& view);

protected:
    void paintSection(QPainter* painter, const QRect& rect, int section) const override;

private:
    GridView& view_;
};

// The headers of the lines that scroll. It is wide enough for the frozen columns to lie over it.
class LineHead : public QHeaderView {
public:
    explicit LineHead(GridView& view);

protected:
    void paintSection(QPainter* painter, const QRect& rect, int section) const override;
    void mousePressEvent(QMouseEvent* event) override;
    void mouseMoveEvent(QMouseEvent* event) override;
    void mouseReleaseEvent(QMouseEvent* event) override;

private:
    GridView& view_;
    int reached_ = -1; // the line to which the mouse was dragged; -1 while nothing is dragged
};

} // namespace kota::hub
