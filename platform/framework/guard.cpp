#include "platform/framework/guard.h"

#include "platform/framework/exception.h"
#include "platform/framework/message_box.h"

namespace kota {

bool guarded(const std::function<void()>& handler) {
    try {
        handler();
        return true;
    } catch (const CInvalidArgException& failure) {
        CString text;
        text.Format("An operation was given an invalid argument (%s).", failure.what());
        AfxMessageBox(text);
        return false;
    }
}

} // namespace kota
