#pragma once

#include "editing/base/gen_property_page.h"
#include "editing/base/grid_part.h"

#include <memory>
#include <vector>

// A page whose grids are told by their tables. A line is a record; an empty list shows a default line; a
// store empties the list and adds the lines at its tail. What a page does beyond that stands in its own file.
class CGridPage : public CGenPropertyPage {
    DECLARE_DYNAMIC(CGridPage)
public:
    ~CGridPage() override;

    BOOL OnInitDialog() override;
    // Gives blank cells their values, stores, and refuses if MayBeLeft does.
    BOOL OnKillActive() override;
    // As of the base's operations, for the grid that has the current cell.
    void InsertLocatedLine(CString riverName, CString chainage) override;
    void InsertDefaultLine() override;
    void DeleteCurrentLine() override;
    void GotoLine(unsigned line) override;
    void SearchLine(int noComponent, unsigned& line, unsigned component, CString text, double chainage,
                    int chainageTest, int textTest) override;
    void FillFromDocument(CKota0_adDoc* source) override;
    void StoreToDocument() override;
    void SetRiverColumns() override;
    // The "Global" box of a line.
    void OnRowColumnChanged(ROWCOL row, ROWCOL col) override;

protected:
    CGridPage(CKota0_adDoc* owner, UINT dialogId);
    // Called by the constructors, in the order of the grids on the page.
    void AddPart(std::unique_ptr<GridPart> part);
    // Gives blank cells the values that the tables have for them. 0: the page stays.
    virtual int RepairBlanks();
    // Whether the page's rules let it be left, asked after the lines were stored. One that refuses tells why.
    virtual bool MayBeLeft();
    // The part of the active grid: the first one, where the page has one alone; null for none of them.
    GridPart* ActivePart();
    GridPart& Part(std::size_t index) const { return *parts_[index]; }

    UnitStyles unitStyles;

private:
    std::vector<std::unique_ptr<GridPart>> parts_;
};
