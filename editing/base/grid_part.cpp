#include "editing/base/grid_part.h"

#include "document/kota0_ad_doc.h"
#include "editing/base/gen_property_page.h"
#include "platform/framework/number_text.h"
#include "resources/ids.h"
#include "resources/module.h"

namespace {

// How many lines a grid has before the document fills it.
constexpr ROWCOL startLines = 10;

CGXStyle readOnly(bool locked) {
    return CGXStyle().SetReadOnly(locked);
}

// Lifts a grid's read-only lock for as long as a block runs.
class Unlocked {
public:
    explicit Unlocked(CGenGrid& grid) : param_(*grid.GetParam()) { param_.SetLockReadOnly(FALSE); }
    ~Unlocked() { param_.SetLockReadOnly(TRUE); }
    Unlocked(const Unlocked&) = delete;
    Unlocked& operator=(const Unlocked&) = delete;

private:
    CGXGridParam& param_;
};

} // namespace

GridPart::GridPart(const GridFace& face, CGenGrid& grid, UnitStyles& styles)
    : face_(face), grid_(grid), styles_(styles) {}
GridPart::~GridPart() = default;

void GridPart::SetUp(CGenPropertyPage& page) {
    grid_.SubclassDlgItem(face_.control, &page);
    grid_.Initialize();
    grid_.GetParam()->EnableUndo(FALSE);
    grid_.SetOwnerPage(&page);
    grid_.SetRowCount(startLines);
    grid_.SetColCount(static_cast<ROWCOL>(ColumnCount()));
    if (face_.toolTips)
        grid_.EnableGridToolTips();
    if (face_.tallHead)
        grid_.SetRowHeight(0, 0, 2 * grid_.GetRowHeight(0));
    for (std::size_t i = 0; i < ColumnCount(); ++i)
        SetUpColumn(ColumnAt(i));
    grid_.SetColWidth(0, 0, face_.headerWidth);
    for (std::size_t i = 0; i < ColumnCount(); ++i)
        grid_.SetColWidth(ColumnAt(i).id, ColumnAt(i).id, ColumnAt(i).width);
    grid_.SetupGrid();
}

void GridPart::SetUpColumn(const ColumnFace& column) {
    CGXStyle style;
    style.SetControl(column.control).SetHorizontalAlignment(column.alignment);
    if (column.choices != 0)
        style.SetChoiceList(kota0AdModule().string(column.choices));
    if (column.standard)
        style.SetValue(*column.standard);
    if (column.interior)
        style.SetInterior(*column.interior);
    if (column.unitItem != 0) {
        const CKhEditStyle& unit = styles_.Bind(column.unitEntry, column.unitItem, column.unitFormat);
        style.SetUserAttribute(GX_IDS_UA_TOOLTIPTEXT, unit.GetUomToolTipText());
    }
    grid_.SetStyleRange(CGXRange().SetCols(column.id), style);
    grid_.SetStyleRange(CGXRange(0, column.id), CGXStyle().SetValue(kota0AdModule().string(column.heading)));
}

void GridPart::SetComponentChoices(const CString& choices) {
    if (face_.componentColumn != 0)
        grid_.SetStyleRange(CGXRange().SetCols(face_.componentColumn), CGXStyle().SetChoiceList(choices));
}

void GridPart::SetDefault(ROWCOL row, const ColumnFace& column, const CellDefault& value,
                          const AD_Global_Var& globals) {
    if (value.kind == CellDefault::Kind::Number)
        grid_.SetValueRange(CGXRange(row, column.id), value.number);
    else if (value.kind == CellDefault::Kind::Global)
        grid_.SetValueRange(CGXRange(row, column.id), value.global(globals));
}

ROWCOL GridPart::AddLine() {
    const ROWCOL line = grid_.GetRowCount() + 1;
    grid_.InsertLine();
    return grid_.GetRowCount() == line ? line : 0;
}

void GridPart::AddDefaultLine(const AD_Global_Var& globals) {
    const ROWCOL line = AddLine();
    if (line == 0)
        return;
    for (std::size_t i = 0; i < ColumnCount(); ++i)
        SetDefault(line, ColumnAt(i), ColumnAt(i).newLine, globals);
    if (face_.globalColumn != 0)
        LockPlace(line);
}

void GridPart::AddLocatedLine(const AD_Global_Var& globals, const CString& riverName,
                              const CString& chainage) {
    const ROWCOL line = AddLine();
    if (line == 0)
        return;
    for (std::size_t i = 0; i < ColumnCount(); ++i) {
        const ColumnFace& column = ColumnAt(i);
        SetDefault(line, column, column.newLocated, globals);
        if (column.place != Place::None)
            grid_.SetValueRange(CGXRange(line, column.id),
                                column.place == Place::River ? riverName : chainage);
    }
}

void GridPart::FillBlanks(const AD_Global_Var& globals) {
    for (ROWCOL row = face_.firstLine; row <= grid_.GetRowCount(); ++row)
        for (std::size_t i = 0; i < ColumnCount(); ++i)
            if (grid_.CellText(row, ColumnAt(i).id).empty())
                SetDefault(row, ColumnAt(i), ColumnAt(i).blank, globals);
}

void GridPart::LockPlace(ROWCOL row) {
    for (std::size_t i = 0; i < ColumnCount(); ++i)
        if (ColumnAt(i).place != Place::None) {
            const CGXRange cell(row, ColumnAt(i).id);
            grid_.SetValueRange(cell, "");
            grid_.SetStyleRange(cell, readOnly(true));
        }
}

void GridPart::OpenPlace(ROWCOL row) {
    const Unlocked scope(grid_);
    for (std::size_t i = 0; i < ColumnCount(); ++i)
        if (ColumnAt(i).place != Place::None)
            grid_.SetStyleRange(CGXRange(row, ColumnAt(i).id), readOnly(false));
}

void GridPart::ApplyGlobalBox(ROWCOL row, ROWCOL col) {
    if (kota::textToInt(grid_.CellText(row, col)) < 1)
        OpenPlace(row);
    else
        LockPlace(row);
}

const ColumnFace* GridPart::ColumnOf(Place place) const {
    for (std::size_t i = 0; i < ColumnCount(); ++i)
        if (ColumnAt(i).place == place)
            return &ColumnAt(i);
    return nullptr;
}

void GridPart::SetRiverColumn() {
    if (const ColumnFace* const column = ColumnOf(Place::River))
        grid_.SetRiverColumn(column->id);
}

CString GridPart::RiverNameOf(ROWCOL row) const {
    const ColumnFace* const column = ColumnOf(Place::River);
    return column ? CString(grid_.CellText(row, column->id)) : CString();
}

double GridPart::ChainageOf(ROWCOL row) const {
    const ColumnFace* const column = ColumnOf(Place::Chainage);
    if (!column)
        return 0.0;
    return styles_.At(column->unitEntry)
        .UnitConvertFromBase(kota::textToDouble(grid_.CellText(row, column->id)), 0);
}
