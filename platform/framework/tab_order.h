#pragma once

#include "platform/framework/window.h"

#include <vector>

namespace kota {

// Whether the Tab key stops at a window.
KOTA_API bool stopsAtTab(const CWnd& window);
// The first control inside `dialog` at which the Tab key stops; null when there is none.
KOTA_API CWnd* firstInTabOrder(const CWnd& dialog);
// The one behind `from`, or in front of it, going round; null when there is no other.
KOTA_API CWnd* nextInTabOrder(const CWnd& dialog, const CWnd& from, bool backward);

// The radio buttons among which this one is, in their order.
KOTA_API std::vector<CWnd*> radioGroupOf(const CWnd& radio);

} // namespace kota
