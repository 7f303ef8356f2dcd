#include "platform/framework/message_box.h"
#include "platform/framework/messages.h"
#include "platform/framework/number_text.h"
#include "platform/framework/platform_texts.h"
#include "platform/framework/screen.h"
#include "platform/grid/choice_list.h"
#include "platform/grid/grid_data.h"
#include "platform/grid/table_text.h"

#include <algorithm>
#include <string>

using kota::PlatformText;
using kota::grid::CellPlace;
using kota::grid::TableLine;

namespace {

// What could not be pasted, to be told in one box.
class Refusals {
public:
    void add(CellPlace place, const std::string& text, const CString& reason) {
        if (++count_ > mostTold)
            return;
        const CString line = kota::platformText(PlatformText::RefusedValue, place.row, place.col,
                                                text.c_str(), static_cast<const char*>(reason));
        told_ += "\n" + line;
    }
    void tell() const {
        if (count_ == 0)
            return;
        CString all = kota::platformText(PlatformText::OneNotPasted);
        if (count_ > 1)
            all = kota::platformText(PlatformText::NotPasted, count_);
        all += "\n" + told_;
        if (count_ > mostTold) {
            const CString rest = kota::platformText(PlatformText::MoreRefused, count_ - mostTold);
            all += "\n" + rest;
        }
        AfxMessageBox(all);
    }

private:
    static constexpr std::size_t mostTold = 10;

    std::size_t count_ = 0;
    CString told_;
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

// A choice is copied as its entry, unless another one reads the same, all else as the value that the cell
// holds.
std::string CGXGridCore::Data::copyOf(CellPlace place) const {
    std::string value(grid.CellText(place.row, place.col));
    if (grid.GetControl(place.row, place.col)->Kind() != kota::CellKind::Choice)
        return value;
    const CString entry = grid.GetDisplayText(place.row, place.col);
    CGXStyle style;
    grid.ComposeStyleRowCol(place.row, place.col, &style);
    const CString list = style.GetChoiceList();
    int same = 0;
    kota::grid::findEntry(list.View(), [&](std::string_view other) {
        same += other == entry.View() ? 1 : 0;
        return false;
    });
    return same == 1 ? std::string(entry.View()) : value;
}

std::vector<CGXRange> CGXGridCore::Data::targets() const {
    std::vector<CGXRange> ranges = {target()};
    if (const auto& selected = param.GetRangeList()->Ranges(); selected.size() > 1) {
        ranges.clear();
        for (const CGXRange& range : selected)
            ranges.push_back(existing(range));
        std::ranges::sort(ranges, {}, &CGXRange::top);
    }
    std::erase_if(ranges, [](const CGXRange& range) { return range.kind == CGXRange::Kind::None; });
    return ranges;
}

bool CGXGridCore::Data::copy() const {
    std::vector<TableLine> lines;
    for (const CGXRange& range : targets())
        for (ROWCOL row = range.top; row <= range.bottom; ++row) {
            TableLine& line = lines.emplace_back();
            for (ROWCOL col = range.left; col <= range.right; ++col)
                line.push_back(copyOf({row, col}));
        }
    kota::Screen* const screen = kota::attachedScreen();
    if (!screen || lines.empty())
        return false;
    const std::string& first = lines.front().front();
    const bool isPlainValue = kota::grid::readTable(first) == lines;
    screen->setClipboardText(isPlainValue ? first.c_str() : kota::grid::printTable(lines).c_str());
    return true;
}

// Lines in several pieces are not deleted, so they are not cut either.
bool CGXGridCore::Data::cut() {
    const std::vector<CGXRange> ranges = targets();
    if ((hasWholeLines() && ranges.size() > 1) || !copy())
        return false;
    if (hasWholeLines()) {
        grid.DeleteSelection();
        return true;
    }
    CString ignored; // what cannot be blank stays
    for (const CGXRange& range : ranges)
        for (ROWCOL row = range.top; row <= range.bottom; ++row)
            for (ROWCOL col = range.left; col <= range.right; ++col)
                put({row, col}, "", ignored);
    commitAt({ranges.front().top, ranges.front().left});
    return true;
}

// Puts a text into a cell as if it were typed. False when it is refused, with the reason.
bool CGXGridCore::Data::put(CellPlace place, const std::string& text, CString& reason) {
    if (!canChange(place)) {
        reason = kota::platformText(PlatformText::CellIsReadOnly);
        return text.empty() || text == copyOf(place);
    }
    if (grid.GetControl(place.row, place.col)->Kind() == kota::CellKind::CheckBox) {
        reason = kota::platformText(PlatformText::ZeroOrOne);
        if (text != "0" && text != "1")
            return false;
        if ((kota::textToInt(cells.text(place.row, place.col)) != 0) != (text == "1"))
            check(place, text == "1");
        return true;
    }
    if (!grid.OnStartEditing(place.row, place.col) || !canChange(place)) {
        reason = kota::platformText(PlatformText::CellIsReadOnly);
        return false;
    }
    return putText(place, text, reason);
}

bool CGXGridCore::Data::putText(CellPlace place, const std::string& text, CString& reason) {
    openEdit(place);
    if (!edit.control->TakePasted(text.c_str())) {
        endEdit();
        reason = kota::platformText(PlatformText::NotAChoice);
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
    const HWND window = grid.GetSafeHwnd();
    while (grid.GetRowCount() < start.row + lines.size() - 1 && grid.AppendLine()) {
    }
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
        reason = kota::platformText(PlatformText::NoSuchColumn);
        return false;
    }
    if (place.row > grid.GetRowCount()) {
        reason = kota::platformText(PlatformText::NoSuchLine);
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
    if (!grid.IsWindowVisible()) // whoever was told of the edit has brought another page to the front
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
