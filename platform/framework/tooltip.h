#pragma once

#include "platform/framework/window.h"

// The tool tips of a dialog's controls. A screen shows a window's tip by itself; this sets what it says.
class KOTA_API CToolTipCtrl : public CWnd {
    DECLARE_DYNAMIC(CToolTipCtrl)
public:
    CToolTipCtrl();
    ~CToolTipCtrl() override;

    BOOL Create(CWnd* parent);
    // The tip of a window, from now on.
    void AddTool(CWnd* tool, const char* text);
    void UpdateTipText(const char* text, CWnd* tool) { AddTool(tool, text); }
    // An inactive control shows none of its tips.
    void Activate(BOOL active);
    bool IsActive() const { return active_; }
    // A message of a tool passes by.
    void RelayEvent(MSG* message);

private:
    struct Tool {
        HWND window;
        CString text;
    };
    void Show(const Tool& tool) const;

    std::vector<Tool> tools_;
    bool active_ = true;
};
