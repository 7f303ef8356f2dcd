#pragma once

#include "platform/framework/extension.h"

namespace kota::test {

// The record that an extension library had initialised last; null when none has.
AFX_EXTENSION_MODULE* lastInitialised();
void forgetInitialised();

} // namespace kota::test
