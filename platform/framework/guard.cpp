#include "platform/framework/guard.h"

#include "platform/framework/exception.h"
#include "platform/framework/message_box.h"
#include "platform/framework/platform_texts.h"

namespace kota {

bool guarded(const std::function<void()>& handler) {
    try {
        handler();
        return true;
    } catch (const CInvalidArgException& failure) {
        const CString text = platformText(PlatformText::InvalidArgument, failure.what());
        AfxMessageBox(text);
        return false;
    }
}

} // namespace kota
