#pragma once

#include "platform/framework/frame.h"

// The foundation's frame of a document.
class KOTA_API CKhMDIChildWnd : public CMDIChildWnd {
    DECLARE_DYNCREATE(CKhMDIChildWnd)
public:
    CKhMDIChildWnd();
    ~CKhMDIChildWnd() override;
};
