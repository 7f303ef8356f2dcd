#pragma once

#include "platform/foundation/frames.h"

// The frame of a parameter document.
class CDlgFrame : public CKhMDIChildWnd {
    DECLARE_DYNCREATE(CDlgFrame)
public:
    CDlgFrame();
    ~CDlgFrame() override;

    BOOL OnCreateClient(CREATESTRUCT* create, const CCreateContext& context) override;
};
