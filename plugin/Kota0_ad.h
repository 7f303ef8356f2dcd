#pragma once

#include "document/export.h"
#include "platform/foundation/frames.h"
#include "platform/framework/list.h"
#include "platform/framework/template.h"
#include "platform/framework/window.h"

class CKota0_adView;

// The plug-in's exports. All are called on the thread of the user interface. None throws: null or 0 is the
// result when an allocation failed. Arguments that are a CString by value serve callers built on the same SDK
// (kota::abiVersion).

// What the plug-in does for sibling editors, as static operations; no instance of the class does any work.
class KOTA0_AD_API CKota0_ad : public CWnd {
    DECLARE_DYNAMIC(CKota0_ad)
public:
    CKota0_ad();
    ~CKota0_ad() override;

    // A new template of parameter documents, which the caller owns; see CDocTemplate.
    static CMultiDocTemplate* CreateMainDlg();

    // Makes the window of a tool bar at the shell's frame, with the editor's buttons, and docks it. 1 done; 0
    // when the window cannot be made, or a pointer is null: the tool bar stays the caller's as it is.
    static int InitToolBar(CKhToolBarEx* toolBar, CKhMDIFrameWnd* frame, unsigned long style, unsigned id);

    // The four data operations, on the document of `view`, or of the file at `path` where that is null. Of a
    // list of items the first one counts, and list and items stay the caller's. None of the four is available
    // yet: they do nothing, and GetData gives null.
    //
    // A new list of new items, one for each record with a place, which the caller owns; or null.
    static CObList* GetData(CString path, CKota0_adView* view);
    static void InsertData(CString path, CKota0_adView* view, CObList* items);
    static void DeleteData(CString path, CKota0_adView* view, CObList* items);
    static void SelectData(CString path, CKota0_adView* view, CObList* items);
    // Has no effect.
    static void ChangeData(CString path, CKota0_adView* view, CObList* items);
};

extern "C" {

// What the shell asks for, in this order. A shell finds these by their names; kota::PlugIn does.

// Always 1.
KOTA0_AD_API int KhGetNumDocTemplates();
// A new template, which the caller owns; null for any other index than 0.
KOTA0_AD_API CMultiDocTemplate* KhGetDocTemplatePtr(int index);
// Always 1.
KOTA0_AD_API int KhGetNumToolbars();
// A new tool bar at the shell's frame, which the caller owns; null for any other index than 0, and when it
// cannot be made. See CKota0_ad::InitToolBar.
KOTA0_AD_API CKhToolBarEx* KhCreateToolbar(CKhMDIFrameWnd* frame, unsigned style, unsigned id, int index);
// The same with a tool bar of the caller's. 1 done; 0 for an index above 0 and when it failed.
KOTA0_AD_API int KhInitToolbar(CKhToolBarEx* toolBar, CKhMDIFrameWnd* frame, unsigned style, unsigned id,
                               unsigned index);
// The number of the editor's bitmap, always 4793.
KOTA0_AD_API unsigned KhGetBitmapId();
// Gives the editor's name in the user's language. 0 for null.
KOTA0_AD_API int KhGetEditorString(CString* out);
// Gives the tool bar's name. 0, and `out` stays as it was, for any other index than 0.
KOTA0_AD_API int KhGetToolbarString(CString* out, int index);

// The data operations for a module that has only a path. Not available yet, as those of CKota0_ad.
KOTA0_AD_API CObList* K31MSGGetData(CString path, CKota0_adView* view);
KOTA0_AD_API void K31MSGInsertData(CString path, CKota0_adView* view, CObList* items);
KOTA0_AD_API void K31MSGDeleteData(CString path, CKota0_adView* view, CObList* items);
KOTA0_AD_API void K31MSGSelectData(CString path, CKota0_adView* view, CObList* items);
}
