#include "tests/random/surroundings.h"

#include "editing/dlg_property_sheet.h"
#include "platform/framework/input.h"

namespace kota::random_user {

namespace {

// Adds lines to a grid and looks which list gets as many records.
void findListOf(Stage& stage, CGXGridCore& grid, Surroundings& surroundings) {
    constexpr int lines = 3;
    if (!input::focus(grid))
        return;
    for (int i = 0; i < lines; ++i)
        input::key(VK_INSERT);
    stage.view()->OnUpdate(nullptr, UpdateHint::Store, nullptr);
    const auto lists = listsOf(*stage.document());
    const ROWCOL records = grid.GetRowCount() - grid.GetHeaderRows();
    for (std::size_t i = 0; i < lists.size(); ++i)
        if (lists[i]->GetCount() == static_cast<int>(records) && records > lines)
            surroundings.listOfGrid[{stage.page()->TemplateId(), grid.GetDlgCtrlID()}] = i;
}

// Looks at the tab in front.
void lookAt(Stage& stage, Surroundings& surroundings) {
    const auto has = [&](std::initializer_list<WindowKind> kinds) { return !stage.controls(kinds).empty(); };
    const bool hasButtons = has({WindowKind::CheckBox, WindowKind::RadioButton, WindowKind::PushButton});
    const bool hasComboBoxes = has({WindowKind::ComboBox});
    surroundings.hasButtons |= hasButtons;
    surroundings.hasComboBoxes |= hasComboBoxes;
    const bool offers = hasButtons || hasComboBoxes || has({WindowKind::Grid, WindowKind::Edit});
    const std::string caption(stage.page()->GetCaption().View());
    (offers ? surroundings.tabs : surroundings.emptyTabs).push_back(caption);
    for (CGXGridCore* const grid : Stage::gridsOf(*stage.page()))
        findListOf(stage, *grid, surroundings);
}

} // namespace

bool Surroundings::mayBeTaken(Verb verb) const {
    return verb == Verb::Press ? hasButtons : verb == Verb::Pick ? hasComboBoxes : true;
}

std::array<const CObList*, 12> listsOf(const CKota0_adDoc& document) {
    return {&document.initList,    &document.initStraList,   &document.nonCohesList, &document.decayList,
            &document.dispersList, &document.k32DispersList, &document.iceDataList,  &document.globalList,
            &document.compList,    &document.boundList,      &document.k32BoundList, &document.layerList};
}

const CObList* Surroundings::listOf(const CPropertyPage& page, const CGXGridCore& grid,
                                    const CKota0_adDoc& document) const {
    const auto found = listOfGrid.find({page.TemplateId(), grid.GetDlgCtrlID()});
    return found == listOfGrid.end() ? nullptr : listsOf(document)[found->second];
}

Surroundings lookAround() {
    Surroundings surroundings;
    Stage stage;
    stage.screen().answer = Answer::No;
    for (int index = 0;; ++index) {
        // A document of its own for each tab: a page may refuse to be left.
        stage.session().create();
        if (index == stage.sheet()->GetPageCount())
            return surroundings;
        input::selectTab(*stage.sheet(), index);
        lookAt(stage, surroundings);
    }
}

} // namespace kota::random_user
