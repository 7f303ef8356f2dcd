#include "platform/grid/cell_store.h"

#include <ranges>

namespace kota::grid {

namespace {

bool isHeader(ROWCOL row, ROWCOL col) {
    return row == 0 || col == 0;
}

// What of `style` is laid over something that is read-only or not.
CGXStyle admitted(const CGXStyle& style, bool readOnly, ReadOnlyLock lock) {
    if (!readOnly || lock == ReadOnlyLock::Off)
        return style;
    return style.HasValue() ? CGXStyle().SetValue(style.GetValue()) : CGXStyle();
}

bool readOnlyOver(const CGXStyle& upper, const CGXStyle& lower) {
    return upper.HasReadOnly() ? upper.GetReadOnly() : lower.GetReadOnly();
}

} // namespace

CellStore::CellStore() : columns_(1) {}

void CellStore::insertRows(ROWCOL row, ROWCOL count) {
    rows_ += count;
    for (Column& column : columns_) {
        column.values.insert(row, count);
        column.styles.insert(row, count);
    }
    rowStyles_.insert(row, count);
    heights_.insert(row, count);
}

void CellStore::removeRows(ROWCOL first, ROWCOL last) {
    rows_ -= last - first + 1;
    for (Column& column : columns_) {
        column.values.erase(first, last);
        column.styles.erase(first, last);
    }
    rowStyles_.erase(first, last);
    heights_.erase(first, last);
}

void CellStore::setCols(ROWCOL count) {
    columns_.resize(std::size_t{count} + 1);
}

CellStore::Levels CellStore::levels(ROWCOL row, ROWCOL col) const {
    const Column& column = columns_[col];
    const StyleId line = isHeader(row, col) && row != 0 ? 0 : rowStyles_[row];
    const StyleId own = column.styles[row];
    return {isHeader(row, col) && col != 0 ? nullptr : &column.style, //
            line == 0 ? nullptr : &pool_[line],                       //
            own == 0 ? nullptr : &pool_[own]};
}

std::string_view CellStore::text(ROWCOL row, ROWCOL col) const {
    const SmallText& own = columns_[col].values[row];
    if (own.isSet())
        return own.view();
    for (const CGXStyle* const style : levels(row, col) | std::views::reverse)
        if (style && style->HasValue())
            return style->ValueText();
    return isHeader(row, col) ? std::string_view() : standard_.ValueText();
}

CGXStyle CellStore::compose(ROWCOL row, ROWCOL col) const {
    CGXStyle style = standard_;
    if (isHeader(row, col))
        style.ClearValue();
    if (!exists(row, col))
        return style;
    for (const CGXStyle* const level : levels(row, col))
        if (level)
            style.ChangeStyle(*level);
    const SmallText& own = columns_[col].values[row];
    if (own.isSet())
        style.SetValue(own.view());
    return style;
}

bool CellStore::isReadOnly(ROWCOL row, ROWCOL col) const {
    for (const CGXStyle* const style : levels(row, col) | std::views::reverse)
        if (style && style->HasReadOnly())
            return style->GetReadOnly();
    return standard_.GetReadOnly();
}

void CellStore::layOverCell(ROWCOL row, ROWCOL col, const CGXStyle& style, ReadOnlyLock lock) {
    if (style.HasValue())
        setValue(row, col, style.ValueText());
    if (style.HasOnlyValue() || (lock == ReadOnlyLock::On && isReadOnly(row, col)))
        return;
    CGXStyle look = style;
    look.ClearValue();
    StyleId& own = columns_[col].styles.write(row, lines());
    own = pool_.layOver(own, look);
}

void CellStore::layOverRow(ROWCOL row, const CGXStyle& style, ReadOnlyLock lock) {
    StyleId& line = rowStyles_.write(row, lines());
    line = pool_.layOver(line, admitted(style, readOnlyOver(pool_[line], standard_), lock));
}

void CellStore::layOverCol(ROWCOL col, const CGXStyle& style, ReadOnlyLock lock) {
    CGXStyle& column = columns_[col].style;
    column.ChangeStyle(admitted(style, readOnlyOver(column, standard_), lock));
}

} // namespace kota::grid
