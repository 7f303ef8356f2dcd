#pragma once

#include "document/kota0_ad_doc.h"
#include "document/records/comp_river_pos.h"
#include "platform/framework/property_sheet.h"
#include "platform/grid/range.h"

#include <memory>

class CGenGrid;

// The base of every tab. A page knows its document, and its grids are a working copy of the document's lists:
// FillFromDocument builds them, StoreToDocument writes them back. Its window and grids exist once it was
// shown; until then the document is the only truth, and no operation that needs a grid may be called.
class CGenPropertyPage : public CPropertyPage {
    DECLARE_DYNCREATE(CGenPropertyPage)
public:
    CGenPropertyPage();
    CGenPropertyPage(CKota0_adDoc* owner, UINT dialogId);
    ~CGenPropertyPage() override;

    // Whether the page's window and grids exist: not before it was shown, and not when it was closed.
    bool IsInitialised() const { return pageInitialised != 0 && GetSafeHwnd(); }

    BOOL OnInitDialog() override;
    // Prepares the menu, shows the document's present state and comes to the front.
    BOOL OnSetActive() override;
    BOOL OnCmdMsg(UINT id, int notification) override;

    // Adds a grid line for a place of a river; `chainage` is in the display unit.
    virtual void InsertLocatedLine(CString riverName, CString chainage);
    // Adds a grid line with default values, without a place.
    virtual void InsertDefaultLine();
    // Deletes the selected lines; at least one line is left.
    virtual void DeleteCurrentLine();
    virtual void GotoLine(unsigned line);
    // Looks for the next line that fits, from `line` on; see CGenGrid::SearchNext.
    virtual void SearchLine(int noComponent, unsigned& line, unsigned component, CString text,
                            double chainage, int chainageTest, int textTest);
    virtual void FillFromDocument(CKota0_adDoc* source);
    virtual void StoreToDocument();
    // The cell that decides on others of its line has changed.
    virtual void OnRowColumnChanged(ROWCOL row, ROWCOL col);
    // The record of a grid line as far as its place goes, for the caller to delete; null when there is none.
    virtual AD_Comp_RiverPos* RecordFromRow(ROWCOL row);
    // Appends the names of the components that pass the filter, each with a line feed.
    virtual void ComponentChoices(CString& out, int kindFilter);
    // The kind of the n-th component, from 1; 0 for 0 and beyond the list.
    virtual int ComponentKindAt(int n);
    // The place in the whole list, from 1, of the n-th component that passes the filter; 0 when there is
    // none.
    virtual int ComponentIndexOf(int n, int kindFilter);
    virtual void SetActiveGrid(CGenGrid* grid);
    virtual CGenGrid* GetActiveGrid();
    // Tells the grids which of their columns takes the project's river names.
    virtual void SetRiverColumns();

protected:
    // Enables the main menu's third entry, that of the grids.
    virtual void PrepareGridMenu();
    CKota0_adDoc* Document() const { return document; }
    // "Undefined" and the names of the components that pass the filter: the entries of a component column.
    CString ComponentColumnChoices(int kindFilter);

private:
    void OnHelpPage();

    CKota0_adDoc* document = nullptr; // not owned
    int pageInitialised = 0;
    CGenGrid* activeGrid = nullptr; // the grid that last took the current cell
};
