#include "platform/framework/tooltip.h"

#include <algorithm>

IMPLEMENT_DYNAMIC(CToolTipCtrl, CWnd, kota::platformModule)

CToolTipCtrl::CToolTipCtrl() = default;
CToolTipCtrl::~CToolTipCtrl() = default;

BOOL CToolTipCtrl::Create(CWnd* parent) {
    return CWnd::Create({.parent = parent ? parent->GetSafeHwnd() : nullptr});
}

void CToolTipCtrl::Show(const Tool& tool) const {
    if (CWnd* const window = FromHandle(tool.window))
        window->SetToolTip(active_ ? tool.text : CString());
}

void CToolTipCtrl::AddTool(CWnd* tool, const char* text) {
    const HWND window = tool->GetSafeHwnd();
    auto known = std::ranges::find(tools_, window, &Tool::window);
    if (known == tools_.end())
        known = tools_.insert(tools_.end(), {window, CString()});
    known->text = text;
    Show(*known);
}

void CToolTipCtrl::Activate(BOOL active) {
    active_ = active != 0;
    for (const Tool& tool : tools_)
        Show(tool);
}

void CToolTipCtrl::RelayEvent(MSG* message) {
    SendMessage(TTM_RELAYEVENT, 0, reinterpret_cast<LPARAM>(message));
}
