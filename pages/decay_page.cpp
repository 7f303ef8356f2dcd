#include "pages/decay_page.h"

#include "document/lists/component_filter.h"
#include "document/records/decay.h"
#include "editing/base/cell_editors.h"
#include "editing/base/record_grid_part.h"
#include "editing/base/unit_items.h"
#include "pages/colours.h"
#include "resources/ids.h"
#include "resources/module.h"

IMPLEMENT_DYNAMIC(CDecayPage, CGridPage, kota0AdModule)

namespace {

namespace DecayColumn {
constexpr ROWCOL Component = 1;
constexpr ROWCOL DecayConstant = 2;
constexpr ROWCOL Global = 3;
constexpr ROWCOL RiverName = 4;
constexpr ROWCOL Chainage = 5;
constexpr std::size_t Count = 5;
} // namespace DecayColumn

constexpr std::array<Column<AD_Decay>, DecayColumn::Count> columns = {{
    {{.id = DecayColumn::Component,
      .heading = StringId::HeadComponent,
      .width = 80,
      .control = GX_IDS_CTRL_ZEROBASED_EX,
      .choices = StringId::UndefinedChoice,
      .standard = 0,
      .newLine = CellDefault::of(0.0),
      .newLocated = CellDefault::of(0.0)},
     &AD_Decay::componentNum},
    {{.id = DecayColumn::DecayConstant,
      .heading = StringId::HeadDecayConstant,
      .width = 65,
      .control = CellControl::ThreeDecimals,
      .alignment = alignRight,
      .unitItem = UnitItem::FirstOrderRate,
      .unitEntry = DecayColumn::DecayConstant,
      .print = Print::Unit,
      .store = Store::Unit,
      .newLine = CellDefault::of(0.0),
      .newLocated = CellDefault::of(0.0),
      .blank = CellDefault::of(0.0)},
     &AD_Decay::decayConst},
    {{.id = DecayColumn::Global,
      .heading = StringId::HeadGlobal,
      .width = 62,
      .control = GX_IDS_CTRL_CHECKBOX,
      .interior = Colour::CheckBoxGrey,
      .newLine = CellDefault::of(1.0),
      .newLocated = CellDefault::of(0.0)},
     &AD_Decay::isGlobal},
    {{.id = DecayColumn::RiverName,
      .heading = StringId::HeadRiverName,
      .width = 62,
      .control = CellControl::UpperCase,
      .place = Place::River},
     &AD_Decay::riverName},
    {{.id = DecayColumn::Chainage,
      .heading = StringId::HeadChainage,
      .width = 62,
      .control = CellControl::NoDecimals,
      .alignment = alignRight,
      .unitItem = UnitItem::Chainage,
      .unitEntry = DecayColumn::Chainage,
      .print = Print::Unit,
      .store = Store::Unit,
      .place = Place::Chainage,
      .blankIsNotGiven = true},
     &AD_Decay::chainage},
}};
static_assert(areInOrder(columns));

constexpr GridFace face{.control = ControlId::DecayGrid,
                        .globalColumn = DecayColumn::Global,
                        .componentColumn = DecayColumn::Component,
                        .kindFilter = AllKinds,
                        .tallHead = true,
                        .unitEntries = DecayColumn::Count + 1};

RecordList<AD_Decay>& decays(CKota0_adDoc& document) {
    return document.decayList;
}

} // namespace

CDecayPage::CDecayPage(CKota0_adDoc* owner) : CGridPage(owner, DialogId::Decay) {
    AddPart(std::make_unique<RecordGridPart<AD_Decay>>(face, columns, decays, grid_, unitStyles));
}
CDecayPage::~CDecayPage() = default;

int CDecayPage::ClearBlankDecayConstants() {
    return CGridPage::RepairBlanks();
}

AD_Comp_RiverPos* CDecayPage::RecordFromRow(ROWCOL row) {
    const bool isGlobal = kota::textToInt(grid_.CellText(row, DecayColumn::Global)) != 0;
    if (grid_.GetRowCount() == 0 || !isGlobal)
        return nullptr;
    auto record = std::make_unique<AD_Decay>();
    record->riverName = Part(0).RiverNameOf(row);
    record->chainage = Part(0).ChainageOf(row);
    return record.release();
}
