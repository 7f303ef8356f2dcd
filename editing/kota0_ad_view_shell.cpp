// What the view says to the shell and to sibling editors, and what it hears from them.
#include "editing/base/gen_property_page.h"
#include "editing/base/unit_items.h"
#include "editing/dlg_property_sheet.h"
#include "editing/kota0_ad_view.h"
#include "exchange/operations.h"
#include "exchange/packages/packages.h"
#include "pages/decay_page.h"
#include "pages/dispers_page.h"
#include "pages/later_pages.h"
#include "platform/foundation/edit_style.h"
#include "platform/framework/application.h"
#include "resources/ids.h"
#include "resources/module.h"

#include <algorithm>
#include <iterator>

namespace {

// Sends a package to the shell and gives its answer; 0 without a shell.
LRESULT askShell(UINT message, WPARAM code, CKHComm_Package& package) {
    CWnd* const mainWindow = AfxGetMainWnd();
    return mainWindow ? mainWindow->SendMessage(message, code, reinterpret_cast<LPARAM>(&package)) : 0;
}

} // namespace

void CKota0_adView::GetRiverChoiceList(CString& out) {
    if (GetDocument()->projectHandle != 0 && riverChoiceList.IsEmpty()) {
        CKHComm_Package package;
        package.project = GetDocument()->projectHandle;
        const LRESULT answer = askShell(switchBoardMessage(), SwitchBoardCode::OfferRivers, package);
        const std::unique_ptr<CObList> rivers(reinterpret_cast<CObList*>(answer));
        CString names;
        while (rivers && !rivers->IsEmpty()) {
            const std::unique_ptr<CObject> river(rivers->RemoveHead());
            if (!names.IsEmpty())
                names += '\n';
            if (river)
                names += static_cast<const CK31_CBE_ModelDataItem&>(*river).riverName;
        }
        riverChoiceList = names;
    }
    out = riverChoiceList;
}

void CKota0_adView::OnGridRowChanged(ROWCOL row) {
    const struct {
        CGenPropertyPage* page;
        DataType dataType;
    } reporting[] = {
        {dispersPage.get(), DataType::Dispersion},   {initPage.get(), DataType::Init},
        {decayPage.get(), DataType::Decay},          {layerPage.get(), DataType::Layer},
        {nonCohesPage.get(), DataType::NonCohesive},
    };
    CGenPropertyPage* const active = ActivePage();
    const auto* const report =
        std::ranges::find_if(reporting, [&](const auto& r) { return r.page == active; });
    if (!active || report == std::end(reporting) || GetDocument()->projectHandle == 0)
        return;
    const std::unique_ptr<AD_Comp_RiverPos> record(active->RecordFromRow(row));
    if (!record || record->riverName.IsEmpty())
        return;
    CK31_CBE_ModelDataItem item;
    item.chainage = record->chainage;
    item.riverName = record->riverName;
    item.dataType = static_cast<std::int32_t>(report->dataType);
    CKHComm_Package package;
    package.sender = this;
    package.documentName = GetDocument()->GetTitle();
    package.project = GetDocument()->projectHandle;
    package.items = &item;
    askShell(communicationMessage(), CommunicationCode::LocationChanged, package);
}

void CKota0_adView::TellChange() {
    // The shell may end the document meanwhile.
    if (GetDocument())
        GetDocument()->DataChange(GetDocument()->GetTitle());
    if (GetDocument())
        GetDocument()->UpdateAll(this, UpdateHint::Fill, nullptr);
}

void CKota0_adView::OnGridCellEdited(ROWCOL column) {
    if (!ActivePage())
        return;
    ActivePage()->StoreToDocument();
    const int tab = sheet->GetActiveIndex();
    const bool tabTells = tab == 2 || tab == 3 || tab == 5 || tab == 6 || tab == 7;
    if (column == 1 || column == 2 || tabTells)
        GetDocument()->DataChange(GetDocument()->GetTitle());
    if (GetDocument())
        GetDocument()->UpdateAll(this, UpdateHint::Fill, nullptr);
}

void CKota0_adView::OnGridDeleteLine() {
    if (!ActivePage())
        return;
    ActivePage()->DeleteCurrentLine();
    StoreAndTell();
}

void CKota0_adView::StoreAndTell() {
    if (!GetSafeHwnd()) // the shell has closed the window meanwhile
        return;
    ActivePage()->StoreToDocument();
    TellChange();
}

void CKota0_adView::OnGridInsertLine() {
    if (!ActivePage())
        return;
    const int tab = sheet->GetActiveIndex();
    if (tab == 0 || tab == 9) {
        ActivePage()->InsertDefaultLine();
        return;
    }
    CKHComm_Package package;
    package.project = GetDocument()->projectHandle;
    const LRESULT answer = askShell(switchBoardMessage(), SwitchBoardCode::OfferLocation, package);
    const std::unique_ptr<CK31_CBE_ModelDataItem> offered(reinterpret_cast<CK31_CBE_ModelDataItem*>(answer));
    if (!GetSafeHwnd()) // the shell has closed the window meanwhile
        return;
    if (offered)
        InsertOffered(*offered);
    else
        ActivePage()->InsertDefaultLine();
}

void CKota0_adView::InsertOffered(const CK31_CBE_ModelDataItem& offered) {
    CKhEditStyle style;
    style.SetUomUnitBaseGroup(UnitItem::Chainage);
    const double chainage = offered.dataType != 0 ? offered.chainage : offered.chainage2;
    // The ".3" behind the conversion stays in the text, where every reader of numbers ignores it.
    const kota::NumberFormat format("%f.3");
    ActivePage()->InsertLocatedLine(offered.riverName, format(style.UnitConvertFromBase(chainage, 1)));
    StoreAndTell();
}

void CKota0_adView::OnGridInsertProbe() {
    CK31_CBE_ModelDataItem item;
    item.riverName = kota0AdModule().string(StringId::ProbeRiver);
    item.chainage = 1.0;
    item.chainage2 = 1.0;
    CObList items;
    items.AddTail(&item);
    exchange::InsertData("", this, &items);
}

void CKota0_adView::OnSiblingsCode(WPARAM code, const CKHComm_Package* package) {
    if (!package || (package->sender && package->sender->IsKindOf(RUNTIME_CLASS(CKota0_adView))))
        return;
    CObList* const items = static_cast<CObList*>(package->items);
    switch (code) {
    case CommunicationCode::GetData:
        exchange::GetData("", this); // the list and its items stay: nobody takes them
        break;
    case CommunicationCode::InsertData:
        exchange::InsertData("", this, items);
        break;
    case CommunicationCode::DeleteData:
        exchange::DeleteData("", this, items);
        break;
    default:
        break;
    }
}

LRESULT CKota0_adView::WindowProc(UINT message, WPARAM wParam, LPARAM lParam) {
    if (message == communicationMessage()) {
        OnSiblingsCode(wParam, reinterpret_cast<const CKHComm_Package*>(lParam));
        return 0;
    }
    if (message == projectMessage() && wParam != projectPassedOn)
        return 0;
    if (message == WM_HELP && ActivePage()) {
        ActivePage()->SendMessage(WM_COMMAND, commandParam(ID_HELP, 0));
        return TRUE;
    }
    return CFormView::WindowProc(message, wParam, lParam);
}
