#include "editing/kota0_ad_view.h"

#include "editing/dlg_property_sheet.h"
#include "editing/search_dialogs.h"
#include "exchange/packages/packages.h"
#include "pages/comp_page.h"
#include "pages/decay_page.h"
#include "pages/dispers_page.h"
#include "pages/later_pages.h"
#include "platform/framework/application.h"
#include "platform/framework/frame.h"
#include "platform/framework/message_box.h"
#include "resources/ids.h"
#include "resources/module.h"

IMPLEMENT_DYNCREATE(CKota0_adView, CFormView, kota0AdModule)

CKota0_adView::CKota0_adView() : CFormView(DialogId::Form) {}

CKota0_adView::~CKota0_adView() {
    if (CKota0_adDoc* const document = GetDocument())
        document->LeaveProject(this, document->GetTitle());
    if (CWnd* const mainWindow = AfxGetMainWnd())
        mainWindow->SendMessage(communicationMessage(), CommunicationCode::LocationChanged, 0);
    if (CKota0_adDoc* const document = GetDocument())
        document->DataChange(document->GetTitle());
    compPage.reset();
    dispersPage.reset();
    k32DispersPage.reset();
    initPage.reset();
    decayPage.reset();
    boundPage.reset();
    k32BoundPage.reset();
    globalPage.reset();
    layerPage.reset();
    nonCohesPage.reset();
    addOutput.reset();
    k32AddOutPage.reset();
    sheet.reset();
}

CKota0_adDoc* CKota0_adView::GetDocument() const {
    return static_cast<CKota0_adDoc*>(CFormView::GetDocument());
}

CGenPropertyPage* CKota0_adView::ActivePage() const {
    return sheet ? static_cast<CGenPropertyPage*>(sheet->GetActivePage()) : nullptr;
}

void CKota0_adView::OnInitialUpdate() {
    CFormView::OnInitialUpdate();
    if (CFrameWnd* const frame = GetParentFrame())
        frame->RecalcLayout();
    ResizeParentToFit(FALSE);
    sheet = std::make_unique<CDlgPropertySheet>(kota0AdModule().string(StringId::SheetCaption));
    sheet->ownerView = this;
    MakePages();
    CGenPropertyPage* const tabs[] = {compPage.get(),  dispersPage.get(), k32DispersPage.get(),
                                      initPage.get(),  decayPage.get(),   globalPage.get(),
                                      layerPage.get(), addOutput.get(),   k32AddOutPage.get()};
    for (CGenPropertyPage* page : tabs)
        sheet->AddPage(page);
    sheet->EmbedInView(this, ControlId::SheetPlaceholder);
    if (GetDocument()->GetProjectInfo(this, GetDocument()->GetTitle()))
        SetRiverColumns();
}

void CKota0_adView::MakePages() {
    CKota0_adDoc* const document = GetDocument();
    compPage = std::make_unique<CCompPage>(document);
    dispersPage = std::make_unique<CDispersPage>(document);
    k32DispersPage = std::make_unique<CK32DispersPage>(document);
    initPage = std::make_unique<CInitPage>(document);
    decayPage = std::make_unique<CDecayPage>(document);
    boundPage = std::make_unique<CBoundPage>(document);
    k32BoundPage = std::make_unique<CK32BoundPage>(document);
    globalPage = std::make_unique<CGlobalPage>(document);
    layerPage = std::make_unique<CLayerPage>(document);
    nonCohesPage = std::make_unique<CNonCohesPage>(document);
    addOutput = std::make_unique<CAddOutput>(document);
    k32AddOutPage = std::make_unique<CK32AddOutPage>(document);
}

void CKota0_adView::SetRiverColumns() {
    CGenPropertyPage* const pages[] = {dispersPage.get(), k32DispersPage.get(), initPage.get(),
                                       decayPage.get(),   globalPage.get(),     layerPage.get(),
                                       nonCohesPage.get()};
    for (CGenPropertyPage* page : pages)
        page->SetRiverColumns();
}

