#pragma once

#include "platform/framework/window.h"

namespace kota {

// Whether the Tab key stops at a window.
KOTA_API bool stopsAtTab(const CWnd& window);
// The first control inside `dialog` at which the Tab key stops; null when there is none.
KOTA_API CWnd* firstInTabOrder(const CWnd& dialog);
// The one behind `from`, or in front of it, going round; null when there is no other.
KOTA_API CWnd* nextInTabOrder(const CWnd& dialog, const CWnd& from, bool backward);

} // namespace kota
