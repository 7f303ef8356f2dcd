#pragma once

#include "platform/framework/export.h"

#include <span>
#include <string_view>

// The unit catalogue: which quantity a unit item is, in which base unit the records hold it, and in which
// units a user may see it.
namespace kota {

// A display unit, by what a value in the base unit is multiplied with. The factor is a fraction of whole
// numbers, since a decimal like 0.3048 is no double; the base unit has 1 / 1.
struct Unit {
    std::string_view symbol; // as "m" or "10^-6 m^2/s"; ended by a NUL
    double numerator;
    double denominator;
};

struct UnitItem {
    int id;
    std::string_view quantity;   // in English, as "chainage"
    std::span<const Unit> units; // those the user may choose from, the base unit first
};

// The item of styles that are bound to none.
inline constexpr int noUnitItem = 999;

// The symbol of a base unit that says that there is none: a dimensionless item's.
inline constexpr std::string_view dimensionless = "-";

// All items, noUnitItem left out.
KOTA_API std::span<const UnitItem> unitItems();

// Null for an item that the catalogue does not have, noUnitItem among them.
KOTA_API const UnitItem* findUnitItem(int item);

// The user's setting of an item's unit: the position in its units. It is kept for the process; from the start
// it is 0, the base unit. Neither call may run beside another thread's setDisplayUnit.
//
// -1 when the catalogue does not have the item.
KOTA_API int displayUnit(int item);
// False when the catalogue does not have the item or the item does not have the unit: then nothing changes.
KOTA_API bool setDisplayUnit(int item, int unit);

// `value`, in the base unit, as a value in `unit`, and the way back. Each rounds once, to the nearest double,
// and gives `value` itself for the base unit. Infinities stay, nan stays nan.
KOTA_API double toDisplay(const Unit& unit, double value);
KOTA_API double toBase(const Unit& unit, double value);

} // namespace kota
