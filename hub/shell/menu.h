#pragma once

#include "hub/shell/texts.h"

#include <QString>

namespace kota::hub {

// The shell's module: its menu and its texts, in the user's language once that is loaded, in English before.
const Module& hubModule();
// Takes the language of the user for the shell and the platform. Called once, before anything is shown.
void loadLanguage();

const MenuTemplate& hubMenu();
const AcceleratorTable& hubKeys();
// A text in the user's language; what it is filled in with is left to the caller.
QString hubText(HubText id);

} // namespace kota::hub
