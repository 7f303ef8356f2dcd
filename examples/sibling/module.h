#pragma once

#include "platform/framework/module.h"

// The numbers of the module's resources, its own: another module may have the same.
namespace Id {
inline constexpr UINT DocTemplate = 100;
inline constexpr UINT EditorName = 101;
inline constexpr UINT Form = 102;
inline constexpr UINT AdName = 1;
inline constexpr UINT Component = 2;
inline constexpr UINT Temperature = 3;
inline constexpr UINT Decay = 4;
inline constexpr UINT Place = 5;
inline constexpr UINT OpenAdDocument = 6;
inline constexpr UINT Correct = 7;
inline constexpr UINT SaveBoth = 8;
} // namespace Id

// The module's token, which its classes carry. Hidden in the library, as all that is not exported.
const kota::Module& temperatureModule();
