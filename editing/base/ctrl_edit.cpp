#include "editing/base/ctrl_edit.h"

#include "document/kota0_ad_doc.h"
#include "editing/base/number_form.h"
#include "platform/framework/frame.h"
#include "platform/framework/number_text.h"
#include "resources/ids.h"
#include "resources/module.h"

IMPLEMENT_DYNAMIC(CCtrlEdit, CWnd, kota0AdModule)

CCtrlEdit::CCtrlEdit() = default;
CCtrlEdit::~CCtrlEdit() = default;

void CCtrlEdit::Setup(double* edited, int length, int decimalsShown, bool fixed, int item, int unit) {
    maxLength = length;
    uomItem = item;
    uomUnit = unit;
    if (uomUnit < 0)
        style_.SetUomUnitBaseGroup(uomItem);
    else
        style_.SetUomUnitBaseGroup(uomItem, uomUnit);
    if (!toolTip_.GetSafeHwnd())
        toolTip_.Create(this);
    const CString tip = style_.GetUomToolTipText();
    toolTip_.AddTool(this, tip);
    toolTip_.Activate(!tip.IsEmpty());

    decimals = decimalsShown;
    fixedNotation = fixed;
    CString format;
    format.Format(fixedNotation ? "%%.%dlf" : "%%-.%dE", decimals);
    style_.SetFormat(format);
    target = edited;
    SendMessage(EM_LIMITTEXT, static_cast<WPARAM>(maxLength));
    ShowTarget();
}

void CCtrlEdit::ShowTarget() {
    SetWindowText(style_.UnitConvertFromBase_T(*target, 1));
}

LRESULT CCtrlEdit::WindowProc(UINT message, WPARAM wParam, LPARAM lParam) {
    switch (message) {
    case WM_KILLFOCUS:
        TakeText();
        break;
    case WM_MOUSEMOVE:
    case WM_LBUTTONDOWN:
    case WM_LBUTTONUP: {
        MSG relayed{GetSafeHwnd(), message, wParam, lParam};
        toolTip_.RelayEvent(&relayed);
        break;
    }
    default:
        break;
    }
    return CWnd::WindowProc(message, wParam, lParam);
}

void CCtrlEdit::TakeText() {
    const CString text = GetWindowText();
    if (!target || text.IsEmpty())
        return;
    if (!isNumberText(text.View())) {
        MessageBox(kota0AdModule().string(StringId::InvalidNumber));
        return;
    }
    const double value = style_.UnitConvertFromBase(kota::textToDouble(text.View()), 0);
    if (value != *target) {
        *target = value;
        TellDocument();
    }
    if (!target || !GetSafeHwnd()) // whoever was told has closed the window
        return;
    *target = value;
    ShowTarget();
}

void CCtrlEdit::TellDocument() {
    const CFrameWnd* const frame = GetParentFrame();
    CDocument* const document = frame ? frame->GetActiveDocument() : nullptr;
    if (!document)
        return;
    document->SetModifiedFlag(TRUE);
    document->UpdateAllViews(frame->GetActiveView(), UpdateHint::Fill, nullptr);
}
