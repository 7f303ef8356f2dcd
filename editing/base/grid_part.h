#pragma once

#include "editing/base/column.h"
#include "editing/base/gen_grid.h"
#include "editing/base/unit_styles.h"

#include <span>

class CKota0_adDoc;

// One grid of a page, as its table tells it, without the records.
class GridPart {
public:
    // All must outlive the part.
    GridPart(const GridFace& face, CGenGrid& grid, UnitStyles& styles);
    virtual ~GridPart();
    GridPart(const GridPart&) = delete;
    GridPart& operator=(const GridPart&) = delete;

    CGenGrid& Grid() const { return grid_; }
    const GridFace& Face() const { return face_; }

    // Takes the dialog's control over and builds columns and headings, undo off.
    void SetUp(CGenPropertyPage& page);
    void SetComponentChoices(const CString& choices);
    // Has the column of the river names offer the project's rivers.
    void SetRiverColumn();
    // Whether the document has records for the grid.
    virtual bool HasRecords(const CKota0_adDoc& document) const = 0;
    // A line for each record, with its values.
    virtual void FillLines(const CKota0_adDoc& document) = 0;
    // Builds the document's list anew from the lines.
    virtual void StoreLines(CKota0_adDoc& document) const = 0;
    // Adds a line with the table's values for it.
    void AddDefaultLine(const AD_Global_Var& globals);
    void AddLocatedLine(const AD_Global_Var& globals, const CString& riverName, const CString& chainage);
    // Gives blank cells the value that the table has for them.
    void FillBlanks(const AD_Global_Var& globals);
    // After a click on the "Global" box of a line: the place goes and is locked, or may be given.
    void ApplyGlobalBox(ROWCOL row, ROWCOL col);
    // The place of a line as its cells give it; a blank chainage is read as 0.
    CString RiverNameOf(ROWCOL row) const;
    double ChainageOf(ROWCOL row) const;

protected:
    virtual std::size_t ColumnCount() const = 0;
    virtual const ColumnFace& ColumnAt(std::size_t index) const = 0;
    UnitStyles& Styles() const { return styles_; }
    // Locks the cells of a line's place and blanks them, or opens them.
    void LockPlace(ROWCOL row);
    void OpenPlace(ROWCOL row);

private:
    // Adds a line and gives its number; 0 when others changed the lines meanwhile.
    ROWCOL AddLine();
    void SetUpColumn(const ColumnFace& column);
    void SetDefault(ROWCOL row, const ColumnFace& column, const CellDefault& value,
                    const AD_Global_Var& globals);
    const ColumnFace* ColumnOf(Place place) const;

    const GridFace& face_;
    CGenGrid& grid_;
    UnitStyles& styles_;
};
