#include "plugin/Kota0_ad.h"

#include "editing/create_template.h"
#include "exchange/operations.h"
#include "resources/module.h"

IMPLEMENT_DYNAMIC(CKota0_ad, CWnd, kota0AdModule)

CKota0_ad::CKota0_ad() = default;
CKota0_ad::~CKota0_ad() = default;

CMultiDocTemplate* CKota0_ad::CreateMainDlg() {
    return createTemplate();
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

int KhGetNumDocTemplates() {
    return 1;
}

CMultiDocTemplate* KhGetDocTemplatePtr(int index) {
    return index == 0 ? CKota0_ad::CreateMainDlg() : nullptr;
}