void CKota0_adView::OnUpdate(CView* sender, LPARAM hint, CObject* hintObject) {
    CFormView::OnUpdate(sender, hint, hintObject);
    CGenPropertyPage* const page = ActivePage();
    if (!page || !GetSafeHwnd()) // what a closed window shows is out of date
        return;
    if (hint == UpdateHint::Store)
        page->StoreToDocument();
    else if (hint == UpdateHint::Fill)
        page->FillFromDocument(GetDocument());
}

void CKota0_adView::OnActivateView(BOOL activate, CView* activateView, CView* deactiveView) {
    const auto tell = [](UINT message) {
        if (CWnd* const mainWindow = AfxGetMainWnd())
            mainWindow->SendMessage(message, toolbarCommand);
    };
    const bool toSibling = activateView && activateView->IsKindOf(RUNTIME_CLASS(CKota0_adView));
    if (activate) {
        tell(showToolbarMessage());
    } else if (activateView && activateView == deactiveView) {
        tell(hideToolbarMessage());
        if (!toSibling)
            tell(hideToolbarMessage());
    } else if (activateView && !toSibling) {
        tell(hideToolbarMessage());
    }
    CFormView::OnActivateView(activate, activateView, deactiveView);
}

BOOL CKota0_adView::OnPreparePrinting(CPrintInfo* info) {
    return DoPreparePrinting(info);
}

BOOL CKota0_adView::OnCmdMsg(UINT id, int notification) {
    using View = CKota0_adView;
    static constexpr auto commands = kota::commandMap<View>({
        {CommandId::InsertLine, 0, &View::OnGridInsertLine},
        {CommandId::DeleteLine, 0, &View::OnGridDeleteLine},
        {CommandId::Search, 0, &View::OnGridSearch},
        {CommandId::FindNext, 0, &View::OnGridFindNext},
        {CommandId::GotoLine, 0, &View::OnGridGotoLine},
        {CommandId::InsertProbe, 0, &View::OnGridInsertProbe},
        {ID_FILE_PRINT, 0, &View::OnFilePrint},
        {ID_FILE_PRINT_DIRECT, 0, &View::OnFilePrint},
        {ID_FILE_PRINT_PREVIEW, 0, &View::OnFilePrintPreview},
    });
    return kota::runCommand(*this, commands, id, notification) || CFormView::OnCmdMsg(id, notification);
}

void CKota0_adView::OnGridSearch() {
    if (!ActivePage())
        return;
    const int tab = sheet->GetActiveIndex();
    if (tab == 0 || tab == 9)
        return;
    // By the tabs' places: the pages that these were once meant for stand elsewhere now.
    const int noComponent = tab == 1 || tab == 4 || tab == 8;
    CSearchDlg dialog(searchComponent, searchText, searchChainage, searchChainageTest, searchTextTest,
                      noComponent, this);
    if (dialog.DoModal() != IDOK || !GetSafeHwnd())
        return;
    searchNoComponent = noComponent;
    searchComponent = dialog.component;
    searchText = dialog.searchText;
    searchChainage = dialog.chainageDisplay;
    searchTextTest = dialog.textTest;
    searchChainageTest = dialog.chainageTest;
    searchRow = 0;
    Search();
}

void CKota0_adView::OnGridFindNext() {
    if (!ActivePage())
        return;
    if (searchRow == 0)
        MessageBox(kota0AdModule().string(StringId::LastAlreadyFound));
    else
        Search();
}

void CKota0_adView::Search() {
    ActivePage()->SearchLine(searchNoComponent, searchRow, static_cast<unsigned>(searchComponent), searchText,
                             searchChainage, searchChainageTest, searchTextTest);
    if (searchRow == 0 && GetSafeHwnd())
        MessageBox(kota0AdModule().string(StringId::NotFound));
}

void CKota0_adView::OnGridGotoLine() {
    CGotoDlg dialog(this);
    if (dialog.DoModal() == IDOK && GetSafeHwnd() && ActivePage())
        ActivePage()->GotoLine(static_cast<unsigned>(dialog.lineNumber));
}
