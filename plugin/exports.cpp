#include "plugin/Kota0_ad.h"
#include "plugin/entry_point.h"
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
    return orZero([&]() -> CKhToolBarEx* {
        auto toolBar = std::make_unique<CKhToolBarEx>();
        return CKota0_ad::InitToolBar(toolBar.get(), frame, style, id) ? toolBar.release() : nullptr;
    });
}

int KhInitToolbar(CKhToolBarEx* toolBar, CKhMDIFrameWnd* frame, unsigned style, unsigned id, unsigned index) {
    return index == 0 ? CKota0_ad::InitToolBar(toolBar, frame, style, id) : 0;
}

unsigned KhGetBitmapId() {
    return MenuId::EditorBitmap;
}

namespace {

int load(UINT id, CString& out) {
    return orZero([&] {
        out = kota0AdModule().string(id);
        return 1;
    });
}

} // namespace

int KhGetEditorString(CString* out) {
    return out ? load(StringId::EditorName, *out) : 0;
}

int KhGetToolbarString(CString* out, int index) {
    return out && index == 0 ? load(StringId::ToolbarName, *out) : 0;
}

CObList* K31MSGGetData(CString path, CKota0_adView* view) {
    return CKota0_ad::GetData(std::move(path), view);
}
void K31MSGInsertData(CString path, CKota0_adView* view, CObList* items) {
    CKota0_ad::InsertData(std::move(path), view, items);
}
void K31MSGDeleteData(CString path, CKota0_adView* view, CObList* items) {
    CKota0_ad::DeleteData(std::move(path), view, items);
}
void K31MSGSelectData(CString path, CKota0_adView* view, CObList* items) {
    CKota0_ad::SelectData(std::move(path), view, items);
}
