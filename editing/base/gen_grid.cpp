#include "editing/base/gen_grid.h"

#include "editing/base/cell_editors.h"
#include "editing/base/gen_property_page.h"
#include "editing/base/grid_owner.h"
#include "editing/base/location_search.h"
#include "platform/framework/number_text.h"
#include "platform/language/language.h"
#include "resources/module.h"

#include <algorithm>
#include <utility>

IMPLEMENT_DYNAMIC(CGenGrid, CGXGridWnd, kota0AdModule)

CGenGrid::CGenGrid() = default;
CGenGrid::~CGenGrid() = default;

void CGenGrid::SetOwnerPage(CGenPropertyPage* page) {
    ownerPage = page;
}

GridOwner* CGenGrid::Owner() const {
    for (CWnd* around = GetParent(); around; around = around->GetParent())
        if (auto* const owner = dynamic_cast<GridOwner*>(around))
            return owner;
    return nullptr;
}

void CGenGrid::SetupGrid() {
    constexpr int comboBoxHeight = 500;
    GetParam()->EnableMoveCols(FALSE);
    GetParam()->EnableMoveRows(FALSE);
    NONCLIENTMETRICS metrics;
    SystemParametersInfo(SPI_GETNONCLIENTMETRICS, metrics);
    LOGFONT font;
    KhLangGetUserFont(metrics, &font);
    ChangeStandardStyle(CGXStyle().SetFont({.face = font.face, .points = font.points}));
    registerCellEditors(*this);
    if (riverColumn == 0)
        return;
    GetParam()->SetDefaultComboBoxHeight(comboBoxHeight);
    SetStyleRange(CGXRange().SetCols(riverColumn), CGXStyle().SetControl(GX_IDS_CTRL_TEXTFIT));
}

void CGenGrid::InsertLine() {
    const ROWCOL line = GetRowCount() + 1;
    InsertRows(line, 1);
    SetCurrentCell(line, GetLeftCol(), GX_SCROLLINVIEW | GX_DISPLAYEDITWND);
    Invalidate();
}

void CGenGrid::DeleteSelectedLines() {
    const CGXRangeList& selection = *GetParam()->GetRangeList();
    if (!selection.IsAnyCellFromCol(0) || selection.GetCount() > 1)
        return;
    CGXRange lines = selection.GetHead();
    lines.ExpandRange(1, 0, GetRowCount(), 0);
    RemoveRows(lines.top, lines.bottom);
    // The current cell does not follow: where its line is gone, the last one is current.
    ROWCOL row = 0;
    ROWCOL col = 0;
    if (GetCurrentCell(&row, &col) && row > GetRowCount() && GetRowCount() > GetHeaderRows())
        SetCurrentCell(GetRowCount(), col, GX_SCROLLINVIEW | GX_KEEPFOCUS);
}

void CGenGrid::GotoGridLine(ROWCOL line) {
    constexpr UINT flags = 24;
    SetCurrentCell(std::min(line, GetRowCount()), GetLeftCol(), flags);
    Invalidate();
}

void CGenGrid::RestoreCurrentCell(ROWCOL firstLine) {
    ROWCOL row = 0;
    ROWCOL col = 0;
    if (!GetCurrentCell(&row, &col))
        SetCurrentCell(firstLine, 1, GX_DISPLAYEDITWND);
    else if (row <= GetRowCount())
        SetCurrentCell(row, col, GX_SCROLLINVIEW | GX_DISPLAYEDITWND | GX_KEEPFOCUS);
    else
        SetCurrentCell(GetRowCount(), col, GX_SCROLLINVIEW | GX_DISPLAYEDITWND);
    Redraw(2, TRUE);
}

void CGenGrid::ComposeStyleRowCol(ROWCOL row, ROWCOL col, CGXStyle* style) const {
    CGXGridWnd::ComposeStyleRowCol(row, col, style);
    if (col == 0 && row > GetHeaderRows() && !GetParam()->IsNumberedRowHeaders())
        style->SetValue(static_cast<int>(row - GetHeaderRows()));
}

BOOL CGenGrid::SetCurrentCell(ROWCOL row, ROWCOL col, UINT flags) {
    if (ownerPage)
        ownerPage->SetActiveGrid(this);
    BOOL moved = CGXGridWnd::SetCurrentCell(row, col, flags);
    if (std::exchange(cellEdited, false)) {
        const bool existed = row <= GetRowCount();
        if (GridOwner* const owner = Owner())
            owner->OnGridCellEdited(col);
        if (!existed || row <= GetRowCount()) // the shell may have taken the line away meanwhile
            moved = CGXGridWnd::SetCurrentCell(row, col, flags);
    }
    if (row != currentRow) {
        currentRow = row;
        GridOwner* const owner = Owner();
        if (row != 0 && owner)
            owner->OnGridRowChanged(row);
    }
    return moved;
}

