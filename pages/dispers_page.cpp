#include "pages/dispers_page.h"

#include "document/records/dispersion.h"
#include "editing/base/cell_editors.h"
#include "editing/base/record_grid_part.h"
#include "editing/base/unit_items.h"
#include "resources/ids.h"
#include "resources/module.h"

IMPLEMENT_DYNAMIC(CDispersPage, CGridPage, kota0AdModule)

namespace {

namespace DispersionColumn {
constexpr ROWCOL RiverName = 1;
constexpr ROWCOL Chainage = 2;
constexpr ROWCOL Factor = 3;
constexpr ROWCOL Exponent = 4;
constexpr ROWCOL MinCoef = 5;
constexpr ROWCOL MaxCoef = 6;
constexpr std::size_t Count = 6;
} // namespace DispersionColumn

// A column of a number that is also given for the whole model. A new line and a blank cell take that value.
constexpr ColumnFace valueColumn(ROWCOL id, UINT heading, int width, int unitItem,
                                 double (*global)(const AD_Global_Var&)) {
    return {.id = id,
            .heading = heading,
            .width = width,
            .control = CellControl::ThreeDecimals,
            .alignment = alignRight,
            .unitItem = unitItem,
            .unitEntry = id,
            .print = Print::Unit,
            .store = Store::Unit,
            .newLine = CellDefault::of(global),
            .newLocated = CellDefault::of(global),
            .blank = CellDefault::of(global)};
}

constexpr std::array<Column<AD_Dispersion>, DispersionColumn::Count> columns = {{
    {{.id = DispersionColumn::RiverName,
      .heading = StringId::HeadRiverName,
      .width = 63,
      .control = CellControl::UpperCase,
      .place = Place::River},
     &AD_Dispersion::riverName},
    {{.id = DispersionColumn::Chainage,
      .heading = StringId::HeadChainage,
      .width = 58,
      .control = CellControl::NoDecimals,
      .alignment = alignRight,
      .unitItem = UnitItem::Chainage,
      .unitEntry = DispersionColumn::Chainage,
      .print = Print::Unit,
      .store = Store::Unit,
      .place = Place::Chainage,
      .blankIsNotGiven = true},
     &AD_Dispersion::chainage},
    {valueColumn(DispersionColumn::Factor, StringId::HeadDispersionFactor, 70, UnitItem::DispersionFactor,
                 [](const AD_Global_Var& globals) { return globals.G_disp_factor; }),
     &AD_Dispersion::dispFactor},
    {valueColumn(DispersionColumn::Exponent, StringId::HeadExponent, 60, UnitItem::Dimensionless,
                 [](const AD_Global_Var& globals) { return globals.G_exponent; }),
     &AD_Dispersion::exponent},
    {valueColumn(DispersionColumn::MinCoef, StringId::HeadMinimumCoef, 62, UnitItem::DispersionCoefficient,
                 [](const AD_Global_Var& globals) { return globals.G_min_disp_coef; }),
     &AD_Dispersion::minCoef},
    {valueColumn(DispersionColumn::MaxCoef, StringId::HeadMaximumCoef, 62, UnitItem::DispersionCoefficient,
                 [](const AD_Global_Var& globals) { return globals.G_max_disp_coef; }),
     &AD_Dispersion::maxCoef},
}};
static_assert(areInOrder(columns));

constexpr GridFace face{
    .control = ControlId::DispersionGrid, .tallHead = true, .unitEntries = DispersionColumn::Count + 1};

RecordList<AD_Dispersion>& dispersions(CKota0_adDoc& document) {
    return document.dispersList;
}

} // namespace

CDispersPage::CDispersPage(CKota0_adDoc* owner) : CGridPage(owner, DialogId::Dispersion) {
    AddPart(std::make_unique<RecordGridPart<AD_Dispersion>>(face, columns, dispersions, grid_, unitStyles));
}
CDispersPage::~CDispersPage() = default;

void CDispersPage::DoDataExchange(CDataExchange* exchange) {
    CGridPage::DoDataExchange(exchange);
    DDX_Control(exchange, ControlId::DispersionFactor, dispFactorEdit);
    DDX_Control(exchange, ControlId::DispersionExponent, exponentEdit);
    DDX_Control(exchange, ControlId::MinimumDispersion, minCoefEdit);
    DDX_Control(exchange, ControlId::MaximumDispersion, maxCoefEdit);
}

int CDispersPage::ApplyGlobalsToBlankCells() {
    return CGridPage::RepairBlanks();
}

bool CDispersPage::MayBeLeft() {
    const AD_Global_Var& globals = Document()->globalVar;
    if (!(globals.G_min_disp_coef > globals.G_max_disp_coef))
        return true;
    MessageBox(kota0AdModule().string(StringId::MaximumBelowMinimum));
    return false;
}

void CDispersPage::FillFromDocument(CKota0_adDoc* source) {
    CGridPage::FillFromDocument(source);
    constexpr int length = 20;
    constexpr int decimals = 3;
    constexpr int usersUnit = -1;
    AD_Global_Var& globals = source->globalVar;
    dispFactorEdit.Setup(&globals.G_disp_factor, length, decimals, true, UnitItem::DispersionFactor,
                         usersUnit);
    exponentEdit.Setup(&globals.G_exponent, length, decimals, true, UnitItem::Dimensionless, usersUnit);
    minCoefEdit.Setup(&globals.G_min_disp_coef, length, decimals, true, UnitItem::DispersionCoefficient,
                      usersUnit);
    maxCoefEdit.Setup(&globals.G_max_disp_coef, length, decimals, true, UnitItem::DispersionCoefficient,
                      usersUnit);
}

AD_Comp_RiverPos* CDispersPage::RecordFromRow(ROWCOL row) {
    if (grid_.GetRowCount() == 0)
        return nullptr;
    auto record = std::make_unique<AD_Dispersion>();
    record->riverName = Part(0).RiverNameOf(row);
    record->chainage = Part(0).ChainageOf(row);
    return record.release();
}
