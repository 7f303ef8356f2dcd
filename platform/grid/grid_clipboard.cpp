#include "platform/framework/message_box.h"
#include "platform/framework/messages.h"
#include "platform/framework/number_text.h"
#include "platform/framework/screen.h"
#include "platform/grid/grid_data.h"
#include "platform/grid/table_text.h"

#include <algorithm>
#include <string>

using kota::grid::CellPlace;
using kota::grid::TableLine;

namespace {

// What could not be pasted, to be told in one box.
class Refusals {
public:
    void add(CellPlace place, const std::string& text, const CString& reason) {
        if (++count_ <= mostTold)
            told_ += "\nLine " + std::to_string(place.row) + ", column " + std::to_string(place.col) +
                     ": \"" + text + "\" - " + std::string(reason.View());
    }
    void tell() const {
        if (count_ == 0)
            return;
        const std::string count = count_ == 1 ? "1 value" : std::to_string(count_) + " values";
        const std::string rest =
            count_ > mostTold ? "\nand " + std::to_string(count_ - mostTold) + " more" : std::string();
        AfxMessageBox((count + " could not be pasted:\n" + told_ + rest).c_str());
    }

private:
    static constexpr std::size_t mostTold = 10;

    std::size_t count_ = 0;
    std::string told_;
};

// The same text with a decimal point, if it is one with a decimal comma for the user; else empty.
std::string withDecimalPoint(const std::string& text) {
    const kota::Screen* const screen = kota::attachedScreen();
    const std::size_t comma = text.find(',');
    const bool isOnly = text.find_first_of(",.") == comma && text.find_last_of(",.") == comma;
    if (!screen || !screen->usesDecimalComma() || comma == std::string::npos || !isOnly)
        return {};
    std::string pointed = text;
    pointed[comma] = '.';
    return pointed;
}

} // namespace

// The cells on which a command of the Edit menu works: the selection, if it is one range, or else the current
// cell. None where there is neither.
CGXRange CGXGridCore::Data::target() const {
    const std::vector<CGXRange>& selected = param.GetRangeList()->Ranges();
    CGXRange range = selected.size() == 1 ? existing(selected.front()) : CGXRange(current.row, current.col);
    range.top = std::max(range.top, rowBand.headers + 1);
    range.left = std::max(range.left, colBand.headers + 1);
    return isBelowHeaders({range.top, range.left}) && range.top <= range.bottom ? range : CGXRange();
}

bool CGXGridCore::Data::hasWholeLines() const {
    const std::vector<CGXRange>& selected = param.GetRangeList()->Ranges();
    return !selected.empty() && std::ranges::all_of(selected, [](const CGXRange& range) {
        return range.kind == CGXRange::Kind::Rows;
    });
}

// A choice is copied as its entry, all else as the value that the cell holds.
std::string CGXGridCore::Data::copyOf(CellPlace place) const {
    const bool isChoice = grid.GetControl(place.row, place.col)->Kind() == kota::CellKind::Choice;
    return std::string(isChoice ? grid.GetDisplayText(place.row, place.col).View()
                                : grid.CellText(place.row, place.col));
}

bool CGXGridCore::Data::copy() const {
    std::vector<CGXRange> ranges = {target()};
    if (const auto& selected = param.GetRangeList()->Ranges(); selected.size() > 1) {
        ranges = selected;
        std::ranges::sort(ranges, {}, &CGXRange::top);
    }
    std::vector<TableLine> lines;
    for (const CGXRange& selected : ranges) {
        const CGXRange range = existing(selected);
        for (ROWCOL row = range.top; row <= range.bottom && range.kind != CGXRange::Kind::None; ++row) {
            TableLine& line = lines.emplace_back();
            for (ROWCOL col = range.left; col <= range.right; ++col)
                line.push_back(copyOf({row, col}));
        }
    }
    kota::Screen* const screen = kota::attachedScreen();
    if (!screen || lines.empty())
        return false;
    const bool isOneCell = lines.size() == 1 && lines.front().size() == 1;
    const std::string text = kota::grid::printTable(lines);
    screen->setClipboardText(isOneCell ? lines.front().front().c_str() : text.c_str());
    return true;
}

