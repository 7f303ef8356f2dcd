#pragma once

#include "platform/grid/style.h"

// The colours of cells.
namespace Colour {
inline constexpr COLORREF CheckBoxGrey = 0x808080;
} // namespace Colour
