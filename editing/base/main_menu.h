#pragma once

#include "platform/framework/menu.h"

// Enables (MF_ENABLED) or greys (MF_GRAYED) the third entry of the main window's menu, the Grid menu.
void enableGridMenu(UINT state);
