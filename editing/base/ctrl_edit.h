#pragma once

#include "platform/foundation/edit_style.h"
#include "platform/framework/tooltip.h"
#include "platform/framework/window.h"

// An edit of one number of a record: shows it in the user's unit, and writes it back, in the base unit, when
// the focus leaves.
class CCtrlEdit : public CWnd {
    DECLARE_DYNAMIC(CCtrlEdit)
public:
    CCtrlEdit();
    ~CCtrlEdit() override;

    // Points the edit at a number and shows it. `edited` must live for as long as the edit points at it.
    // A negative `unit` is the user's own choice among the units of `item`.
    void Setup(double* edited, int length, int decimalsShown, bool fixed, int item, int unit);

    LRESULT WindowProc(UINT message, WPARAM wParam, LPARAM lParam) override;

private:
    void ShowTarget();
    void TakeText();
    void TellDocument();

    CKhEditStyle style_;
    int uomItem = 999;
    int uomUnit = -1;
    CToolTipCtrl toolTip_;
    int maxLength = 0;
    int decimals = 0;
    bool fixedNotation = true;
    double* target = nullptr; // in the base unit; not owned
};
