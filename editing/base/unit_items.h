#pragma once

// The unit items of what the editor's cells and edits hold.
namespace UnitItem {
inline constexpr int Chainage = 100143;
inline constexpr int Dimensionless = 100144;
inline constexpr int FirstOrderRate = 100149;
inline constexpr int DispersionCoefficient = 100153;
inline constexpr int DispersionFactor = 100154;
} // namespace UnitItem
