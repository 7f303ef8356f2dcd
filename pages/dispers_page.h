#pragma once

#include "editing/base/ctrl_edit.h"
#include "editing/base/grid_page.h"

// The tab "Dispersion": the global values in edits, and below them lines for places.
class CDispersPage : public CGridPage {
    DECLARE_DYNAMIC(CDispersPage)
public:
    explicit CDispersPage(CKota0_adDoc* owner);
    ~CDispersPage() override;

    void DoDataExchange(CDataExchange* exchange) override;
    void FillFromDocument(CKota0_adDoc* source) override;
    // With the place alone; a blank chainage comes as 0.
    AD_Comp_RiverPos* RecordFromRow(ROWCOL row) override;

protected:
    int RepairBlanks() override { return ApplyGlobalsToBlankCells(); }
    // Not while the global minimum is above the maximum.
    bool MayBeLeft() override;

private:
    // A blank value becomes the global one, as a plain number. Always 1.
    int ApplyGlobalsToBlankCells();

    CCtrlEdit dispFactorEdit;
    CCtrlEdit exponentEdit;
    CCtrlEdit minCoefEdit;
    CCtrlEdit maxCoefEdit;
    CGenGrid grid_;
};
