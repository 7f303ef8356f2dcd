#include "pages/decay_grid.h"

#include "editing/base/gen_property_page.h"
#include "editing/base/location_search.h"
#include "platform/framework/number_text.h"
#include "resources/module.h"

#include <utility>

IMPLEMENT_DYNAMIC(CDecayGrid, CGenGrid, kota0AdModule)

CDecayGrid::CDecayGrid() = default;
CDecayGrid::~CDecayGrid() = default;

void CDecayGrid::OnClickedButtonRowCol(ROWCOL row, ROWCOL col) {
    if (CGenPropertyPage* const page = OwnerPage()) {
        page->SetActiveGrid(this);
        if (col == globalColumn)
            page->OnRowColumnChanged(row, col);
    }
    CGenGrid::OnClickedButtonRowCol(row, col);
}

void CDecayGrid::SearchNext(int /*noComponent*/, ROWCOL& row, unsigned component, CString text,
                            double chainage, int chainageTest, int textTest) {
    const LocationSearch location{std::move(text), chainage, chainageTest, textTest};
    FindLine(row, [&](ROWCOL line) {
        const auto lineComponent = static_cast<unsigned>(kota::textToInt(CellText(line, 1)));
        if (component != anyComponent && component != lineComponent)
            return false;
        return kota::textToInt(CellText(line, globalColumn)) != 0 ||
               (location.FitsName(CellText(line, globalColumn + 1)) &&
                location.FitsChainage(kota::textToDouble(CellText(line, globalColumn + 2))));
    });
}
