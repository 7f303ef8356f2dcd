#pragma once

#include <QStyledItemDelegate>

#include <functional>

namespace kota::hub {

class GridModel;
struct CellLook;

// Draws the cells of a grid: what their styles say, the selection, and a frame around the current cell. It
// lays the editor over the cell that is being edited and has no say in when that opens or closes.
class GridDelegate : public QStyledItemDelegate {
public:
    using MakeEditor = std::function<QWidget*(const QModelIndex& index)>;

    GridDelegate(const GridModel& model, MakeEditor makeEditor);

    void paint(QPainter* painter, const QStyleOptionViewItem& option,
               const QModelIndex& index) const override;
    QWidget* createEditor(QWidget* parent, const QStyleOptionViewItem& option,
                          const QModelIndex& index) const override;
    void setEditorData(QWidget* editor, const QModelIndex& index) const override;
    void setModelData(QWidget* editor, QAbstractItemModel* model, const QModelIndex& index) const override;
    void updateEditorGeometry(QWidget* editor, const QStyleOptionViewItem& option,
                              const QModelIndex& index) const override;
    // A text that does not fit its cell is told as a tip.
    bool helpEvent(QHelpEvent* event, QAbstractItemView* view, const QStyleOptionViewItem& option,
                   const QModelIndex& index) override;
    bool eventFilter(QObject* watched, QEvent* event) override;

private:
    void paintCheckBox(QPainter* painter, const QStyleOptionViewItem& option, const CellLook& cell) const;
    void paintArrow(QPainter* painter, const QStyleOptionViewItem& option) const;

    const GridModel& model_;
    MakeEditor makeEditor_;
};

} // namespace kota::hub
