#pragma once

#include "document/export.h"
#include "platform/framework/list.h"
#include "platform/framework/template.h"
#include "platform/framework/window.h"

class CKota0_adView;

// What the plug-in does for sibling editors, as static operations; no instance of the class does any work.
// Without a view, `path` is opened. Of a list of items the first one counts, and the list stays the caller's.
class KOTA0_AD_API CKota0_ad : public CWnd {
    DECLARE_DYNAMIC(CKota0_ad)
public:
    CKota0_ad();
    ~CKota0_ad() override;

    // A new template of parameter documents, which the caller owns; see CDocTemplate.
    static CMultiDocTemplate* CreateMainDlg();

    // The four data operations; see exchange/operations.h.
    static CObList* GetData(CString path, CKota0_adView* view);
    static void InsertData(CString path, CKota0_adView* view, CObList* items);
    static void DeleteData(CString path, CKota0_adView* view, CObList* items);
    static void SelectData(CString path, CKota0_adView* view, CObList* items);
    // Has no effect.
    static void ChangeData(CString path, CKota0_adView* view, CObList* items);
};

// What the shell asks for, in this order. Not part of the C++ interface: a shell finds them by their names.
extern "C" {

// Always 1.
KOTA0_AD_API int KhGetNumDocTemplates();
// A new template, which the caller owns; null for any other index than 0.
KOTA0_AD_API CMultiDocTemplate* KhGetDocTemplatePtr(int index);
}
