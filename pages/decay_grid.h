#pragma once

#include "editing/base/gen_grid.h"

// A grid whose lines hold for a component, everywhere or at a place: the component in column 1, the "Global"
// box, and behind it river name and chainage.
class CDecayGrid : public CGenGrid {
    DECLARE_DYNAMIC(CDecayGrid)
public:
    CDecayGrid();
    ~CDecayGrid() override;

    ROWCOL GetGlobalColumn() const { return globalColumn; }
    void SetGlobalColumn(ROWCOL column) { globalColumn = column; }

    void OnClickedButtonRowCol(ROWCOL row, ROWCOL col) override;
    // A line of another component never fits; a global line of the component always does.
    void SearchNext(int noComponent, ROWCOL& row, unsigned component, CString text, double chainage,
                    int chainageTest, int textTest) override;

private:
    ROWCOL globalColumn = 3;
};
