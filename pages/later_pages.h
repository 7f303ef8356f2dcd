#pragma once

#include "editing/base/gen_grid.h"
#include "editing/base/gen_property_page.h"
#include "pages/decay_grid.h"

// The pages that are not available yet: each has its caption, its help and its grids, and shows a line of
// text.

class CK32DispersPage : public CGenPropertyPage {
    DECLARE_DYNAMIC(CK32DispersPage)
public:
    explicit CK32DispersPage(CKota0_adDoc* owner);
    ~CK32DispersPage() override;
    CGenGrid& Grid() { return grid_; }

private:
    CGenGrid grid_;
};

class CInitPage : public CGenPropertyPage {
    DECLARE_DYNAMIC(CInitPage)
public:
    explicit CInitPage(CKota0_adDoc* owner);
    ~CInitPage() override;
    CDecayGrid& UpperGrid() { return upperGrid_; }
    CDecayGrid& LowerGrid() { return lowerGrid_; }

private:
    CDecayGrid upperGrid_;
    CDecayGrid lowerGrid_;
};

class CBoundPage : public CGenPropertyPage {
    DECLARE_DYNAMIC(CBoundPage)
public:
    explicit CBoundPage(CKota0_adDoc* owner);
    ~CBoundPage() override;
};

class CK32BoundPage : public CGenPropertyPage {
    DECLARE_DYNAMIC(CK32BoundPage)
public:
    explicit CK32BoundPage(CKota0_adDoc* owner);
    ~CK32BoundPage() override;
};

class CGlobalPage : public CGenPropertyPage {
    DECLARE_DYNAMIC(CGlobalPage)
public:
    explicit CGlobalPage(CKota0_adDoc* owner);
    ~CGlobalPage() override;
    CGenGrid& Grid() { return grid_; }

private:
    CGenGrid grid_;
};

class CLayerPage : public CGenPropertyPage {
    DECLARE_DYNAMIC(CLayerPage)
public:
    explicit CLayerPage(CKota0_adDoc* owner);
    ~CLayerPage() override;
    CGenGrid& LocationGrid() { return locationGrid_; }

private:
    CGenGrid locationGrid_;
};

class CNonCohesPage : public CGenPropertyPage {
    DECLARE_DYNAMIC(CNonCohesPage)
public:
    explicit CNonCohesPage(CKota0_adDoc* owner);
    ~CNonCohesPage() override;
    CGenGrid& Grid() { return grid_; }

private:
    CGenGrid grid_;
};

// Greys the Grid menu, since it has no grid.
class CAddOutput : public CGenPropertyPage {
    DECLARE_DYNAMIC(CAddOutput)
public:
    explicit CAddOutput(CKota0_adDoc* owner);
    ~CAddOutput() override;

protected:
    void PrepareGridMenu() override;
};

// Leaves the menu as the page before left it.
class CK32AddOutPage : public CGenPropertyPage {
    DECLARE_DYNAMIC(CK32AddOutPage)
public:
    explicit CK32AddOutPage(CKota0_adDoc* owner);
    ~CK32AddOutPage() override;

protected:
    void PrepareGridMenu() override;
};