void CGenGrid::OnModifyCell(ROWCOL row, ROWCOL col) {
    cellEdited = true;
    CGXGridWnd::OnModifyCell(row, col);
}

BOOL CGenGrid::AppendLine() {
    const ROWCOL before = GetRowCount();
    if (ownerPage)
        ownerPage->InsertDefaultLine();
    return GetRowCount() > before;
}

void CGenGrid::DeleteSelection() {
    if (GridOwner* const owner = Owner())
        owner->OnGridDeleteLine();
}

bool CGenGrid::LetFocusGo() {
    if (!cellEdited)
        return CGXGridWnd::LetFocusGo();
    ROWCOL row = 0;
    ROWCOL col = 0;
    GetCurrentCell(&row, &col);
    return SetCurrentCell(row, col, GX_KEEPFOCUS) && !IsEditPending();
}

BOOL CGenGrid::OnStartEditing(ROWCOL /*row*/, ROWCOL col) {
    GridOwner* const owner = Owner();
    if (riverColumn == 0 || col != riverColumn || !owner)
        return TRUE;
    CString rivers;
    owner->GetRiverChoiceList(rivers);
    if (!rivers.IsEmpty())
        SetStyleRange(CGXRange().SetCols(riverColumn), CGXStyle().SetChoiceList(rivers));
    return TRUE;
}

BOOL CGenGrid::ProcessKeys(CWnd* window, UINT message, UINT key, UINT repeat, UINT flags) {
    GridOwner* const owner = Owner();
    if (message != WM_KEYDOWN || !owner)
        return CGXGridWnd::ProcessKeys(window, message, key, repeat, flags);
    switch (key) {
    case VK_INSERT:
        owner->OnGridInsertLine();
        return TRUE;
    case VK_DELETE:
        owner->OnGridDeleteLine();
        return TRUE;
    case VK_F7:
        owner->OnGridSearch();
        return TRUE;
    case VK_F3:
        owner->OnGridFindNext();
        return TRUE;
    case VK_TAB:
    case VK_RETURN:
        GetKeyState(VK_SHIFT) < 0 ? StepBack() : StepForward();
        return TRUE;
    default:
        return CGXGridWnd::ProcessKeys(window, message, key, repeat, flags);
    }
}

void CGenGrid::StepForward() {
    ROWCOL row = 1;
    ROWCOL col = 1;
    if (!GetCurrentCell(&row, &col))
        row = col = 1;
    if (col < GetColCount()) {
        MoveCurrentCell(GX_RIGHT);
    } else if (row < GetRowCount()) {
        MoveCurrentCell(GX_MOSTLEFT);
        MoveCurrentCell(GX_DOWN);
    } else if (GridOwner* const owner = Owner()) {
        owner->OnGridInsertLine();
        if (!IsWindowVisible()) // the shell may have brought another tab to the front
            return;
        MoveCurrentCell(GX_MOSTLEFT);
        MoveCurrentCell(GX_BOTTOM);
        BringWindowToTop();
        RedrawRowCol(CGXRange().SetRows(GetRowCount()));
    }
}

void CGenGrid::StepBack() {
    ROWCOL row = 1;
    ROWCOL col = 1;
    if (!GetCurrentCell(&row, &col))
        row = col = 1;
    if (col >= 2) {
        MoveCurrentCell(GX_LEFT);
    } else if (row >= 2) {
        MoveCurrentCell(GX_MOSTRIGHT);
        MoveCurrentCell(GX_UP);
    } else {
        MoveCurrentCell(GX_TOPLEFT);
    }
}

void CGenGrid::SearchNext(int /*noComponent*/, ROWCOL& row, unsigned /*component*/, CString text,
                          double chainage, int chainageTest, int textTest) {
    const LocationSearch location{std::move(text), chainage, chainageTest, textTest};
    FindLine(row, [&](ROWCOL line) {
        return location.FitsName(CellText(line, 1)) &&
               location.FitsChainage(kota::textToDouble(CellText(line, 2)));
    });
}

void CGenGrid::FindLine(ROWCOL& row, const std::function<bool(ROWCOL line)>& fits) {
    ROWCOL line = row == 0 ? 1 : row;
    while (line <= GetRowCount() && !fits(line))
        ++line;
    row = line <= GetRowCount() ? line + 1 : 0;
    if (row == 0)
        return;
    SetCurrentCell(line, GetLeftCol(), GX_DISPLAYEDITWND);
    Invalidate();
}