bool CGXGridCore::Data::cut() {
    if (!copy())
        return false;
    if (hasWholeLines()) {
        grid.DeleteSelection();
        return true;
    }
    const CGXRange range = target();
    CString ignored; // what cannot be blank stays
    for (ROWCOL row = range.top; row <= range.bottom; ++row)
        for (ROWCOL col = range.left; col <= range.right; ++col)
            put({row, col}, "", ignored);
    commitAt({range.top, range.left});
    return true;
}

// Puts a text into a cell as if it were typed. False when it is refused, with the reason.
bool CGXGridCore::Data::put(CellPlace place, const std::string& text, CString& reason) {
    if (!canChange(place)) {
        reason = "the cell cannot be changed";
        return text.empty() || text == copyOf(place);
    }
    if (grid.GetControl(place.row, place.col)->Kind() == kota::CellKind::CheckBox) {
        reason = "0 or 1 required";
        if (text != "0" && text != "1")
            return false;
        if ((kota::textToInt(cells.text(place.row, place.col)) != 0) != (text == "1"))
            check(place, text == "1");
        return true;
    }
    if (!grid.OnStartEditing(place.row, place.col) || !canChange(place)) {
        reason = "the cell cannot be changed";
        return false;
    }
    return putText(place, text, reason);
}

bool CGXGridCore::Data::putText(CellPlace place, const std::string& text, CString& reason) {
    openEdit(place);
    if (!edit.control->TakePasted(text.c_str())) {
        endEdit();
        reason = "not one of the choices";
        return false;
    }
    textChanged();
    if (commitEdit())
        return true;
    reason = warning.text;
    const std::string pointed = withDecimalPoint(text);
    if (edit.control && !pointed.empty() && edit.control->TakePasted(pointed.c_str())) {
        textChanged();
        if (commitEdit())
            return true;
    }
    grid.CancelEdit();
    return false;
}

// A table goes to the cells from the target's first on, a single value to all of them.
bool CGXGridCore::Data::paste(std::vector<TableLine> lines) {
    const CGXRange range = target();
    if (lines.empty() || range.kind == CGXRange::Kind::None)
        return false;
    const CellPlace start{range.top, range.left};
    const bool isOneValue = lines.size() == 1 && lines.front().size() == 1;
    if (isOneValue && (range.bottom > range.top || range.right > range.left))
        lines.assign(range.bottom - range.top + 1,
                     TableLine(range.right - range.left + 1, lines.front().front()));
    while (grid.GetRowCount() < start.row + lines.size() - 1 && grid.AppendLine()) {
    }
    const HWND window = grid.GetSafeHwnd();
    Refusals refusals;
    CellPlace place = start;
    for (const TableLine& line : lines) {
        place.col = start.col;
        for (const std::string& text : line) {
            if (CString reason; grid.GetSafeHwnd() != window || !pasteCell(place, text, reason))
                refusals.add(place, text, reason);
            ++place.col;
        }
        ++place.row;
    }
    if (grid.GetSafeHwnd() == window)
        commitAt(start);
    refusals.tell();
    return true;
}

bool CGXGridCore::Data::pasteCell(CellPlace place, const std::string& text, CString& reason) {
    if (place.col > grid.GetColCount()) {
        reason = "there is no such column";
        return false;
    }
    if (place.row > grid.GetRowCount()) {
        reason = "there is no such line";
        return false;
    }
    return put(place, text, reason);
}

bool CGXGridCore::Data::editCommand(UINT id, bool asked) {
    kota::Screen* const screen = kota::attachedScreen();
    if (!screen)
        return false;
    const bool isTyping = edit.control && edit.control->Kind() != kota::CellKind::Choice;
    std::vector<TableLine> lines;
    if (id == ID_EDIT_PASTE && !asked)
        lines = kota::grid::readTable(screen->clipboardText().View());
    const bool isTable = lines.size() > 1 || (lines.size() == 1 && lines.front().size() > 1);
    if (isTyping && !isTable)
        return screen->editText(id, asked);
    if (asked)
        return target().kind != CGXRange::Kind::None;
    if (!grid.SetCurrentCell(current.row, current.col, GX_KEEPFOCUS) || grid.IsEditPending())
        return false;
    switch (id) {
    case ID_EDIT_COPY:
        return copy();
    case ID_EDIT_CUT:
        return cut();
    default:
        return paste(std::move(lines));
    }
}
