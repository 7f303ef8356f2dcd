#pragma once

#include "platform/framework/view.h"

class CK31_CBE_ModelDataItem;
class CKHComm_Package;
class CKota0_adDoc;
class CTemperatureDoc;

// The one window of a .wtemp document: its values, and what the AD document has at present.
class CTemperatureView : public CFormView {
    DECLARE_DYNCREATE(CTemperatureView)
public:
    CTemperatureView();

    CTemperatureDoc& Document() const;

    void OnUpdate(CView* sender, LPARAM hint, CObject* hintObject) override;
    // Looks again when the user comes back: outside a project nobody tells of changes.
    void OnActivateView(BOOL activate, CView* activateView, CView* deactiveView) override;
    BOOL OnCmdMsg(UINT id, int notification) override;
    LRESULT WindowProc(UINT message, WPARAM wParam, LPARAM lParam) override;

private:
    void OnAdNameTyped();
    void OnComponentTyped();
    void OnOpenAdDocument();
    void OnCorrect();
    void OnSaveBoth();
    // What an editor told the shell, and the shell all others.
    void Hear(WPARAM code, const CKHComm_Package* package);
    void ShowDecay();
    void ShowPlace(const CKota0_adDoc& ad, const CK31_CBE_ModelDataItem& place);
    // Takes over what the user typed into an edit. False when that is what stood there.
    bool Take(UINT id, CString& value);
};
