#include "platform/grid/cell_store.h"

#include <algorithm>
#include <utility>

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

TakenLines CellStore::takeRows(ROWCOL first, ROWCOL last) {
    TakenLines taken;
    taken.count_ = last - first + 1;
    rows_ -= taken.count_;
    for (Column& column : columns_)
        taken.columns_.push_back({column.values.take(first, last), column.styles.take(first, last)});
    taken.rowStyles_ = rowStyles_.take(first, last);
    taken.heights_ = heights_.take(first, last);
    return taken;
}

void CellStore::putRows(ROWCOL row, TakenLines taken) {
    insertRows(row, taken.count_);
    for (std::size_t col = 0; col < std::min(columns_.size(), taken.columns_.size()); ++col) {
        columns_[col].values.put(row, std::move(taken.columns_[col].values), lines());
        columns_[col].styles.put(row, std::move(taken.columns_[col].styles), lines());
    }
    rowStyles_.put(row, std::move(taken.rowStyles_), lines());
    heights_.put(row, std::move(taken.heights_), lines());
}

CellContent CellStore::content(ROWCOL row, ROWCOL col) const {
    const SmallText& own = columns_[col].values[row];
    return {own.isSet() ? SmallText(own.view()) : SmallText(), columns_[col].styles[row]};
}

CellContent CellStore::exchange(ROWCOL row, ROWCOL col, CellContent content) {
    Column& column = columns_[col];
    std::swap(column.values.write(row, lines()), content.value);
    if (content.style != column.styles[row])
        std::swap(column.styles.write(row, lines()), content.style);
    return content;
}

bool CellStore::holds(ROWCOL row, ROWCOL col, std::string_view text) const {
    const SmallText& own = columns_[col].values[row];
    return own.isSet() && own.view() == text;
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

const CGXStyle* CellStore::uppermost(ROWCOL row, ROWCOL col, bool (CGXStyle::*has)() const) const {
    const Levels all = levels(row, col);
    const auto found = std::find_if(all.rbegin(), all.rend(),
                                    [has](const CGXStyle* style) { return style && (style->*has)(); });
    return found != all.rend() ? *found : nullptr;
}

std::string_view CellStore::text(ROWCOL row, ROWCOL col) const {
    const SmallText& own = columns_[col].values[row];
    if (own.isSet())
        return own.view();
    if (const CGXStyle* const style = uppermost(row, col, &CGXStyle::HasValue))
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
    const CGXStyle* const style = uppermost(row, col, &CGXStyle::HasReadOnly);
    return (style ? *style : standard_).GetReadOnly();
}

void CellStore::layOverCell(ROWCOL row, ROWCOL col, const CGXStyle& style, ReadOnlyLock lock) {
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
