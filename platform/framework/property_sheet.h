#pragma once

#include "platform/framework/dialog.h"

#include <vector>

class CPropertySheet;

// One page of a property sheet. Its window is made when the sheet first shows it.
class KOTA_API CPropertyPage : public CDialog {
    DECLARE_DYNAMIC(CPropertyPage)
public:
    CPropertyPage();
    explicit CPropertyPage(UINT templateId);
    ~CPropertyPage() override;

    // The caption of the page's template, which its tab bears.
    CString GetCaption() const;
    // The page has come to the front. The base gives 1.
    virtual BOOL OnSetActive();
    // The page is to leave the front; 0 refuses. The base reads the controls and gives 1 if that went well.
    virtual BOOL OnKillActive();

private:
    friend class CPropertySheet;
};

// The number of a sheet's tab control.
inline constexpr UINT AFX_IDC_TAB_CONTROL = 0x3020;

// A window of pages of which one is in front, chosen by tabs. Pages are not owned.
class KOTA_API CPropertySheet : public CWnd {
    DECLARE_DYNAMIC(CPropertySheet)
public:
    CPropertySheet();
    explicit CPropertySheet(const CString& caption);
    ~CPropertySheet() override;

    void AddPage(CPropertyPage* page); // at the end; before Create
    // Makes the sheet's window inside `parent`, with its first page.
    BOOL Create(CWnd* parent, unsigned style, unsigned extendedStyle);
    // Called once the tab control is there, before the first page is made.
    virtual BOOL OnInitDialog();

    int GetPageCount() const { return static_cast<int>(pages_.size()); }
    // Null for an index that no page has.
    CPropertyPage* GetPage(int index) const;
    // -1 when the page is not in the sheet.
    int GetPageIndex(const CPropertyPage* page) const;
    CPropertyPage* GetActivePage() const;
    int GetActiveIndex() const { return active_; }
    CWnd* GetTabControl() const { return GetDlgItem(AFX_IDC_TAB_CONTROL); }
    // Brings a page to the front. 0, and nothing changed, when the page is not in the sheet, when an edit on
    // the page in front or that page itself refuses, and while another change is under way.
    BOOL SetActivePage(int index);
    BOOL SetActivePage(CPropertyPage* page);
    // Ctrl with Page Up or Page Down goes to the page beside, round the ends.
    BOOL PreTranslateMessage(MSG* message) override;

private:
    bool LeaveActivePage();
    void ShowPage(int index);

    CString caption_;
    std::vector<CPropertyPage*> pages_;
    int active_ = -1;
    bool changing_ = false;
};
