#include "exchange/operations.h"
#include "plugin/Kota0_ad.h"
#include "resources/ids.h"
#include "resources/module.h"

#include <memory>

int KhGetNumDocTemplates() {
    return 1;
}

CMultiDocTemplate* KhGetDocTemplatePtr(int index) {
    return index == 0 ? CKota0_ad::CreateMainDlg() : nullptr;
}

int KhGetNumToolbars() {
    return 1;
}

CKhToolBarEx* KhCreateToolbar(CKhMDIFrameWnd* frame, unsigned style, unsigned id, int index) {
    if (index != 0)
        return nullptr;
    auto toolBar = std::make_unique<CKhToolBarEx>();
    return CKota0_ad::InitToolBar(toolBar.get(), frame, style, id) ? toolBar.release() : nullptr;
}

int KhInitToolbar(CKhToolBarEx* toolBar, CKhMDIFrameWnd* frame, unsigned style, unsigned id, unsigned index) {
    return index == 0 ? CKota0_ad::InitToolBar(toolBar, frame, style, id) : 0;
}

unsigned KhGetBitmapId() {
    return MenuId::EditorBitmap;
}

int KhGetEditorString(CString* out) {
    if (!out)
        return 0;
    *out = kota0AdModule().string(StringId::EditorName);
    return 1;
}

int KhGetToolbarString(CString* out, int index) {
    if (!out || index != 0)
        return 0;
    *out = kota0AdModule().string(StringId::ToolbarName);
    return 1;
}

CObList* K31MSGGetData(CString path, CKota0_adView* view) {
    return exchange::GetData(std::move(path), view);
}
void K31MSGInsertData(CString path, CKota0_adView* view, CObList* items) {
    exchange::InsertData(std::move(path), view, items);
}
void K31MSGDeleteData(CString path, CKota0_adView* view, CObList* items) {
    exchange::DeleteData(std::move(path), view, items);
}
void K31MSGSelectData(CString path, CKota0_adView* view, CObList* items) {
    exchange::SelectData(std::move(path), view, items);
}
