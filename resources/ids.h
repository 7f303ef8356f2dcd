#pragma once

#include "platform/framework/types.h"

// The numbers of the plug-in's resources, each named once. Shells and siblings may rely on them.
namespace StringId {
inline constexpr UINT SedimentGlobalsMissing = 4838;    // %s: the component's name
inline constexpr UINT NonCohesiveGlobalsMissing = 4839; // %s: the component's name
inline constexpr UINT UnsupportedFileFormat = 4840;
} // namespace StringId
