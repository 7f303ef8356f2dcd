#include "pages/later_pages.h"

#include "editing/base/main_menu.h"
#include "resources/ids.h"
#include "resources/module.h"

IMPLEMENT_DYNAMIC(CK32DispersPage, CGenPropertyPage, kota0AdModule)
IMPLEMENT_DYNAMIC(CInitPage, CGenPropertyPage, kota0AdModule)
IMPLEMENT_DYNAMIC(CBoundPage, CGenPropertyPage, kota0AdModule)
IMPLEMENT_DYNAMIC(CK32BoundPage, CGenPropertyPage, kota0AdModule)
IMPLEMENT_DYNAMIC(CGlobalPage, CGenPropertyPage, kota0AdModule)
IMPLEMENT_DYNAMIC(CLayerPage, CGenPropertyPage, kota0AdModule)
IMPLEMENT_DYNAMIC(CNonCohesPage, CGenPropertyPage, kota0AdModule)
IMPLEMENT_DYNAMIC(CAddOutput, CGenPropertyPage, kota0AdModule)
IMPLEMENT_DYNAMIC(CK32AddOutPage, CGenPropertyPage, kota0AdModule)

CK32DispersPage::CK32DispersPage(CKota0_adDoc* owner) : CGenPropertyPage(owner, DialogId::K32Dispersion) {}
CK32DispersPage::~CK32DispersPage() = default;

CInitPage::CInitPage(CKota0_adDoc* owner) : CGenPropertyPage(owner, DialogId::InitialConditions) {}
CInitPage::~CInitPage() = default;

CBoundPage::CBoundPage(CKota0_adDoc* owner) : CGenPropertyPage(owner, DialogId::Boundary) {}
CBoundPage::~CBoundPage() = default;

CK32BoundPage::CK32BoundPage(CKota0_adDoc* owner) : CGenPropertyPage(owner, DialogId::K32Boundary) {}
CK32BoundPage::~CK32BoundPage() = default;

CGlobalPage::CGlobalPage(CKota0_adDoc* owner) : CGenPropertyPage(owner, DialogId::Cohesive) {}
CGlobalPage::~CGlobalPage() = default;

CLayerPage::CLayerPage(CKota0_adDoc* owner) : CGenPropertyPage(owner, DialogId::SedimentLayers) {}
CLayerPage::~CLayerPage() = default;

CNonCohesPage::CNonCohesPage(CKota0_adDoc* owner) : CGenPropertyPage(owner, DialogId::NonCohesive) {}
CNonCohesPage::~CNonCohesPage() = default;

CAddOutput::CAddOutput(CKota0_adDoc* owner) : CGenPropertyPage(owner, DialogId::AdditionalOutput) {}
CAddOutput::~CAddOutput() = default;

CK32AddOutPage::CK32AddOutPage(CKota0_adDoc* owner)
    : CGenPropertyPage(owner, DialogId::K32AdditionalOutput) {}
CK32AddOutPage::~CK32AddOutPage() = default;

void CAddOutput::PrepareGridMenu() {
    enableGridMenu(MF_GRAYED);
}

void CK32AddOutPage::PrepareGridMenu() {}
