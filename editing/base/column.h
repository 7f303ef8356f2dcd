#pragma once

#include "document/records/global_var.h"
#include "platform/grid/grid.h"

#include <array>
#include <cstddef>
#include <optional>
#include <variant>

// A grid page is a table of columns, a row per column; what is the same in all pages reads the table.

// How a record's number becomes the text of a cell. Names and whole numbers stand as they are.
enum class Print {
    Fixed,   // "%-lf", no unit
    Unit,    // through the unit style
    General, // "%-g", no unit
};

// How the text of a cell becomes the record's number.
enum class Store {
    Number, // no unit
    Unit,   // through the unit style
};

// A value that a cell takes without the user: nothing, a number, or one of the document's global values. It
// enters the cell as a plain number, without a unit.
struct CellDefault {
    enum class Kind { None, Number, Global } kind = Kind::None;
    double number = 0.0;
    double (*global)(const AD_Global_Var&) = nullptr;

    static constexpr CellDefault of(double value) { return {.kind = Kind::Number, .number = value}; }
    static constexpr CellDefault of(double (*value)(const AD_Global_Var&)) {
        return {.kind = Kind::Global, .global = value};
    }
};

// What a column has to do with a line's place.
enum class Place { None, River, Chainage };

// What a column is to the grid.
struct ColumnFace {
    ROWCOL id = 0;
    UINT heading = 0; // a string
    int width = 0;
    UINT control = GX_IDS_CTRL_EDIT;
    UINT choices = 0; // a string of the entries, 0 for none
    int alignment = alignLeft;
    std::optional<int> standard = {}; // what a cell holds that was never written to
    std::optional<COLORREF> interior = {};
    int unitItem = 0;          // 0 for none
    std::size_t unitEntry = 0; // of the page's unit styles
    const char* unitFormat = "%-lf";
    Print print = Print::Fixed;
    Store store = Store::Number;
    CellDefault newLine = {};    // in a new default line
    CellDefault newLocated = {}; // in a new located line
    CellDefault blank = {};      // what a blank cell takes when the tab is left
    Place place = Place::None;
    bool blankIsNotGiven = false; // a blank cell stands for 1e10
};

// A column with the field of the record that it shows.
template <class Record>
struct Column {
    ColumnFace face;
    std::variant<std::monostate, int Record::*, double Record::*, CString Record::*> field;
};

// Whether the columns are numbered from 1 without a gap, in their order.
template <class Record, std::size_t count>
consteval bool areInOrder(const std::array<Column<Record>, count>& columns) {
    for (std::size_t i = 0; i < count; ++i)
        if (columns[i].face.id != i + 1)
            return false;
    return true;
}

// What holds for a grid as a whole.
struct GridFace {
    UINT control = 0; // the dialog's
    ROWCOL firstLine = 1;
    ROWCOL globalColumn = 0;    // the "Global" box; 0 for none
    ROWCOL componentColumn = 0; // 0 for none
    int kindFilter = 0;         // which components that column offers
    int headerWidth = 30;
    bool tallHead = false; // a head of twice the height
    bool toolTips = true;
    std::size_t unitEntries = 0;
};
