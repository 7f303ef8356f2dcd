#pragma once

#include "platform/framework/types.h"

// The shell's own commands, beside those that the framework names.
namespace kota::hub::HubCommand {

inline constexpr UINT OpenProject = 32901;
inline constexpr UINT CloseProject = 32902;
inline constexpr UINT ShowMap = 32903;
inline constexpr UINT ShowExchange = 32904;
inline constexpr UINT Settings = 32905;
inline constexpr UINT DataUtility = 32773; // of editors' menus; not there

} // namespace kota::hub::HubCommand
