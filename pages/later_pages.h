#pragma once

#include "editing/base/gen_property_page.h"

// The pages that are not available yet: each has its caption and its help, and shows a line of text.

class CK32DispersPage : public CGenPropertyPage {
    DECLARE_DYNAMIC(CK32DispersPage)
public:
    explicit CK32DispersPage(CKota0_adDoc* owner);
    ~CK32DispersPage() override;
};

class CInitPage : public CGenPropertyPage {
    DECLARE_DYNAMIC(CInitPage)
public:
    explicit CInitPage(CKota0_adDoc* owner);
    ~CInitPage() override;
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
};

class CLayerPage : public CGenPropertyPage {
    DECLARE_DYNAMIC(CLayerPage)
public:
    explicit CLayerPage(CKota0_adDoc* owner);
    ~CLayerPage() override;
};

class CNonCohesPage : public CGenPropertyPage {
    DECLARE_DYNAMIC(CNonCohesPage)
public:
    explicit CNonCohesPage(CKota0_adDoc* owner);
    ~CNonCohesPage() override;
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
