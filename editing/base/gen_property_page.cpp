#include "editing/base/gen_property_page.h"

#include "document/lists/component_filter.h"
#include "document/records/component.h"
#include "editing/base/gen_grid.h"
#include "editing/base/main_menu.h"
#include "platform/framework/application.h"
#include "resources/ids.h"
#include "resources/module.h"

IMPLEMENT_DYNCREATE(CGenPropertyPage, CPropertyPage, kota0AdModule)

namespace {
// The first number of the help's contexts for dialogs.
constexpr UINT dialogHelp = 0x20000;
} // namespace

CGenPropertyPage::CGenPropertyPage() = default;
CGenPropertyPage::CGenPropertyPage(CKota0_adDoc* owner, UINT dialogId)
    : CPropertyPage(dialogId), document(owner) {}
CGenPropertyPage::~CGenPropertyPage() = default;

BOOL CGenPropertyPage::OnInitDialog() {
    CDialog::OnInitDialog();
    pageInitialised = 1;
    return TRUE;
}

BOOL CGenPropertyPage::OnSetActive() {
    PrepareGridMenu();
    FillFromDocument(document);
    return CPropertyPage::OnSetActive();
}

void CGenPropertyPage::PrepareGridMenu() {
    enableGridMenu(MF_ENABLED);
}

BOOL CGenPropertyPage::OnCmdMsg(UINT id, int notification) {
    static constexpr auto commands =
        kota::commandMap<CGenPropertyPage>({{ID_HELP, 0, &CGenPropertyPage::OnHelpPage}});
    return kota::runCommand(*this, commands, id, notification) || CPropertyPage::OnCmdMsg(id, notification);
}

void CGenPropertyPage::OnHelpPage() {
    if (CWinApp* const application = AfxGetApp())
        application->WinHelp(dialogHelp + TemplateId());
}

void CGenPropertyPage::InsertLocatedLine(CString /*riverName*/, CString /*chainage*/) {}
void CGenPropertyPage::InsertDefaultLine() {}
void CGenPropertyPage::DeleteCurrentLine() {}
void CGenPropertyPage::GotoLine(unsigned /*line*/) {}
void CGenPropertyPage::SearchLine(int /*noComponent*/, unsigned& /*line*/, unsigned /*component*/,
                                  CString /*text*/, double /*chainage*/, int /*chainageTest*/,
                                  int /*textTest*/) {}

void CGenPropertyPage::FillFromDocument(CKota0_adDoc* source) {
    document = source;
}

void CGenPropertyPage::StoreToDocument() {}
void CGenPropertyPage::SetRiverColumns() {}
void CGenPropertyPage::OnRowColumnChanged(ROWCOL /*row*/, ROWCOL /*col*/) {}

AD_Comp_RiverPos* CGenPropertyPage::RecordFromRow(ROWCOL /*row*/) {
    return nullptr;
}

void CGenPropertyPage::ComponentChoices(CString& out, int kindFilter) {
    for (POSITION position = document->compList.GetHeadPosition(); position;) {
        const AD_Component* const component = document->compList.NextRecord(position);
        if (passesKindFilter(component->kind, kindFilter))
            out += component->name + "\n";
    }
}

int CGenPropertyPage::ComponentKindAt(int n) {
    int number = 0;
    for (POSITION position = document->compList.GetHeadPosition(); position;) {
        const AD_Component* const component = document->compList.NextRecord(position);
        if (++number == n)
            return component->kind;
    }
    return 0;
}

int CGenPropertyPage::ComponentIndexOf(int n, int kindFilter) {
    int found = 0;
    int place = 0;
    for (POSITION position = document->compList.GetHeadPosition(); position && found < n;) {
        ++place;
        if (passesKindFilter(document->compList.NextRecord(position)->kind, kindFilter) && ++found == n)
            return place;
    }
    return 0;
}

CString CGenPropertyPage::ComponentColumnChoices(int kindFilter) {
    CString choices = kota0AdModule().string(StringId::UndefinedEntry);
    ComponentChoices(choices, kindFilter);
    return choices;
}

void CGenPropertyPage::SetActiveGrid(CGenGrid* grid) {
    activeGrid = grid;
}

CGenGrid* CGenPropertyPage::GetActiveGrid() {
    return activeGrid;
}
