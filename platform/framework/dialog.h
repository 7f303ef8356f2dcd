#pragma once

#include "platform/framework/data_exchange.h"
#include "platform/framework/window.h"

namespace kota {

// Makes the controls of a dialog template inside a window.
KOTA_API void createDialogItems(HWND parent, const DialogTemplate& dialog);

} // namespace kota

// A window built from a dialog template of its class's module.
class KOTA_API CDialog : public CWnd {
    DECLARE_DYNAMIC(CDialog)
public:
    CDialog();
    // The template that DoModal shows; `parent` owns the dialog on screen.
    explicit CDialog(UINT templateId, CWnd* parent = nullptr);
    ~CDialog() override;

    UINT TemplateId() const { return templateId_; }
    // Builds the dialog's window inside `parent` (null: a window of its own) and calls OnInitDialog. 0 when
    // the module has no such template or the dialog has a window.
    BOOL Create(UINT templateId, CWnd* parent);
    // Shows the dialog and waits until it is ended; gives the result of EndDialog. -1 when it cannot be built
    // or no screen is attached; IDCANCEL, and nothing is shown, when the window with the focus keeps it.
    int DoModal();
    void EndDialog(int result);
    bool IsEnded() const { return ended_; }

    // Before the dialog is shown. The base shows the members (UpdateData(FALSE)).
    virtual BOOL OnInitDialog();
    // The base reads the controls and ends the dialog with IDOK.
    virtual void OnOK();
    virtual void OnCancel();

    // Moves data between the controls and the members, from the controls with 1. 0 when a control holds what
    // cannot be taken over; the user was told.
    BOOL UpdateData(BOOL saveAndValidate = TRUE);
    virtual void DoDataExchange(CDataExchange* exchange);

    BOOL OnCmdMsg(UINT id, int notification) override;
    // The Tab key moves among the controls; Enter and Escape end a modal dialog.
    BOOL PreTranslateMessage(MSG* message) override;
    // The close button of a modal dialog cancels it.
    LRESULT WindowProc(UINT message, WPARAM wParam, LPARAM lParam) override;
    // The first control that takes the focus; null when there is none.
    CWnd* FirstFocusControl() const;

protected:
    // A dialog whose window is gone is ended.
    void PostNcDestroy() override;
    BOOL CreateOf(kota::WindowKind kind, UINT templateId, CWnd* parent);

private:
    UINT templateId_ = 0;
    CWnd* parent_ = nullptr;
    bool modal_ = false;
    bool ended_ = false;
    int result_ = -1;
};
