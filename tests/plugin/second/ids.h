#pragma once

#include "platform/framework/types.h"

// The numbers of the second plug-in's resources: those of the first one, but for one command.
namespace Second {
inline constexpr UINT Keys = 4786;
inline constexpr UINT Document = 4787;
inline constexpr UINT EditorName = 4896;
inline constexpr UINT ToolBarName = 4897;
inline constexpr UINT Command = 42550;
inline constexpr UINT OwnCommand = 42999;
} // namespace Second
