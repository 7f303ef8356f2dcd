#include "editing/search_dialogs.h"

#include "editing/base/number_form.h"
#include "editing/base/unit_items.h"
#include "platform/framework/message_box.h"
#include "platform/framework/number_text.h"
#include "resources/ids.h"
#include "resources/module.h"

#include <utility>

IMPLEMENT_DYNAMIC(CGotoDlg, CDialog, kota0AdModule)
IMPLEMENT_DYNAMIC(CSearchDlg, CDialog, kota0AdModule)

CGotoDlg::CGotoDlg(CWnd* parent) : CDialog(DialogId::Goto, parent) {}
CGotoDlg::~CGotoDlg() = default;

void CGotoDlg::DoDataExchange(CDataExchange* exchange) {
    CDialog::DoDataExchange(exchange);
    DDX_Text(exchange, ControlId::LineNumber, lineNumber);
}

void CGotoDlg::OnOK() {
    if (!UpdateData(TRUE))
        return;
    if (lineNumber >= 1)
        EndDialog(IDOK);
    else
        MessageBox(kota0AdModule().string(StringId::LineNumberTooSmall));
}

CSearchDlg::CSearchDlg(int componentNumber, CString text, double displayedChainage, int testOfChainage,
                       int testOfText, int terms, CWnd* parent)
    : CDialog(DialogId::Search, parent), searchText(std::move(text)), chainageTest(testOfChainage),
      textTest(testOfText), chainageDisplay(displayedChainage), component(componentNumber), mode(terms) {
    style_.SetUomUnitBaseGroup(UnitItem::Chainage).SetFormat("%-lf");
    chainage = style_.UnitConvertFromBase(chainageDisplay, 0);
    componentText.Format("%d", component);
}
CSearchDlg::~CSearchDlg() = default;

BOOL CSearchDlg::OnInitDialog() {
    CDialog::OnInitDialog();
    const auto disable = [&](UINT id) { GetDlgItem(id)->EnableWindow(FALSE); };
    if (mode == NoComponent)
        disable(ControlId::SearchComponent);
    if (mode == ComponentOnly)
        for (UINT id = ControlId::SearchRiverName; id <= ControlId::SearchAbove; ++id)
            disable(id);
    return TRUE;
}

void CSearchDlg::DoDataExchange(CDataExchange* exchange) {
    CDialog::DoDataExchange(exchange);
    DDX_Text(exchange, ControlId::SearchRiverName, searchText);
    DDX_Radio(exchange, ControlId::SearchPartialMatch, textTest);
    DDX_Radio(exchange, ControlId::SearchBelow, chainageTest);
    DDX_Text(exchange, ControlId::SearchComponent, componentText);
    CString number = style_.UnitConvertFromBase_T(chainage, 1);
    DDX_Text(exchange, ControlId::SearchChainage, number);
    if (!exchange->saveAndValidate)
        return;
    if (!number.IsEmpty() && !isNumberText(number.View())) {
        MessageBox(kota0AdModule().string(StringId::InvalidNumber));
        throw kota::ExchangeFailure();
    }
    chainage = style_.UnitConvertFromBase(kota::textToDouble(number.View()), 0);
}

void CSearchDlg::OnOK() {
    if (!UpdateData(TRUE))
        return;
    chainageDisplay = style_.UnitConvertFromBase(chainage, 1);
    EndDialog(IDOK);
}
