#include "plugin/Kota0_ad.h"

#include "editing/create_template.h"
#include "exchange/operations.h"
#include "plugin/entry_point.h"
#include "resources/ids.h"
#include "resources/module.h"

IMPLEMENT_DYNAMIC(CKota0_ad, CWnd, kota0AdModule)

CKota0_ad::CKota0_ad() = default;
CKota0_ad::~CKota0_ad() = default;

CMultiDocTemplate* CKota0_ad::CreateMainDlg() {
    return orZero(createTemplate);
}

namespace {

int setUp(CKhToolBarEx* toolBar, CKhMDIFrameWnd* frame, UINT style, UINT id) {
    if (!toolBar || !frame || !toolBar->Create(frame, style, id) ||
        !toolBar->LoadToolBar(kota0AdModule(), MenuId::Document))
        return 0;
    toolBar->SetBarStyle(toolBar->GetBarStyle() | CBRS_TOOLTIPS | CBRS_FLYBY | CBRS_SIZE_DYNAMIC);
    toolBar->EnableDocking(CBRS_ALIGN_ANY);
    frame->EnableDocking(CBRS_ALIGN_ANY, 0);
    frame->DockControlBar(toolBar, 0, nullptr);
    return 1;
}

} // namespace

int CKota0_ad::InitToolBar(CKhToolBarEx* toolBar, CKhMDIFrameWnd* frame, unsigned long style, unsigned id) {
    return orZero([&] { return setUp(toolBar, frame, static_cast<UINT>(style), id); });
}

CObList* CKota0_ad::GetData(CString path, CKota0_adView* view) {
    return orZero([&] { return exchange::GetData(std::move(path), view); });
}
void CKota0_ad::InsertData(CString path, CKota0_adView* view, CObList* items) {
    orZero([&] { exchange::InsertData(std::move(path), view, items); });
}
void CKota0_ad::DeleteData(CString path, CKota0_adView* view, CObList* items) {
    orZero([&] { exchange::DeleteData(std::move(path), view, items); });
}
void CKota0_ad::SelectData(CString path, CKota0_adView* view, CObList* items) {
    orZero([&] { exchange::SelectData(std::move(path), view, items); });
}
void CKota0_ad::ChangeData(CString /*path*/, CKota0_adView* /*view*/, CObList* /*items*/) {}
