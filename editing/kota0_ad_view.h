#pragma once

#include "document/export.h"
#include "document/kota0_ad_doc.h"
#include "editing/base/grid_owner.h"
#include "platform/framework/view.h"

#include <memory>

class CAddOutput;
class CBoundPage;
class CCompPage;
class CDecayPage;
class CDispersPage;
class CDlgPropertySheet;
class CGenPropertyPage;
class CGlobalPage;
class CInitPage;
class CK31_CBE_ModelDataItem;
class CK32AddOutPage;
class CK32BoundPage;
class CK32DispersPage;
class CKHComm_Package;
class CLayerPage;
class CNonCohesPage;

// The one window of a document: the sheet of tabs with all pages, the commands of the Grid menu, and the
// window through which the shell and sibling editors reach the document. It has no pages before
// OnInitialUpdate. Its frame deletes it: it is reached through its window's handle wherever a message may
// have closed it.
class KOTA0_AD_API CKota0_adView : public CFormView, public GridOwner {
    DECLARE_DYNCREATE(CKota0_adView)
public:
    CKota0_adView();
    // Leaves the project, and tells the shell that no location is current any more.
    ~CKota0_adView() override;

    // Null when it is gone.
    CKota0_adDoc* GetDocument() const;
    // The tabs; null before OnInitialUpdate.
    CDlgPropertySheet* Sheet() const { return sheet.get(); }
    // The page in front; null before OnInitialUpdate.
    CGenPropertyPage* ActivePage() const;

    void OnInitialUpdate() override;
    void OnActivateView(BOOL activate, CView* activateView, CView* deactiveView) override;
    void OnUpdate(CView* sender, LPARAM hint, CObject* hintObject) override;
    BOOL OnPreparePrinting(CPrintInfo* info) override;
    BOOL OnCmdMsg(UINT id, int notification) override;
    LRESULT WindowProc(UINT message, WPARAM wParam, LPARAM lParam) override;

    // Asks the shell the first time; later changes of the project's rivers are not seen.
    void GetRiverChoiceList(CString& out) override;
    // Tells the shell the place of a line of the page in front, if the page has places and the line has one.
    void OnGridRowChanged(ROWCOL row) override;
    void OnGridCellEdited(ROWCOL column) override;
    // Adds a line to the page in front, at the place that the shell offers or else a default one.
    void OnGridInsertLine() override;
    void OnGridDeleteLine() override;
    void OnGridSearch() override;
    void OnGridFindNext() override;
    // Asks for the number of a line and goes there.
    void OnGridGotoLine();
    // Tells the grids which column takes river names. A grid takes it up when its tab is first shown.
    void SetRiverColumns();

private:
    void MakePages();
    void OnGridInsertProbe();
    void Search();
    void InsertOffered(const CK31_CBE_ModelDataItem& offered);
    void StoreAndTell();
    // Tells the shell and the other views that the page in front has stored a change.
    void TellChange();
    void OnSiblingsCode(WPARAM code, const CKHComm_Package* package);

    std::unique_ptr<CCompPage> compPage;
    std::unique_ptr<CDispersPage> dispersPage;
    std::unique_ptr<CK32DispersPage> k32DispersPage;
    std::unique_ptr<CInitPage> initPage;
    std::unique_ptr<CDecayPage> decayPage;
    std::unique_ptr<CBoundPage> boundPage;
    std::unique_ptr<CK32BoundPage> k32BoundPage;
    std::unique_ptr<CGlobalPage> globalPage;
    std::unique_ptr<CLayerPage> layerPage;
    std::unique_ptr<CNonCohesPage> nonCohesPage;
    std::unique_ptr<CAddOutput> addOutput;
    std::unique_ptr<CK32AddOutPage> k32AddOutPage;

    int searchNoComponent = 0;
    int searchComponent = 1;
    CString searchText;
    double searchChainage = 0.0; // in the display unit
    int searchTextTest = 1;
    int searchChainageTest = 1;
    unsigned searchRow = 0;

    std::unique_ptr<CDlgPropertySheet> sheet;
    CString riverChoiceList; // joined by line feeds; empty until it is first needed
};
