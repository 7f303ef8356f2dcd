#pragma once

#include "platform/grid/grid.h"

#include <QAbstractTableModel>
#include <QColor>

namespace kota::hub {

// How a cell is drawn.
struct CellLook {
    QString text;
    Qt::Alignment alignment;
    CellKind kind = CellKind::Text;
    bool checked = false;
    bool takesInput = true;
    QColor interior; // invalid: the screen's own
    QString toolTip;
};

// A grid of the platform as a table of the toolkit, whose lines and columns count from 0 and whose headers
// are the platform's line 0 and column 0. It copies nothing but the counts.
class GridModel : public QAbstractTableModel {
public:
    explicit GridModel(HWND grid);

    // Null when the grid is gone.
    CGXGridCore* grid() const;
    CellLook look(ROWCOL row, ROWCOL col) const;
    // The cells that are shown as one with this one; what they show is that of the first.
    CGXRange cover(ROWCOL row, ROWCOL col) const;
    // Whether a cell is drawn as a header, and the user does nothing in it.
    bool isHeader(ROWCOL row, ROWCOL col) const;
    // The headings of a column, from the top.
    QString heading(ROWCOL col) const;
    bool isCurrent(ROWCOL row, ROWCOL col) const;
    // Tells the view of lines and columns that came or went, and of cells that are to be drawn anew.
    void follow(const GridChanges& changes);

    static ROWCOL rowOf(const QModelIndex& index) { return static_cast<ROWCOL>(index.row() + 1); }
    static ROWCOL colOf(const QModelIndex& index) { return static_cast<ROWCOL>(index.column() + 1); }
    // Invalid for a header and for a cell that is not there.
    QModelIndex indexOf(ROWCOL row, ROWCOL col) const;
    // The current cell; invalid when there is none.
    QModelIndex currentIndex() const;

    int rowCount(const QModelIndex& parent = {}) const override;
    int columnCount(const QModelIndex& parent = {}) const override;
    QVariant data(const QModelIndex& index, int role) const override;
    QVariant headerData(int section, Qt::Orientation orientation, int role) const override;
    Qt::ItemFlags flags(const QModelIndex& index) const override;

private:
    void followCounts(const CGXGridCore& grid);
    void tellCells(const CGXRange& cells);

    HWND grid_;
    int rows_ = 0;
    int cols_ = 0;
};

} // namespace kota::hub
