#pragma once

#include "tests/random/surroundings.h"

namespace kota::random_user {

// What holds at any time. Each throws Broken where it does not.

// After every action: the tabs, the page in front, the focus and the menu; of every grid in front, that it is
// not empty, and that its current cell, its selection and its cells are what they may be.
void checkWindows(Stage& stage);
void checkGrids(Stage& stage);
// No operation was given an invalid argument.
void checkBoxes(Stage& stage);

// Stores the page in front, when nothing on it is pending, and looks whether lines and records agree. An edit
// that was left must have been in the document before. False when something is pending.
bool checkStored(Stage& stage, const Surroundings& surroundings);
// What the file of a document holds, after a save that went well.
void checkSaved(Stage& stage, const CKota0_adDoc& document, const Surroundings& surroundings);
// A file that was written, read into another document and written again is the same.
void checkRoundTrip(Stage& stage, const std::string& path);
// A document that was saved and shown once, saved again and shown again, is the same: the first showing
// rounds what the file holds to six decimals, a second changes nothing.
void checkShownTwice(Stage& stage);

// After what the lines and the records of a grid agree. A save drops incomplete records and fills the page
// again, which stores nothing: of an empty list the grid shows a line that is no record, and components keep
// the numbers that they had.
enum class After { Store, Save };
void checkLines(Stage& stage, CGXGridCore& grid, const CObList& records, After after);

// What a save would write now.
std::string contentOf(Stage& stage, CKota0_adDoc& document);
// All that a grid's cells hold.
std::string textsOf(CGXGridCore& grid);
// The column of that heading; 0 when there is none.
ROWCOL columnOf(Stage& stage, const CGXGridCore& grid, UINT heading);

} // namespace kota::random_user
