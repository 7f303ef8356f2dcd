#include "hub/screen/grid_model.h"

#include "hub/screen/text.h"
#include "platform/framework/number_text.h"

#include <algorithm>

namespace kota::hub {

namespace {

Qt::Alignment alignmentOf(int alignment) {
    const Qt::Alignment horizontal = alignment == alignRight    ? Qt::AlignRight
                                     : alignment == alignCenter ? Qt::AlignHCenter
                                                                : Qt::AlignLeft;
    return horizontal | Qt::AlignVCenter;
}

// The screen's own colours, which have their top byte set, are left to the screen.
QColor colourOf(COLORREF colour) {
    return colour >> 24 != 0 ? QColor() : QColor(colour & 0xFF, (colour >> 8) & 0xFF, (colour >> 16) & 0xFF);
}

// A line that is a header has no number.
QString textOf(const CGXGridCore& grid, ROWCOL row, ROWCOL col) {
    const bool noNumber = col == 0 && row <= grid.GetHeaderRows();
    return toQt(noNumber ? CString(grid.CellText(row, col)) : grid.GetDisplayText(row, col));
}

} // namespace

GridModel::GridModel(HWND grid) : grid_(grid) {}

CGXGridCore* GridModel::grid() const {
    return dynamic_cast<CGXGridCore*>(CWnd::FromHandle(grid_));
}

CellLook GridModel::look(ROWCOL row, ROWCOL col) const {
    const CGXGridCore* const shown = grid();
    if (!shown || row > shown->GetRowCount() || col > shown->GetColCount())
        return {};
    const CGXRange cells = shown->GetCoveredCellsRowCol(row, col);
    row = cells.top;
    col = cells.left;
    CGXStyle style;
    shown->ComposeStyleRowCol(row, col, &style);
    CellLook look;
    look.text = textOf(*shown, row, col);
    look.alignment = alignmentOf(style.GetHorizontalAlignment());
    look.kind = shown->GetControl(row, col)->Kind();
    look.checked = look.kind == CellKind::CheckBox && kota::textToInt(style.ValueText()) != 0;
    look.takesInput = style.GetEnabled() && !(shown->GetParam()->IsLockReadOnly() && style.GetReadOnly());
    if (style.HasInterior())
        look.interior = colourOf(style.GetInterior());
    if (shown->HasGridToolTips())
        look.toolTip = toQt(style.GetUserAttribute(GX_IDS_UA_TOOLTIPTEXT));
    return look;
}

CGXRange GridModel::cover(ROWCOL row, ROWCOL col) const {
    const CGXGridCore* const shown = grid();
    return shown ? shown->GetCoveredCellsRowCol(row, col) : CGXRange(row, col);
}

bool GridModel::isHeader(ROWCOL row, ROWCOL col) const {
    const CGXGridCore* const shown = grid();
    return !shown || row <= shown->GetHeaderRows() || col <= shown->GetHeaderCols();
}

QString GridModel::heading(ROWCOL col) const {
    QStringList texts;
    for (ROWCOL row = 0; grid() && row <= grid()->GetHeaderRows(); ++row)
        texts.append(look(row, col).text.simplified());
    texts.removeAll(QString());
    texts.removeDuplicates(); // of a heading over several lines
    return texts.join(", ");
}

bool GridModel::isCurrent(ROWCOL row, ROWCOL col) const {
    ROWCOL currentRow = 0;
    ROWCOL currentCol = 0;
    const CGXGridCore* const shown = grid();
    return shown && shown->GetCurrentCell(&currentRow, &currentCol) &&
           cover(row, col).IsCellInRange(currentRow, currentCol);
}

void GridModel::follow(const GridChanges& changes) {
    const CGXGridCore* const shown = grid();
    if (!shown)
        return;
    followCounts(*shown);
    if (changes.layout)
        tellCells({0, 0, static_cast<ROWCOL>(rows_), static_cast<ROWCOL>(cols_)});
    else if (changes.cells.kind != CGXRange::Kind::None)
        tellCells(changes.cells);
}

void GridModel::followCounts(const CGXGridCore& shown) {
    const int rows = static_cast<int>(shown.GetRowCount());
    const int cols = static_cast<int>(shown.GetColCount());
    if (cols != cols_) {
        beginResetModel();
        rows_ = rows;
        cols_ = cols;
        endResetModel();
    } else if (rows > rows_) {
        beginInsertRows({}, rows_, rows - 1);
        rows_ = rows;
        endInsertRows();
    } else if (rows < rows_) {
        beginRemoveRows({}, rows, rows_ - 1);
        rows_ = rows;
        endRemoveRows();
    }
}

void GridModel::tellCells(const CGXRange& cells) {
    const int lastRow = std::min(static_cast<int>(cells.bottom), rows_) - 1;
    const int lastCol = std::min(static_cast<int>(cells.right), cols_) - 1;
    const int firstRow = std::max(static_cast<int>(cells.top), 1) - 1;
    const int firstCol = std::max(static_cast<int>(cells.left), 1) - 1;
    if (cells.top == 0 && firstCol <= lastCol)
        emit headerDataChanged(Qt::Horizontal, firstCol, lastCol);
    if (cells.left == 0 && firstRow <= lastRow)
        emit headerDataChanged(Qt::Vertical, firstRow, lastRow);
    if (firstRow <= lastRow && firstCol <= lastCol)
        emit dataChanged(index(firstRow, firstCol), index(lastRow, lastCol));
}

QModelIndex GridModel::indexOf(ROWCOL row, ROWCOL col) const {
    return row == 0 || col == 0 ? QModelIndex() : index(static_cast<int>(row) - 1, static_cast<int>(col) - 1);
}

QModelIndex GridModel::currentIndex() const {
    ROWCOL row = 0;
    ROWCOL col = 0;
    const CGXGridCore* const shown = grid();
    return shown && shown->GetCurrentCell(&row, &col) ? indexOf(row, col) : QModelIndex();
}

int GridModel::rowCount(const QModelIndex& parent) const {
    return parent.isValid() ? 0 : rows_;
}
int GridModel::columnCount(const QModelIndex& parent) const {
    return parent.isValid() ? 0 : cols_;
}

QVariant GridModel::data(const QModelIndex& index, int role) const {
    const CellLook cell = look(rowOf(index), colOf(index));
    switch (role) {
    case Qt::DisplayRole:
    case Qt::EditRole:
        return cell.text;
    case Qt::TextAlignmentRole:
        return QVariant::fromValue(cell.alignment);
    case Qt::BackgroundRole:
        return cell.interior.isValid() ? QVariant(cell.interior) : QVariant();
    case Qt::CheckStateRole:
        return cell.kind == CellKind::CheckBox ? QVariant(cell.checked ? Qt::Checked : Qt::Unchecked)
                                               : QVariant();
    case Qt::ToolTipRole:
        return cell.toolTip.isEmpty() ? QVariant() : QVariant(cell.toolTip);
    default:
        return {};
    }
}

QVariant GridModel::headerData(int section, Qt::Orientation orientation, int role) const {
    const auto place = static_cast<ROWCOL>(section + 1);
    const bool horizontal = orientation == Qt::Horizontal;
    if (role == Qt::DisplayRole)
        return horizontal ? look(0, place).text : look(place, 0).text;
    if (role == Qt::TextAlignmentRole)
        return QVariant::fromValue(Qt::Alignment(Qt::AlignCenter) | Qt::TextWordWrap);
    return {};
}

Qt::ItemFlags GridModel::flags(const QModelIndex& index) const {
    const CellLook cell = look(rowOf(index), colOf(index));
    const Qt::ItemFlags always = Qt::ItemIsEnabled | Qt::ItemIsSelectable;
    if (!cell.takesInput)
        return always;
    return always | (cell.kind == CellKind::CheckBox ? Qt::ItemIsUserCheckable : Qt::ItemIsEditable);
}

} // namespace kota::hub
