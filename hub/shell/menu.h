#pragma once

#include "platform/framework/module.h"

namespace kota::hub {

// The shell's module: its menu, its keys and their prompts.
const Module& hubModule();
const MenuTemplate& hubMenu();
const AcceleratorTable& hubKeys();

} // namespace kota::hub
