#include "platform/foundation/toolbar.h"

#include "platform/framework/turn.h"

#include <algorithm>

IMPLEMENT_DYNAMIC(CControlBar, CWnd, kota::platformModule)
IMPLEMENT_DYNAMIC(SECToolBar, CControlBar, kota::platformModule)
IMPLEMENT_DYNAMIC(CKhFlatToolBar, SECToolBar, kota::platformModule)
IMPLEMENT_DYNAMIC(CKhToolBarEx, CKhFlatToolBar, kota::platformModule)

CControlBar::CControlBar() = default;
CControlBar::~CControlBar() = default;

SECToolBar::SECToolBar() = default;
SECToolBar::~SECToolBar() = default;

BOOL SECToolBar::Create(CWnd* frame, UINT style, UINT id) {
    if (!frame || !frame->GetSafeHwnd() ||
        !CWnd::Create({.parent = frame->GetSafeHwnd(), .id = id, .kind = kota::WindowKind::ToolBar}))
        return FALSE;
    MutableState()->style = style;
    return TRUE;
}

CKhFlatToolBar::CKhFlatToolBar() = default;
CKhFlatToolBar::~CKhFlatToolBar() = default;

BOOL CKhFlatToolBar::LoadToolBar(const kota::Module& module, UINT id) {
    const kota::ToolBarTemplate* const buttons = module.toolBar(id);
    if (!buttons)
        return FALSE;
    module_ = &module;
    buttons_ = buttons;
    kota::noteChange(GetSafeHwnd(), kota::Change::Contents);
    return TRUE;
}

bool CKhFlatToolBar::HasCommand(UINT command) const {
    return buttons_ && std::ranges::find(buttons_->commands, command) != buttons_->commands.end();
}

CKhToolBarEx::CKhToolBarEx() = default;
CKhToolBarEx::~CKhToolBarEx() = default;
