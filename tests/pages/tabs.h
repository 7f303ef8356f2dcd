#pragma once

#include "tests/support/editor.h"
#include "tests/support/owned.h"

#include <gmock/gmock.h>

#include <sstream>
#include <string>
#include <vector>

namespace kota::test {

// What a column of a grid is to the user.
struct ColumnLook {
    std::string heading;
    int width = 0;
    UINT control = 0;
    int alignment = alignLeft;
    std::string toolTip;

    friend bool operator==(const ColumnLook&, const ColumnLook&) = default;
    friend std::ostream& operator<<(std::ostream& stream, const ColumnLook& look) {
        return stream << look.heading << ", " << look.width << ", " << look.control << ", " << look.alignment
                      << ", " << look.toolTip;
    }
};

inline CGXStyle styleOf(const CGXGridCore& grid, ROWCOL row, ROWCOL col) {
    CGXStyle style;
    grid.ComposeStyleRowCol(row, col, &style);
    return style;
}

inline std::string textOf(const CString& text) {
    return std::string(text.View());
}

// All columns, as their first cells show them.
inline std::vector<ColumnLook> looksOf(CGXGridCore& grid) {
    std::vector<ColumnLook> looks;
    for (ROWCOL col = 1; col <= grid.GetColCount(); ++col) {
        const CGXStyle style = styleOf(grid, 1, col);
        looks.push_back({textOf(grid.GetValueRowCol(0, col)), grid.GetColWidth(col), style.GetControl(),
                         style.GetHorizontalAlignment(),
                         textOf(style.GetUserAttribute(GX_IDS_UA_TOOLTIPTEXT))});
    }
    return looks;
}

// The entries that a cell offers.
inline std::vector<std::string> entriesOf(const CGXGridCore& grid, ROWCOL row, ROWCOL col) {
    const CString choices = styleOf(grid, row, col).GetChoiceList();
    std::istringstream lines{textOf(choices)};
    std::vector<std::string> entries;
    for (std::string line; std::getline(lines, line);)
        entries.push_back(line);
    return entries;
}

// A user in front of a tab of a new document.
class OnATab : public Editor {
protected:
    // `rivers` are those of the project around the document; without any it stands outside a project.
    explicit OnATab(const char* tab, std::vector<std::string> rivers = {}) {
        if (!rivers.empty()) {
            openProject();
            shell().project().rivers = std::move(rivers);
        }
        create();
        user.emplace(session);
        EXPECT_TRUE(user->selectTab(tab));
        document().SetModifiedFlag(FALSE);
        shell().forgetReceived();
    }

    CKota0_adDoc& document() { return *static_cast<CKota0_adDoc*>(user->view().GetDocument()); }
    CGXGridCore& grid() { return user->grid(); }
    // Shows the document anew, and writes what is shown into it.
    void fill() { document().UpdateAllViews(nullptr, UpdateHint::Fill, nullptr); }
    void store() { document().UpdateAllViews(nullptr, UpdateHint::Store, nullptr); }
    void leaveTab() { EXPECT_TRUE(user->selectTab("Sediment Layers")); }

    // A line as it holds its cells.
    std::vector<std::string> line(ROWCOL row) {
        std::vector<std::string> cells;
        for (ROWCOL col = 1; col <= grid().GetColCount(); ++col)
            cells.push_back(user->held(row, col));
        return cells;
    }
    // Types into a cell and leaves it.
    void put(ROWCOL row, ROWCOL col, const std::string& text) {
        ASSERT_TRUE(user->putCursor(row, col));
        ASSERT_TRUE(user->enter(text));
    }

    std::optional<headless::User> user;
};

// A user in front of the decay tab with a local line at each of the rivers A, B and C.
class OnThreeLines : public OnATab {
protected:
    OnThreeLines() : OnATab("Decay") {
        document().decayList.DeleteAll();
        for (const char* river : {"A", "B", "C"})
            addLocal(document().decayList, 0, river, 1.0);
        fill();
    }

    // The rivers of the lines, "-" for a line without one.
    std::string rivers() {
        std::string all;
        for (ROWCOL row = 1; row <= grid().GetRowCount(); ++row)
            all += user->held(row, 4).empty() ? "-" : user->held(row, 4);
        return all;
    }
};

} // namespace kota::test
