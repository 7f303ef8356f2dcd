#include "editing/dlg_frame.h"

#include "platform/grid/init.h"
#include "resources/module.h"

IMPLEMENT_DYNCREATE(CDlgFrame, CKhMDIChildWnd, kota0AdModule)

CDlgFrame::CDlgFrame() = default;
CDlgFrame::~CDlgFrame() = default;

BOOL CDlgFrame::OnCreateClient(CREATESTRUCT* create, const CCreateContext& context) {
    constexpr UINT gridFlags = 3072;
    if (!GXIsRegistered())
        GXInit(gridFlags, nullptr, nullptr);
    return CKhMDIChildWnd::OnCreateClient(create, context);
}
