// What a user does in a grid.
#include "editing/dlg_property_sheet.h"
#include "platform/framework/input.h"
#include "platform/grid/user.h"
#include "tests/random/plays.h"

#include <algorithm>

namespace kota::random_user {

namespace {

ROWCOL lineOf(const CGXGridCore& grid, int number) {
    const ROWCOL headers = grid.GetHeaderRows();
    return headers +
           static_cast<ROWCOL>(wrapped(number, std::max(grid.GetRowCount(), headers + 1) - headers));
}

ROWCOL columnOf(const CGXGridCore& grid, int number) {
    return static_cast<ROWCOL>(wrapped(number, std::max(grid.GetColCount(), 1U)));
}

bool click(CGXGridCore& grid, const Action& action) {
    return grid::clickCell(grid, lineOf(grid, action.numbers[0]), columnOf(grid, action.numbers[1]));
}

// How many entries the current cell offers.
std::size_t entryCount(const CGXGridCore& grid) {
    ROWCOL row = 0;
    ROWCOL col = 0;
    grid.GetCurrentCell(&row, &col);
    CGXStyle style;
    grid.ComposeStyleRowCol(row, col, &style);
    const CString choices = style.GetChoiceList();
    return static_cast<std::size_t>(std::ranges::count(choices.View(), '\n'));
}

bool playCell(Stage& stage, const Action& action) {
    CGXGridCore* const grid = stage.grid();
    return grid && click(*grid, action);
}

bool playEdit(Stage& stage, const Action& action) {
    CGXGridCore* const grid = stage.grid();
    return grid && click(*grid, action) && stage.grid() == grid &&
           grid::typeText(*grid, action.texts[0].c_str());
}

bool playEntry(Stage& stage, const Action& action) {
    CGXGridCore* const grid = stage.grid();
    if (!grid || !click(*grid, action) || stage.grid() != grid)
        return false;
    grid::dropDown(*grid, true); // the list may be filled by that alone
    const std::size_t count = stage.grid() == grid ? entryCount(*grid) : 0;
    if (count == 0)
        return false;
    return grid::chooseEntry(*grid, wrapped(action.numbers[2], count) - 1);
}

bool playType(Stage& stage, const Action& action) {
    CWnd* const focus = CWnd::GetFocus();
    if (focus && focus->State()->setup.kind == WindowKind::Edit)
        return input::typeText(*focus, action.texts[0].c_str());
    CGXGridCore* const grid = stage.grid();
    return grid && grid::typeText(*grid, action.texts[0].c_str());
}

bool playList(Stage& stage, const Action& action) {
    CGXGridCore* const grid = stage.grid();
    if (grid)
        grid::dropDown(*grid, action.texts[0] == "open");
    return grid != nullptr;
}

bool selectLine(Stage& stage, int number, grid::Selecting how) {
    CGXGridCore* const grid = stage.grid();
    return grid && grid::clickLineHeader(*grid, lineOf(*grid, number), how);
}

bool playLine(Stage& stage, const Action& action) {
    return selectLine(stage, action.numbers[0], grid::Selecting::Anew);
}
bool playAlsoLine(Stage& stage, const Action& action) {
    return selectLine(stage, action.numbers[0], grid::Selecting::Add);
}
bool playLines(Stage& stage, const Action& action) {
    return selectLine(stage, action.numbers[0], grid::Selecting::Anew) &&
           selectLine(stage, action.numbers[1], grid::Selecting::Extend);
}

bool playBlock(Stage& stage, const Action& action) {
    CGXGridCore* const grid = stage.grid();
    const std::vector<int>& to = action.numbers;
    return grid && grid::selectCells(*grid, CGXRange(lineOf(*grid, to[0]), columnOf(*grid, to[1]),
                                                     lineOf(*grid, to[2]), columnOf(*grid, to[3])));
}

bool playLeave(Stage& stage, const Action& /*action*/) {
    return stage.sheet() && stage.sheet()->GetTabControl() && input::focus(*stage.sheet()->GetTabControl());
}

} // namespace

int wrapped(int number, std::size_t count) {
    const auto size = static_cast<long long>(count);
    return static_cast<int>((((number - 1LL) % size) + size) % size) + 1;
}

Play gridPlayOf(Verb verb) {
    switch (verb) {
    case Verb::Cell:
        return playCell;
    case Verb::Edit:
        return playEdit;
    case Verb::Entry:
        return playEntry;
    case Verb::Type:
        return playType;
    case Verb::List:
        return playList;
    case Verb::Line:
        return playLine;
    case Verb::AlsoLine:
        return playAlsoLine;
    case Verb::Lines:
        return playLines;
    case Verb::Block:
        return playBlock;
    case Verb::Leave:
        return playLeave;
    default:
        return nullptr;
    }
}

} // namespace kota::random_user
