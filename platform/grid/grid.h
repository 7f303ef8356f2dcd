#pragma once

#include "platform/framework/window.h"
#include "platform/grid/control.h"
#include "platform/grid/param.h"
#include "platform/grid/range.h"
#include "platform/grid/style.h"

#include <memory>
#include <string_view>
#include <vector>

// Flags of SetCurrentCell.
inline constexpr UINT GX_SCROLLINVIEW = 2;   // bring the cell into view
inline constexpr UINT GX_DISPLAYEDITWND = 8; // bring it into view and redraw at once
inline constexpr UINT GX_KEEPFOCUS =
    32; // leave the focus where it is; without it the grid takes it (MayTakeFocus)

// Directions of MoveCurrentCell.
inline constexpr int GX_UP = 1;
inline constexpr int GX_LEFT = 2;
inline constexpr int GX_DOWN = 3;
inline constexpr int GX_RIGHT = 4;
inline constexpr int GX_PAGEUP = 5;
inline constexpr int GX_PAGEDOWN = 6;
inline constexpr int GX_TOP = 7;
inline constexpr int GX_BOTTOM = 8;
inline constexpr int GX_MOSTLEFT = 9;
inline constexpr int GX_MOSTRIGHT = 10;
inline constexpr int GX_BOTTOMRIGHT = 11;
inline constexpr int GX_TOPLEFT = 12;

namespace kota {

// What of a grid changed since a screen took the changes last.
struct GridChanges {
    bool layout = false;  // lines, columns, sizes, frozen or covered cells, column styles, headers
    bool current = false; // current cell, focus, or what is seen of the grid
    bool scroll = false;  // the current cell is to be brought into view
    bool selection = false;
    bool editing = false; // an edit began or ended, or its text was loaded anew
    bool warned = false;  // a text was refused: see CGXGridCore::Warning
    CGXRange cells;       // what is to be drawn anew, none if nothing
};

// Why a cell could not be left.
struct GridWarning {
    ROWCOL row = 0;
    ROWCOL col = 0;
    CString text;
};

namespace grid {
class User;
} // namespace grid

} // namespace kota

// A grid of lines and columns from 1; line 0 and column 0 are the headers. It holds the cells' values as
// texts, the styles that are laid over one another, the current cell with its edit, and the selection. It
// neither draws nor reads a mouse: a screen draws it (ComposeStyleRowCol, GetDisplayText, TakeChanges) and
// hands on what the user does (platform/grid/user.h).
class KOTA_API CGXGridCore : public CWnd {
    DECLARE_DYNAMIC(CGXGridCore)
public:
    CGXGridCore();
    ~CGXGridCore() override;

    CGXGridParam* GetParam();
    const CGXGridParam* GetParam() const;

    // Lines and columns, headers not counted. New lines are blank; lines and columns taken away are
    // forgotten, with their styles. The current cell stays where it is, even beyond the last line, and
    // SetCurrentCell is not called. 1 done.
    BOOL SetRowCount(ROWCOL count, UINT flags = 0);
    BOOL SetColCount(ROWCOL count, UINT flags = 0);
    ROWCOL GetRowCount() const;
    ROWCOL GetColCount() const;
    // Inserts lines in front of `row`, at the end for the line count plus 1. Beyond that: nothing, 0.
    BOOL InsertRows(ROWCOL row, ROWCOL count);
    // Removes the lines that exist among these. 0 when none does.
    BOOL RemoveRows(ROWCOL first, ROWCOL last);

    // In the units of the dialog; a screen scales them for its font.
    int GetRowHeight(ROWCOL row) const;
    int GetColWidth(ROWCOL col) const;
    // `last` below `first` means the first alone. 0 when none of them exists.
    BOOL SetRowHeight(ROWCOL first, ROWCOL last, int height);
    BOOL SetColWidth(ROWCOL first, ROWCOL last, int width);
    // The lines (columns) that stay in view, from 1; of them the first `headers` count as headers.
    BOOL SetFrozenRows(ROWCOL frozen, ROWCOL headers);
    BOOL SetFrozenCols(ROWCOL frozen, ROWCOL headers);
    ROWCOL GetFrozenRows() const;
    ROWCOL GetFrozenCols() const;
    // The lines (columns) from 1 that are headers although they hold ordinary cells.
    ROWCOL GetHeaderRows() const;
    ROWCOL GetHeaderCols() const;
    // Makes one cell of a rectangle: the one at its top left.
    BOOL SetCoveredCellsRowCol(ROWCOL top, ROWCOL left, ROWCOL bottom, ROWCOL right);
    // The rectangle that covers the cell, or the cell itself.
    CGXRange GetCoveredCellsRowCol(ROWCOL row, ROWCOL col) const;

    // Lays a style over cells, whole lines, whole columns or all: what is set in it wins, its value among it.
    // A line's or a column's value is that of its cells which were never given one. All means all columns
    // that exist. With the read-only lock on, a read-only cell (line, column) takes the value and nothing
    // else. A cell beyond the line or column count takes nothing, and the result is 0 when none exists.
    BOOL SetStyleRange(const CGXRange& range, const CGXStyle& style);
    // Sets the stored value; of whole lines, whole columns or all, that of the cells below the header. Never
    // barred by the lock; an edit that stands open is left alone. 0 when no such cell exists.
    BOOL SetValueRange(const CGXRange& range, const char* text);
    BOOL SetValueRange(const CGXRange& range, std::string_view text);
    BOOL SetValueRange(const CGXRange& range, const CString& text);
    BOOL SetValueRange(const CGXRange& range, int number);
    // The shortest text that reads back to the same number.
    BOOL SetValueRange(const CGXRange& range, double number);
    // The text that the cell holds: its own value, or else that of its line's, its column's or the standard
    // style; of a header what it shows. Empty for a blank and for a cell that is not there.
    CString GetValueRowCol(ROWCOL row, ROWCOL col);
    // The same without a copy, but for the numbers of the lines; valid until the grid changes.
    std::string_view CellText(ROWCOL row, ROWCOL col) const;
    // The styles over one another, with the value.
    virtual void ComposeStyleRowCol(ROWCOL row, ROWCOL col, CGXStyle* style) const;
    const CGXStyle& ChangeStandardStyle(const CGXStyle& style);

