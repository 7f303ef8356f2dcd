#pragma once

#include "platform/grid/cell_store.h"
#include "platform/grid/grid.h"
#include "platform/grid/journal.h"
#include "platform/grid/table_text.h"

#include <map>
#include <memory>
#include <optional>
#include <string>
#include <vector>

namespace kota::grid {

// The edit of a cell. It stays with its line when lines come and go, and ends with it.
struct Edit {
    CGXControl* control = nullptr; // null when no cell is being edited
    CellPlace place;
    unsigned gesture = 0;          // of which it is part
    CString textBefore;            // as it was loaded
    bool changedWhileOpen = false; // the text changed while the list of entries stood open
};

struct EndedEdit {
    unsigned turn = 0;
    unsigned gesture = 0;
};

// The lines (columns) that stay in view, and those of them that are headers.
struct Band {
    ROWCOL frozen = 0;
    ROWCOL headers = 0;
};

} // namespace kota::grid

struct CGXGridCore::Data {
    using CellPlace = kota::grid::CellPlace;

    explicit Data(CGXGridCore& owner);

    bool isBelowHeaders(CellPlace place) const;
    // Brings a range into the cells that exist: of whole lines, whole columns or all, those below the header.
    CGXRange existing(const CGXRange& range) const;

    // All stored values of cells are written here. False beyond the counts.
    bool storeValue(ROWCOL row, ROWCOL col, std::string_view text);
    void layOverCell(CellPlace place, const CGXStyle& style, kota::grid::ReadOnlyLock lock);
    void layOverRow(ROWCOL row, const CGXStyle& style, kota::grid::ReadOnlyLock lock);
    void addRows(ROWCOL row, ROWCOL count);
    void putRows(ROWCOL row, kota::grid::TakenLines lines);
    void followAddedRows(ROWCOL row, ROWCOL count);
    void takeRows(ROWCOL first, ROWCOL last);

    // The gesture of which a change is part that is made now.
    unsigned gesture() const;
    // Each change of cells and lines is remembered, by what takes it back.
    void remember(kota::grid::Change change, CellPlace place);
    // Gives a cell what it is to hold of its own.
    void exchange(CellPlace place, kota::grid::CellContent content);
    void takeBack(kota::grid::Change change);
    bool canReplay(kota::grid::Replay which) const;
    bool replay(kota::grid::Replay which);
    void commitAt(CellPlace place);

    // The place that a key in this direction leads to; none where it leads nowhere else.
    std::optional<CellPlace> placeBeside(CellPlace start, int direction, int count) const;
    void extendSelection(int direction);
    CGXRange target() const;
    std::vector<CGXRange> targets() const; // of a copy, from the top
    bool hasWholeLines() const;
    std::string copyOf(CellPlace place) const;
    bool copy() const;
    bool cut();
    bool paste(std::vector<kota::grid::TableLine> lines);
    bool pasteCell(CellPlace place, const std::string& text, CString& reason);
    bool put(CellPlace place, const std::string& text, CString& reason);
    bool putText(CellPlace place, const std::string& text, CString& reason);
    // Cuts, copies or pastes; `asked` only tells whether that can be.
    bool editCommand(UINT id, bool asked);

    // The screen is told if that changed anything.
    template <class Change>
    void changeSelection(Change change) {
        std::vector<CGXRange> ranges = param.GetRangeList()->Ranges();
        change(ranges);
        setSelection(ranges);
    }
    void setSelection(const std::vector<CGXRange>& ranges);
    // As the user does: OnChangedSelection is called if that changed anything.
    void select(const std::vector<CGXRange>& ranges);

    // Whether the user may change the cell now.
    bool canChange(CellPlace place) const;
    bool isEnabled(CellPlace place) const;
    // Makes sure that the current cell is being edited. False when that cannot be.
    bool beginEdit();
    void openEdit(CellPlace place);
    void endEdit();
    // Loads the edit's text from the stored value.
    void reloadEdit();
    // The user changed the text of the edit.
    void textChanged();
    // Stores what was typed and ends the edit. False when the text is refused.
    bool commitEdit();
    bool isCurrentCheckBox() const;
    // Changes a check box of the current cell. False when that may not be.
    bool toggle();
    void check(CellPlace place, bool checked);

    void tell();
    void noteCells(ROWCOL top, ROWCOL left, ROWCOL bottom, ROWCOL right);
    void noteRange(const CGXRange& range);
    void note(bool kota::GridChanges::*what) {
        changes.*what = true;
        tell();
    }

    CGXGridCore& grid;
    CGXGridParam param;
    kota::grid::CellStore cells;
    kota::grid::Journal journal;
    std::map<UINT, std::unique_ptr<CGXControl>> controls;
    std::vector<std::unique_ptr<CGXControl>> replacedControls; // one of them may still be running
    std::vector<CGXRange> covered;
    kota::grid::Band rowBand;
    kota::grid::Band colBand;
    ROWCOL leftCol = 1;
    ROWCOL topRow = 1;
    ROWCOL pageRows = 10;
    bool toolTips = false;

    CellPlace current;
    kota::grid::Edit edit;
    kota::grid::EndedEdit lastEdit;
    unsigned edits = 0; // how many edits began or ended: another count is another edit
    bool validating = false;
    CString warningText;
    kota::GridWarning warning;
    ROWCOL selectionAnchor = 0;

    kota::GridChanges changes;
    HWND told = nullptr; // the window of which the screen knows that it has changes
};

namespace kota::grid {

// The way of platform/grid/user.h into a grid.
class User {
public:
    static CGXGridCore::Data& of(CGXGridCore& grid) { return *grid.data_; }
};

} // namespace kota::grid
