#pragma once

#include "platform/framework/extension.h"

namespace kota::test {

// The record that an extension library had initialised last; null when none has.
AFX_EXTENSION_MODULE* lastInitialised();
void forgetInitialised();
// What to do, once, before the next record is initialised.
void beforeInitialising(void (*act)());

} // namespace kota::test
