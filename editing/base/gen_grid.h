#pragma once

#include "platform/grid/grid.h"

#include <functional>

class CGenPropertyPage;
class GridOwner;

// Stands for every component in a search.
inline constexpr unsigned anyComponent = ~0U;

// The base of every grid of the editor: its keys, its lines, and what it tells the view.
class CGenGrid : public CGXGridWnd {
    DECLARE_DYNAMIC(CGenGrid)
public:
    CGenGrid();
    ~CGenGrid() override;

    virtual void SetOwnerPage(CGenPropertyPage* page);
    // The font of the user's language, the cell editors and the river column.
    virtual void SetupGrid();
    // Adds a line at the end, whatever is selected, and goes to it.
    virtual void InsertLine();
    // Removes the lines of the selection, if it is one range of whole lines.
    virtual void DeleteSelectedLines();
    // Goes to a line, to the last one for a number beyond.
    virtual void GotoGridLine(ROWCOL line);
    // Goes to the next line from `row` on that fits, and sets `row` to the line behind it; to 0 when there is
    // none.
    virtual void SearchNext(int noComponent, ROWCOL& row, unsigned component, CString text, double chainage,
                            int chainageTest, int textTest);

    // The column that offers the project's river names; 0 for none. Takes effect in SetupGrid.
    void SetRiverColumn(ROWCOL column) { riverColumn = column; }
    // After a fill: back to the cell that was current, to the last line if that is gone, to the first line
    // if there was none.
    void RestoreCurrentCell(ROWCOL firstLine);

    void ComposeStyleRowCol(ROWCOL row, ROWCOL col, CGXStyle* style) const override;
    BOOL SetCurrentCell(ROWCOL row, ROWCOL col, UINT flags = GX_SCROLLINVIEW) override;
    BOOL ProcessKeys(CWnd* window, UINT message, UINT key, UINT repeat, UINT flags) override;
    BOOL OnStartEditing(ROWCOL row, ROWCOL col) override;
    void OnModifyCell(ROWCOL row, ROWCOL col) override;
    // Pasted lines come and cut lines go by way of the page, as if the user asked for them.
    BOOL AppendLine() override;
    void DeleteSelection() override;
    // What was modified is reported before the focus goes.
    bool LetFocusGo() override;

protected:
    CGenPropertyPage* OwnerPage() const { return ownerPage; }
    // The frame of a search: goes to the first line from `row` on that fits.
    void FindLine(ROWCOL& row, const std::function<bool(ROWCOL line)>& fits);
    // The view around the grid; null when there is none.
    GridOwner* Owner() const;

private:
    void StepForward();
    void StepBack();

    CGenPropertyPage* ownerPage = nullptr; // not owned
    ROWCOL currentRow = 0;                 // the line last reported to the view
    bool cellEdited = false;               // a cell was modified and that is not yet reported
    ROWCOL riverColumn = 0;
};