    // Attaches a control to a control id and takes it over. The grid has those of style.h from the start.
    BOOL RegisterControl(UINT id, std::unique_ptr<CGXControl> control);
    // The control that the cell's style names. Its current text is that of the cell being edited.
    CGXControl* GetControl(ROWCOL row, ROWCOL col) const;
    // What the cell shows: the text being typed, or else the value as its control displays it.
    CString GetDisplayText(ROWCOL row, ROWCOL col) const;

    // The lines that are selected as a whole, in their order.
    void GetSelectedRows(std::vector<ROWCOL>& rows) const;

    // The current cell. 0 when there is none, and then row and col are 0.
    BOOL GetCurrentCell(ROWCOL* row, ROWCOL* col) const;
    // Commits what is typed, and moves the current cell. (0, 0) is none. 0: a text was refused, and all is as
    // before but for the warning. May be given the same cell, and one beyond the line count.
    virtual BOOL SetCurrentCell(ROWCOL row, ROWCOL col, UINT flags = GX_SCROLLINVIEW);
    // By SetCurrentCell, among the cells below the headers, past those that are not enabled. Starts from the
    // first of them when there is none. 0 when it is refused or stands at the edge already.
    BOOL MoveCurrentCell(int direction, int count = 1, BOOL update = TRUE);
    // The column leftmost, the line topmost in view behind the frozen ones; a screen sets them.
    ROWCOL GetLeftCol() const;
    ROWCOL GetTopRow() const;
    void SetLeftCol(ROWCOL col);
    void SetTopRow(ROWCOL row);
    // How many lines a page of the screen holds, for the keys that move by pages; 10 until a screen tells.
    void SetPageRows(ROWCOL count);

    // Whether a text that the user changed waits to be committed.
    bool IsEditPending() const;
    // Whether the current cell is being edited.
    bool IsEditing() const;
    // Ends the edit and takes back the text that the user typed; OnModifyCell is called once more then, with
    // the text from before.
    void CancelEdit();
    // What the user did, gesture by gesture, where GetParam()->EnableUndo allows it. A gesture is an edit
    // from its first key to its commit, a click, a command, with all that followed from it. An undo ends as
    // an edit does: OnModifyCell is called for each cell, and the virtual SetCurrentCell for the place where
    // the gesture began. A text that is being typed is undone before all else. Changes while undo is not
    // enabled make the grid forget its gestures. 0 when there is nothing to be undone.
    bool CanUndo() const;
    bool CanRedo() const;
    BOOL Undo();
    BOOL Redo();
    void SetWarningText(const char* text);
    // The last refusal; its text is empty when the edit has gone on since.
    const kota::GridWarning& Warning() const;

    void Redraw(UINT flags = 0, BOOL update = TRUE); // all of it; neither argument counts
    // Draws the cells anew. The control of a cell that is being edited is loaded from the stored value.
    void RedrawRowCol(const CGXRange& range);
    BOOL EnableGridToolTips(BOOL enable = TRUE);
    bool HasGridToolTips() const;
    // What a screen has to draw anew. Asking takes the changes away. The screen is told of a change
    // (kota::Change::Contents), and then no more until it asks.
    kota::GridChanges TakeChanges();

    // Keys that the user pressed in the grid. 1: taken. The base moves the current cell by the arrow keys,
    // Page Up and Down, Home and End, and extends the selection from it where Shift is held. It selects the
    // line by Shift and the space bar, all cells by Ctrl+A; begins an edit by F2 and cancels it by Escape;
    // and redoes by Ctrl+Y and Ctrl+Shift+Z.
    virtual BOOL ProcessKeys(CWnd* window, UINT message, UINT key, UINT repeat, UINT flags);
    // Before a cell is edited; 0 refuses.
    virtual BOOL OnStartEditing(ROWCOL row, ROWCOL col);
    // After every change of the text of the cell being edited, after a click changed a check box, and after
    // an undo changed a cell.
    virtual void OnModifyCell(ROWCOL row, ROWCOL col);
    // Adds a line at the end for values that are pasted beyond it. 0 when that could not be.
    virtual BOOL AppendLine();
    // Takes away the lines that are selected as a whole, when they are cut.
    virtual void DeleteSelection();
    // The focus has come to the grid or left it.
    virtual void OnActivateGrid(BOOL active);
    // A check box was clicked; its stored value is the new one.
    virtual void OnClickedButtonRowCol(ROWCOL row, ROWCOL col);
    // After the selection changed by the user.
    virtual void OnChangedSelection();

    LRESULT WindowProc(UINT message, WPARAM wParam, LPARAM lParam) override;
    bool LetFocusGo() override;
    // The commands of the Edit menu.
    BOOL OnCmdMsg(UINT id, int notification) override;

private:
    friend class kota::grid::User;
    struct Data;
    std::unique_ptr<Data> data_;
};

// The grid as a control of a dialog.
class KOTA_API CGXGridWnd : public CGXGridCore {
    DECLARE_DYNAMIC(CGXGridWnd)
public:
    CGXGridWnd();
    ~CGXGridWnd() override;

    // Prepares a grid that has just taken over its control: no lines, no columns.
    BOOL Initialize();
    // All is to be drawn anew.
    void Invalidate(BOOL erase = TRUE);
};
