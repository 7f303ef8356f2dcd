#pragma once

#include "platform/framework/property_sheet.h"

class CKota0_adView;

// Given for the placeholder, the sheet stays where it was made.
inline constexpr UINT noPlaceholder = ~0U;

// The tabs of a view: a sheet that lives inside it.
class CDlgPropertySheet : public CPropertySheet {
    DECLARE_DYNAMIC(CDlgPropertySheet)
public:
    explicit CDlgPropertySheet(const CString& caption);
    ~CDlgPropertySheet() override;

    // Makes the sheet inside the view, in the place of one of its controls, which goes.
    void EmbedInView(CWnd* view, UINT placeholderId);

    BOOL OnInitDialog() override;
    // Ctrl+F4 goes on to the view.
    BOOL PreTranslateMessage(MSG* message) override;
    // Help is that of the page in front.
    LRESULT WindowProc(UINT message, WPARAM wParam, LPARAM lParam) override;

    CWnd* ownerView = nullptr; // not owned
};
