#pragma once

#include "platform/foundation/edit_style.h"
#include "platform/framework/dialog.h"

// Asks for the number of a line, from 1.
class CGotoDlg : public CDialog {
    DECLARE_DYNAMIC(CGotoDlg)
public:
    explicit CGotoDlg(CWnd* parent);
    ~CGotoDlg() override;

    void DoDataExchange(CDataExchange* exchange) override;
    void OnOK() override;

    int lineNumber = 0;
};

// Asks what to search for.
class CSearchDlg : public CDialog {
    DECLARE_DYNAMIC(CSearchDlg)
public:
    // Which of the terms may be given.
    enum Mode { AllTerms = 0, NoComponent = 1, ComponentOnly = 2 };

    CSearchDlg(int componentNumber, CString text, double displayedChainage, int testOfChainage,
               int testOfText, int terms, CWnd* parent);
    ~CSearchDlg() override;

    BOOL OnInitDialog() override;
    void DoDataExchange(CDataExchange* exchange) override;
    void OnOK() override;

    CString searchText;
    int chainageTest;
    int textTest;
    CString componentText; // what the component's box says; it goes no further
    double chainage;       // m
    double chainageDisplay;
    int component;
    int mode;

private:
    CKhEditStyle style_;
};
