#pragma once

#include "platform/grid/lazy_column.h"
#include "platform/grid/range.h"
#include "platform/grid/small_text.h"
#include "platform/grid/style_pool.h"

#include <array>
#include <optional>
#include <string_view>
#include <vector>

namespace kota::grid {

// Whether a style is kept off what is read-only.
enum class ReadOnlyLock { Off, On };

// What a cell holds of its own.
struct CellContent {
    SmallText value;
    StyleId style = 0;
};

// Lines that were taken out of a store, with all that they hold.
class TakenLines {
public:
    ROWCOL count() const { return count_; }

private:
    friend class CellStore;
    struct Column {
        LazyColumn<SmallText> values;
        LazyColumn<StyleId> styles;
    };

    ROWCOL count_ = 0;
    std::vector<Column> columns_;
    LazyColumn<StyleId> rowStyles_;
    LazyColumn<std::optional<int>> heights_;
};

// What the cells of a grid hold: values, styles, sizes, for the lines and columns from 0, the headers. A cell
// takes 16 bytes once it or one below it in its column was written, and 4 more likewise for a style of its
// own.
//
// The styles lie over one another: standard, column, line, cell. A header takes the standard style without
// its value, that of line 0 or column 0, and its own.
class CellStore {
public:
    CellStore();

    ROWCOL rows() const { return rows_; }
    ROWCOL cols() const { return static_cast<ROWCOL>(columns_.size()) - 1; }
    bool exists(ROWCOL row, ROWCOL col) const { return row <= rows_ && col < columns_.size(); }
    // New lines stand in front of `row`.
    void insertRows(ROWCOL row, ROWCOL count);
    TakenLines takeRows(ROWCOL first, ROWCOL last);
    // Puts lines back in front of `row`.
    void putRows(ROWCOL row, TakenLines lines);
    void setCols(ROWCOL count);

    // The operations below take cells, lines and columns that exist.

    void setValue(ROWCOL row, ROWCOL col, std::string_view text) {
        columns_[col].values.write(row, lines()) = SmallText(text);
    }
    CellContent content(ROWCOL row, ROWCOL col) const;
    // Gives a cell what it is to hold of its own, for what it held.
    CellContent exchange(ROWCOL row, ROWCOL col, CellContent content);
    // Whether the cell has a value of its own, and it is this one.
    bool holds(ROWCOL row, ROWCOL col, std::string_view text) const;
    StyleId cellStyle(ROWCOL row, ROWCOL col) const { return columns_[col].styles[row]; }
    StyleId rowStyle(ROWCOL row) const { return rowStyles_[row]; }
    void setRowStyle(ROWCOL row, StyleId style) { rowStyles_.write(row, lines()) = style; }
    // The cell's own value, or else the uppermost of its styles. Valid until the store changes.
    std::string_view text(ROWCOL row, ROWCOL col) const;

    CGXStyle& standard() { return standard_; }
    // Lays a style over the cell, but for its value; over the line (column) with it. With the lock, what is
    // read-only keeps its style, and takes a value alone.
    void layOverCell(ROWCOL row, ROWCOL col, const CGXStyle& style, ReadOnlyLock lock);
    void layOverRow(ROWCOL row, const CGXStyle& style, ReadOnlyLock lock);
    void layOverCol(ROWCOL col, const CGXStyle& style, ReadOnlyLock lock);
    // All styles of the cell, with its value. The standard style for a cell that does not exist.
    CGXStyle compose(ROWCOL row, ROWCOL col) const;

    int height(ROWCOL row) const { return heights_[row].value_or(defaultHeight); }
    void setHeight(ROWCOL row, int height) { heights_.write(row, lines()) = height; }
    int width(ROWCOL col) const { return columns_[col].width; }
    void setWidth(ROWCOL col, int width) { columns_[col].width = width; }

    static constexpr int defaultHeight = 20;
    static constexpr int defaultWidth = 60;

private:
    struct Column {
        CGXStyle style;
        LazyColumn<SmallText> values;
        LazyColumn<StyleId> styles;
        int width = defaultWidth;
    };
    // The styles of a cell that lie over the standard style, from the lowest; null where there is none.
    using Levels = std::array<const CGXStyle*, 3>;

    std::size_t lines() const { return std::size_t{rows_} + 1; }
    Levels levels(ROWCOL row, ROWCOL col) const;
    // The uppermost of these styles for which `has` holds; null when there is none.
    const CGXStyle* uppermost(ROWCOL row, ROWCOL col, bool (CGXStyle::*has)() const) const;
    bool isReadOnly(ROWCOL row, ROWCOL col) const;

    ROWCOL rows_ = 0;
    CGXStyle standard_;
    std::vector<Column> columns_;
    LazyColumn<StyleId> rowStyles_;
    LazyColumn<std::optional<int>> heights_;
    StylePool pool_;
};

} // namespace kota::grid
