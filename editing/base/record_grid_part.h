#pragma once

#include "document/kota0_ad_doc.h"
#include "document/records/comp_river_pos.h"
#include "editing/base/grid_part.h"
#include "platform/framework/number_text.h"

#include <memory>
#include <type_traits>

// One grid of a page whose lines are the records of a list, line by line and field by field.
template <class Record>
class RecordGridPart : public GridPart {
public:
    using List = RecordList<Record>;
    using ListOf = List& (*)(CKota0_adDoc&);

    // `columns` must outlive the part. `listOf` gives the document's list.
    RecordGridPart(const GridFace& face, std::span<const Column<Record>> columns, ListOf listOf,
                   CGenGrid& grid, UnitStyles& styles)
        : GridPart(face, grid, styles), columns_(columns), listOf_(listOf) {}

    bool HasRecords(const CKota0_adDoc& document) const override {
        return !listOf_(const_cast<CKota0_adDoc&>(document)).IsEmpty();
    }

    void FillLines(const CKota0_adDoc& document) override {
        const List& list = listOf_(const_cast<CKota0_adDoc&>(document));
        Grid().SetRowCount(Face().firstLine - 1 + static_cast<ROWCOL>(list.GetCount()));
        ROWCOL line = Face().firstLine;
        for (POSITION position = list.GetHeadPosition(); position; ++line)
            FillLine(line, *list.NextRecord(position));
    }

    void StoreLines(CKota0_adDoc& document) const override {
        List& list = listOf_(document);
        list.DeleteAll();
        const ROWCOL count = Grid().GetRowCount();
        for (ROWCOL line = Face().firstLine; line <= count; ++line) {
            auto record = std::make_unique<Record>();
            StoreLine(line, *record);
            list.AddTail(record.release());
        }
    }

protected:
    std::size_t ColumnCount() const override { return columns_.size(); }
    const ColumnFace& ColumnAt(std::size_t index) const override { return columns_[index].face; }

    void FillLine(ROWCOL line, const Record& record) {
        const bool isGlobal = HoldsEverywhere(record);
        for (const Column<Record>& column : columns_)
            if (!isGlobal || column.face.place == Place::None)
                FillCell(line, column, record);
        StyleLine(line, record);
    }
    // What the values of a line that was filled open and lock: the place goes with the "Global" box.
    virtual void StyleLine(ROWCOL line, const Record& record) {
        if (HoldsEverywhere(record))
            LockPlace(line);
        else if (Face().globalColumn != 0)
            OpenPlace(line);
    }
    void StoreLine(ROWCOL line, Record& record) const {
        for (const Column<Record>& column : columns_)
            StoreCell(line, column, record);
        Complete(record, line);
    }
    // Fills in what no column holds.
    virtual void Complete(Record& /*record*/, ROWCOL /*line*/) const {}

private:
    bool HoldsEverywhere(const Record& record) const {
        if constexpr (std::is_base_of_v<AD_Comp_RiverPos, Record>)
            return Face().globalColumn != 0 && record.isGlobal != 0;
        else
            return false;
    }

    void FillCell(ROWCOL line, const Column<Record>& column, const Record& record) {
        const CGXRange cell(line, column.face.id);
        if (auto* const text = std::get_if<CString Record::*>(&column.field))
            Grid().SetValueRange(cell, (record.**text).View());
        else if (auto* const number = std::get_if<int Record::*>(&column.field))
            Grid().SetValueRange(cell, record.**number);
        else if (auto* const value = std::get_if<double Record::*>(&column.field))
            FillNumber(cell, column.face, record.**value);
    }

    void FillNumber(const CGXRange& cell, const ColumnFace& column, double value) {
        static const kota::NumberFormat fixed("%-lf");
        static const kota::NumberFormat general("%-g");
        kota::NumberBuffer buffer;
        if (column.blankIsNotGiven && value == notGiven)
            Grid().SetValueRange(cell, std::string_view());
        else if (column.print == Print::Unit)
            Grid().SetValueRange(cell, Styles().At(column.unitEntry).print(value, 1, buffer));
        else
            Grid().SetValueRange(cell, (column.print == Print::Fixed ? fixed : general).print(value, buffer));
    }

    void StoreCell(ROWCOL line, const Column<Record>& column, Record& record) const {
        const std::string_view text = Grid().CellText(line, column.face.id);
        if (auto* const name = std::get_if<CString Record::*>(&column.field))
            record.** name = text;
        else if (auto* const number = std::get_if<int Record::*>(&column.field))
            record.** number = kota::textToInt(text);
        else if (auto* const value = std::get_if<double Record::*>(&column.field))
            record.** value = NumberOf(text, column.face);
    }

    double NumberOf(std::string_view text, const ColumnFace& column) const {
        if (column.blankIsNotGiven && text.empty())
            return notGiven;
        const double number = kota::textToDouble(text);
        return column.store == Store::Unit ? Styles().At(column.unitEntry).UnitConvertFromBase(number, 0)
                                           : number;
    }

    std::span<const Column<Record>> columns_;
    ListOf listOf_;
};
