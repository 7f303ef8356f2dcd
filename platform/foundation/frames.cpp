#include "platform/foundation/frames.h"

IMPLEMENT_DYNCREATE(CKhMDIChildWnd, CMDIChildWnd, kota::platformModule)

CKhMDIChildWnd::CKhMDIChildWnd() = default;
CKhMDIChildWnd::~CKhMDIChildWnd() = default;
