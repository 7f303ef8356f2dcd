#pragma once

#include "platform/framework/export.h"
#include "platform/framework/types.h"
#include "platform/grid/range.h"

// How a grid is drawn.
class KOTA_API CGXProperties {
public:
    // Whether the header of the current cell's column stands out.
    void SetMarkColHeader(BOOL mark) { markColHeader_ = mark != 0; }
    bool GetMarkColHeader() const { return markColHeader_; }

private:
    bool markColHeader_ = true;
};

// What holds for a grid as a whole.
class KOTA_API CGXGridParam {
public:
    // Whether changes can be undone; off while a page builds or fills its grid.
    void EnableUndo(BOOL enable) { undo_ = enable != 0; }
    bool IsUndoEnabled() const { return undo_; }
    // While the lock is on, which it is from the start, a read-only cell keeps its style and takes no input.
    void SetLockReadOnly(BOOL lock) { lock_ = lock != 0; }
    bool IsLockReadOnly() const { return lock_; }
    void EnableMoveCols(BOOL enable) { moveCols_ = enable != 0; }
    void EnableMoveRows(BOOL enable) { moveRows_ = enable != 0; }
    bool CanMoveCols() const { return moveCols_; }
    bool CanMoveRows() const { return moveRows_; }
    // The height of an opened choice list, in pixels.
    void SetDefaultComboBoxHeight(int height) { comboBoxHeight_ = height; }
    int GetDefaultComboBoxHeight() const { return comboBoxHeight_; }
    // Whether the grid numbers its lines in their headers by itself; it does from the start. A column's
    // header shows what it was given, whatever is set here.
    void SetNumberedRowHeaders(BOOL numbered) { numberedRows_ = numbered != 0; }
    void SetNumberedColHeaders(BOOL numbered) { numberedCols_ = numbered != 0; }
    bool IsNumberedRowHeaders() const { return numberedRows_; }
    bool IsNumberedColHeaders() const { return numberedCols_; }

    CGXRangeList* GetRangeList() { return &selection_; }
    const CGXRangeList* GetRangeList() const { return &selection_; }
    CGXProperties* GetProperties() { return &properties_; }
    const CGXProperties* GetProperties() const { return &properties_; }

private:
    bool undo_ = true;
    bool lock_ = true;
    bool moveCols_ = true;
    bool moveRows_ = true;
    bool numberedRows_ = true;
    bool numberedCols_ = true;
    int comboBoxHeight_ = 200;
    CGXRangeList selection_;
    CGXProperties properties_;
};
