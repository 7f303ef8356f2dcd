#include "platform/framework/command.h"

IMPLEMENT_DYNAMIC(CCmdTarget, CObject, kota::platformModule)

CCmdTarget::CCmdTarget() = default;
CCmdTarget::~CCmdTarget() = default;

BOOL CCmdTarget::OnCmdMsg(UINT /*id*/, int /*notification*/) {
    return FALSE;
}
