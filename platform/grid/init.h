#pragma once

#include "platform/framework/export.h"
#include "platform/framework/types.h"

// Whether the grid's window class "GXWND" is registered.
KOTA_API bool GXIsRegistered();
// Registers it. The flags and the two tables of the caller's own controls are those of grids that draw
// themselves: a screen draws these.
KOTA_API void GXInit(UINT flags, void* controls, void* styles);
