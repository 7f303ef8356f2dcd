#include "pages/comp_page.h"

#include "document/records/component.h"
#include "editing/base/cell_editors.h"
#include "editing/base/record_grid_part.h"
#include "resources/ids.h"
#include "resources/module.h"

IMPLEMENT_DYNAMIC(CCompPage, CGridPage, kota0AdModule)

namespace {

namespace ComponentColumn {
constexpr ROWCOL Name = 1;
constexpr ROWCOL Units = 2;
constexpr ROWCOL Kind = 3;
} // namespace ComponentColumn

constexpr std::array<Column<AD_Component>, 3> columns = {{
    {{.id = ComponentColumn::Name,
      .heading = StringId::HeadComponent,
      .width = 80,
      .control = CellControl::UpperCase},
     &AD_Component::name},
    {{.id = ComponentColumn::Units,
      .heading = StringId::HeadUnits,
      .width = 88,
      .control = GX_IDS_CTRL_ONEBASED_EX,
      .choices = StringId::ConcentrationUnits,
      .standard = 1},
     &AD_Component::units},
    {{.id = ComponentColumn::Kind,
      .heading = StringId::HeadType,
      .width = 80,
      .control = GX_IDS_CTRL_ZEROBASED_EX,
      .choices = StringId::ComponentKinds,
      .standard = 0},
     &AD_Component::kind},
}};
static_assert(areInOrder(columns));

constexpr GridFace face{.control = ControlId::ComponentGrid, .toolTips = false};

// The lines of the grid number the components.
class ComponentLines : public RecordGridPart<AD_Component> {
public:
    using RecordGridPart::RecordGridPart;

protected:
    void Complete(AD_Component& component, ROWCOL line) const override {
        component.number = static_cast<int>(line);
    }
};

RecordList<AD_Component>& components(CKota0_adDoc& document) {
    return document.compList;
}

} // namespace

CCompPage::CCompPage(CKota0_adDoc* owner) : CGridPage(owner, DialogId::Components) {
    AddPart(std::make_unique<ComponentLines>(face, columns, components, grid_, unitStyles));
}
CCompPage::~CCompPage() = default;

BOOL CCompPage::OnKillActive() {
    ROWCOL row = 0;
    ROWCOL col = 0;
    if (grid_.GetCurrentCell(&row, &col))
        grid_.SetCurrentCell(row, col, GX_SCROLLINVIEW);
    return CGridPage::OnKillActive();
}

void CCompPage::InsertLocatedLine(CString /*riverName*/, CString /*chainage*/) {}
void CCompPage::SearchLine(int /*noComponent*/, unsigned& /*line*/, unsigned /*component*/, CString /*text*/,
                           double /*chainage*/, int /*chainageTest*/, int /*textTest*/) {}

void CCompPage::FillFromDocument(CKota0_adDoc* source) {
    CGridPage::FillFromDocument(source);
    UpdateData(FALSE);
}

void CCompPage::StoreToDocument() {
    if (!IsInitialised())
        return;
    UpdateData(TRUE);
    if (grid_.GetRowCount() == 1 && grid_.CellText(1, ComponentColumn::Name).empty())
        Document()->compList.DeleteAll();
    else
        CGridPage::StoreToDocument();
}
