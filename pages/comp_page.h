#pragma once

#include "editing/base/grid_page.h"

// The tab "Components": the substances that the model carries. All other pages refer to them by number, which
// is their line here.
class CCompPage : public CGridPage {
    DECLARE_DYNAMIC(CCompPage)
public:
    explicit CCompPage(CKota0_adDoc* owner);
    ~CCompPage() override;

    BOOL OnKillActive() override;
    void InsertLocatedLine(CString riverName, CString chainage) override;
    void SearchLine(int noComponent, unsigned& line, unsigned component, CString text, double chainage,
                    int chainageTest, int textTest) override;
    void FillFromDocument(CKota0_adDoc* source) override;
    // A lone line without a name is no component: the list stays empty.
    void StoreToDocument() override;

private:
    CGenGrid grid_;
};
