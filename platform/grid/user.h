#pragma once

#include "platform/grid/grid.h"

// What a user does with a grid. A screen calls these for mouse and keyboard, a test by itself: both go the
// same way. Each is a turn of its own; an invalid-argument failure in it is told to the user and gives false.
// While the grid or a window around it is disabled or hidden, nothing is taken. A grid takes the focus with
// an input, and takes no input while the window that has the focus keeps it; to commit and to close a list
// the focus is not needed.
namespace kota::grid {

// A click on a cell: it becomes current, a check box changes, and the selection goes. False when the cell
// that was current refuses to be left, or this one takes no click.
KOTA_API bool clickCell(CGXGridCore& grid, ROWCOL row, ROWCOL col);

enum class Selecting { Anew, Extend, Add };
// A click on the header of a line, which selects the whole line: alone, from the last one clicked to here
// (Shift), or besides what is selected (Ctrl). False when the current cell refuses to be left.
KOTA_API bool clickLineHeader(CGXGridCore& grid, ROWCOL row, Selecting how = Selecting::Anew);
// Selects a rectangle by dragging.
KOTA_API bool selectCells(CGXGridCore& grid, const CGXRange& range);

// Gives the current cell's edit this text, beginning the edit if need be; a screen calls it for each change
// of the text. False when the cell takes no input or no such text.
KOTA_API bool typeText(CGXGridCore& grid, const char* text);
// Chooses the entry at a zero-based place of the current cell's choice list, which closes it.
KOTA_API bool chooseEntry(CGXGridCore& grid, int index);
// The zero-based place of the entry that the current cell shows; -1 when it is none.
KOTA_API int chosenEntry(const CGXGridCore& grid);
// Changes the current cell's check box, as the space bar does.
KOTA_API bool toggle(CGXGridCore& grid);
// The list of the current cell's entries was opened, which begins the edit if need be, or closed. A text that
// changed while it stood open is told once more (OnModifyCell) when it has closed.
KOTA_API void dropDown(CGXGridCore& grid, bool open);
// Commits the text of the current cell, which stays current. False when it is refused.
KOTA_API bool commit(CGXGridCore& grid);

} // namespace kota::grid
