// What holds of the grids in front.
#include "document/records/comp_river_pos.h"
#include "document/records/component.h"
#include "editing/base/cell_editors.h"
#include "editing/dlg_property_sheet.h"
#include "platform/framework/frame.h"
#include "platform/framework/number_text.h"
#include "resources/ids.h"
#include "tests/random/invariants.h"

#include <algorithm>

namespace kota::random_user {

namespace {

std::string at(ROWCOL row, ROWCOL col) {
    return " in line " + std::to_string(row) + ", column " + std::to_string(col);
}

std::string quoted(std::string_view text) {
    return '"' + std::string(text) + '"';
}

CGXStyle styleOf(const CGXGridCore& grid, ROWCOL row, ROWCOL col) {
    CGXStyle style;
    grid.ComposeStyleRowCol(row, col, &style);
    return style;
}

// What may stand in a number cell: nothing, what its editor takes, what a file may hold (nan, inf), and a
// location's chainage, behind which stands ".3".
bool mayBeNumber(std::string_view text) {
    if (text.starts_with('-') || text.starts_with('+'))
        text.remove_prefix(1);
    return text == "nan" || text == "inf" ||
           text.find_first_not_of("0123456789.eE+-") == std::string_view::npos;
}

void checkCell(const CGXGridCore& grid, ROWCOL row, ROWCOL col) {
    const UINT control = styleOf(grid, row, col).GetControl();
    const std::string_view text = grid.CellText(row, col);
    grid.GetDisplayText(row, col); // as a screen asks for it
    const bool isNumber = control == CellControl::ThreeDecimals || control == CellControl::NoDecimals;
    if (isNumber && !mayBeNumber(text))
        throw Broken("number cells hold numbers: " + quoted(text) + at(row, col));
    const bool isBox = control == GX_IDS_CTRL_CHECKBOX;
    if (isBox && text.find_first_not_of("0123456789-") != std::string_view::npos)
        throw Broken("boxes hold a state: " + quoted(text) + at(row, col));
}

// The place of a global line is blank and locked, that of any other is open.
void checkPlace(CGXGridCore& grid, ROWCOL row, ROWCOL global, ROWCOL place) {
    const bool isGlobal = textToInt(grid.CellText(row, global)) != 0;
    if (isGlobal && !grid.CellText(row, place).empty())
        throw Broken("a global line has no place: " + quoted(grid.CellText(row, place)) + at(row, place));
    if (styleOf(grid, row, place).GetReadOnly() != isGlobal)
        throw Broken("the place of a line is locked if it is global: " +
                     std::string(isGlobal ? "open" : "locked") + at(row, place));
}

void checkPlaces(Stage& stage, CGXGridCore& grid) {
    const ROWCOL global = columnOf(stage, grid, StringId::HeadGlobal);
    if (global == 0)
        return;
    for (const UINT heading : {StringId::HeadRiverName, StringId::HeadChainage})
        if (const ROWCOL place = columnOf(stage, grid, heading))
            for (ROWCOL row = grid.GetHeaderRows() + 1; row <= grid.GetRowCount(); ++row)
                checkPlace(grid, row, global, place);
}

void checkSelection(CGXGridCore& grid) {
    for (const CGXRange& range : grid.GetParam()->GetRangeList()->Ranges()) {
        const bool hasRows = range.kind == CGXRange::Kind::Rows || range.kind == CGXRange::Kind::Cells;
        const bool hasCols = range.kind == CGXRange::Kind::Cols || range.kind == CGXRange::Kind::Cells;
        if ((hasRows && (range.top > range.bottom || range.bottom > grid.GetRowCount())) ||
            (hasCols && (range.left > range.right || range.right > grid.GetColCount())))
            throw Broken("the selection lies inside the grid: lines " + std::to_string(range.top) + " to " +
                         std::to_string(range.bottom) + " of " + std::to_string(grid.GetRowCount()));
    }
}

void checkGrid(Stage& stage, CGXGridCore& grid) {
    if (grid.GetRowCount() <= grid.GetHeaderRows())
        throw Broken("no grid is empty: grid " + std::to_string(grid.GetDlgCtrlID()));
    ROWCOL row = 0;
    ROWCOL col = 0;
    grid.GetCurrentCell(&row, &col);
    if (row > grid.GetRowCount() || col > grid.GetColCount())
        throw Broken("the current cell lies inside the grid:" + at(row, col) + " of " +
                     std::to_string(grid.GetRowCount()) + " lines");
    checkSelection(grid);
    for (ROWCOL line = grid.GetHeaderRows() + 1; line <= grid.GetRowCount(); ++line)
        for (ROWCOL column = 1; column <= grid.GetColCount(); ++column)
            checkCell(grid, line, column);
    checkPlaces(stage, grid);
}

void expectSame(std::string_view what, std::string_view shown, std::string_view held, ROWCOL row) {
    if (shown != held)
        throw Broken("a line is its record: " + std::string(what) + " " + quoted(shown) + " is held as " +
                     quoted(held) + " in line " + std::to_string(row));
}

void checkLine(Stage& stage, CGXGridCore& grid, ROWCOL row, const AD_Comp_RiverPos& record) {
    const ROWCOL global = columnOf(stage, grid, StringId::HeadGlobal);
    const ROWCOL component = columnOf(stage, grid, StringId::HeadComponent);
    const ROWCOL river = columnOf(stage, grid, StringId::HeadRiverName);
    const ROWCOL chainage = columnOf(stage, grid, StringId::HeadChainage);
    if (global != 0)
        expectSame("global", std::to_string(textToInt(grid.CellText(row, global))),
                   std::to_string(record.isGlobal), row);
    if (component != 0)
        expectSame("component", std::to_string(textToInt(grid.CellText(row, component))),
                   std::to_string(record.componentNum), row);
    if (river != 0)
        expectSame("river", grid.CellText(row, river), record.riverName.View(), row);
    if (chainage != 0 && grid.CellText(row, chainage).empty() && record.chainage != notGiven)
        throw Broken("a blank chainage is not given: line " + std::to_string(row));
}

bool isOfComponents(Stage& stage, const CGXGridCore& grid) {
    return columnOf(stage, grid, StringId::HeadUnits) != 0;
}

} // namespace

ROWCOL columnOf(Stage& stage, const CGXGridCore& grid, UINT heading) {
    const std::string words = stage.string(heading);
    for (ROWCOL row = 0; row <= grid.GetHeaderRows(); ++row)
        for (ROWCOL col = 1; col <= grid.GetColCount(); ++col)
            if (grid.CellText(row, col) == words)
                return col;
    return 0;
}

std::string textsOf(CGXGridCore& grid) {
    std::string texts;
    for (ROWCOL row = 1; row <= grid.GetRowCount(); ++row) {
        for (ROWCOL col = 1; col <= grid.GetColCount(); ++col)
            texts += std::string(grid.CellText(row, col)) + '\t';
        texts += '\n';
    }
    return texts;
}

void checkGrids(Stage& stage) {
    for (const CMDIChildWnd* const frame : stage.frames())
        if (CKota0_adView* const view = Stage::viewOf(*frame); view && view->Sheet())
            if (const CPropertyPage* const page = view->Sheet()->GetActivePage())
                for (CGXGridCore* const grid : Stage::gridsOf(*page))
                    checkGrid(stage, *grid);
}

void checkLines(Stage& stage, CGXGridCore& grid, const CObList& records, After after) {
    const ROWCOL lines = grid.GetRowCount() - grid.GetHeaderRows();
    const auto count = static_cast<ROWCOL>(records.GetCount());
    // A lone line without a name is no component.
    const ROWCOL name = isOfComponents(stage, grid) ? columnOf(stage, grid, StringId::HeadComponent) : 0;
    const bool isBlank = name != 0 && grid.CellText(grid.GetHeaderRows() + 1, name).empty();
    if (lines == 1 && count == 0 && (isBlank || after == After::Save))
        return;
    if (lines != count)
        throw Broken("the lines are the records: " + std::to_string(lines) + " lines, " +
                     std::to_string(count) + " records");
    ROWCOL row = grid.GetHeaderRows();
    for (POSITION position = records.GetHeadPosition(); position;) {
        const CObject* const record = records.GetNext(position);
        ++row;
        if (const auto* const located = dynamic_cast<const AD_Comp_RiverPos*>(record))
            checkLine(stage, grid, row, *located);
        const auto* const component = dynamic_cast<const AD_Component*>(record);
        if (!component)
            continue;
        expectSame("name", grid.CellText(row, name), component->name.View(), row);
        if (after == After::Store)
            expectSame("number", std::to_string(row - grid.GetHeaderRows()),
                       std::to_string(component->number), row);
    }
}

} // namespace kota::random_user
