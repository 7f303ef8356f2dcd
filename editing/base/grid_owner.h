#pragma once

#include "platform/framework/text.h"
#include "platform/grid/range.h"

// What a grid tells the view around it.
class GridOwner {
public:
    // The names of the project's rivers, joined by line feeds; empty without a project.
    virtual void GetRiverChoiceList(CString& out) = 0;
    // Another line of the grid has become current.
    virtual void OnGridRowChanged(ROWCOL row) = 0;
    // An edited cell was left; `column` is that of the cell now entered.
    virtual void OnGridCellEdited(ROWCOL column) = 0;
    virtual void OnGridInsertLine() = 0;
    virtual void OnGridDeleteLine() = 0;
    virtual void OnGridSearch() = 0;
    virtual void OnGridFindNext() = 0;

protected:
    ~GridOwner() = default;
};
