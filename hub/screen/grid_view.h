#pragma once

#include <QTableView>

#include <functional>

class QLabel;

namespace kota::hub {

// A table that tells what the user does with the mouse and does nothing about it itself.
class GridView : public QTableView {
public:
    GridView();

    std::function<void(const QModelIndex&)> onPress;
    std::function<void(const QModelIndex&)> onDoubleClick;
    std::function<void(int line, Qt::KeyboardModifiers held)> onLinePress;
    // The first line or column in view, or the number of lines in view, has become another.
    std::function<void()> onViewed;

    // How many whole lines are in view, at least one.
    int pageLines() const;
    // Shows a text at a cell until it is given none.
    void showWarning(const QModelIndex& index, const QString& text);

protected:
    void mousePressEvent(QMouseEvent* event) override;
    void mouseMoveEvent(QMouseEvent* event) override;
    void mouseReleaseEvent(QMouseEvent* event) override;
    void mouseDoubleClickEvent(QMouseEvent* event) override;
    void resizeEvent(QResizeEvent* event) override;
    void scrollContentsBy(int dx, int dy) override;

private:
    void placeWarning();

    QLabel* warning_;
    QPersistentModelIndex warnedAt_;
};

} // namespace kota::hub
