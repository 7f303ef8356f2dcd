#pragma once

#include "editing/base/grid_page.h"
#include "pages/decay_grid.h"

// The tab "Decay": first-order decay constants, each for a component, everywhere or at a place.
class CDecayPage : public CGridPage {
    DECLARE_DYNAMIC(CDecayPage)
public:
    explicit CDecayPage(CKota0_adDoc* owner);
    ~CDecayPage() override;

    // Of global lines alone, whose river name is blank.
    AD_Comp_RiverPos* RecordFromRow(ROWCOL row) override;

protected:
    int RepairBlanks() override { return ClearBlankDecayConstants(); }

private:
    // A blank decay constant becomes 0. Always 1.
    int ClearBlankDecayConstants();

    CDecayGrid grid_;
};
