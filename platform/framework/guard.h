#pragma once

#include "platform/framework/export.h"

#include <functional>

namespace kota {

// Runs a handler of a message or of an input. An invalid-argument failure ends it: the user is told in a
// box, and the result is false.
KOTA_API bool guarded(const std::function<void()>& handler);

} // namespace kota
