#include "plugin/Kota0_ad.h"

#include "editing/create_template.h"
#include "exchange/operations.h"
#include "resources/ids.h"
#include "resources/module.h"

IMPLEMENT_DYNAMIC(CKota0_ad, CWnd, kota0AdModule)

CKota0_ad::CKota0_ad() = default;
CKota0_ad::~CKota0_ad() = default;

CMultiDocTemplate* CKota0_ad::CreateMainDlg() {
    return createTemplate();
}

int CKota0_ad::InitToolBar(CKhToolBarEx* toolBar, CKhMDIFrameWnd* frame, unsigned long style, unsigned id) {
    if (!toolBar || !frame || !toolBar->Create(frame, static_cast<UINT>(style), id) ||
        !toolBar->LoadToolBar(kota0AdModule(), MenuId::Document))
        return 0;
    toolBar->SetBarStyle(toolBar->GetBarStyle() | CBRS_TOOLTIPS | CBRS_FLYBY | CBRS_SIZE_DYNAMIC);
    toolBar->EnableDocking(CBRS_ALIGN_ANY);
    frame->EnableDocking(CBRS_ALIGN_ANY, 0);
    frame->DockControlBar(toolBar, 0, nullptr);
    return 1;
}

CObList* CKota0_ad::GetData(CString path, CKota0_adView* view) {
    return exchange::GetData(std::move(path), view);
}
void CKota0_ad::InsertData(CString path, CKota0_adView* view, CObList* items) {
    exchange::InsertData(std::move(path), view, items);
}
void CKota0_ad::DeleteData(CString path, CKota0_adView* view, CObList* items) {
    exchange::DeleteData(std::move(path), view, items);
}
void CKota0_ad::SelectData(CString path, CKota0_adView* view, CObList* items) {
    exchange::SelectData(std::move(path), view, items);
}
void CKota0_ad::ChangeData(CString /*path*/, CKota0_adView* /*view*/, CObList* /*items*/) {}
