#include "platform/foundation/units.h"

#include <algorithm>
#include <array>
#include <cmath>
#include <cstddef>
#include <functional>

namespace kota {

namespace {

constexpr Unit base(std::string_view symbol) {
    return {symbol, 1, 1};
}

constexpr Unit feet = {"ft", 1250, 381}; // a foot is 0.3048 m

constexpr std::array metresAndFeet = {base("m"), feet};
constexpr std::array lengths = {base("m"), Unit{"cm", 100, 1}, Unit{"mm", 1000, 1}, feet};
constexpr std::array rates = {base("1/h"), Unit{"1/day", 24, 1}};
constexpr std::array metres = {base("m")};
constexpr std::array dispersions = {base("m^2/s")};
constexpr std::array numbers = {base(dimensionless)};
constexpr std::array viscosities = {base("10^-6 m^2/s")};
constexpr std::array velocities = {base("m/s")};
constexpr std::array stresses = {base("N/m^2")};
constexpr std::array erosionRates = {base("g/(m^2 s)")};
constexpr std::array frictions = {base("m^0.5/s")};
constexpr std::array densities = {base("kg/m^3")};

constexpr auto items = std::to_array<UnitItem>({
    {100016, "velocity", velocities},
    {100017, "density", densities},
    {100032, "sliding friction coefficient", frictions},
    {100123, "kinematic viscosity", viscosities},
    {100127, "grain size", metres},
    {100128, "fall velocity", velocities},
    {100143, "chainage", metresAndFeet},
    {100144, "dimensionless", numbers},
    {100145, "dimensionless", numbers},
    {100147, "width", metresAndFeet},
    {100149, "first-order rate", rates},
    {100151, "erosion and transition rate", erosionRates},
    {100152, "shear stress", stresses},
    {100153, "dispersion coefficient", dispersions},
    {100154, "dispersion factor", numbers},
    {100155, "layer height", lengths},
});

static_assert(std::ranges::adjacent_find(items, std::ranges::greater_equal(), &UnitItem::id) == items.end(),
              "one row per item, in the order of ids");

constexpr bool startsWithBaseUnit(const UnitItem& item) {
    const Unit& first = item.units.front();
    return first.numerator == 1 && first.denominator == 1;
}
static_assert(std::ranges::all_of(items, startsWithBaseUnit));
static_assert(std::ranges::find(items, noUnitItem, &UnitItem::id) == items.end());

// The user's setting of each item, as displayUnit tells of it.
std::array<int, items.size()> displayUnits = {};

int& displayUnitOf(const UnitItem& item) {
    return displayUnits[static_cast<std::size_t>(&item - items.data())];
}

// `value` times `numerator` / `denominator`, both below 2^32: what the product and the quotient lose in
// rounding is added at the end.
double scaled(double value, double numerator, double denominator) {
    if (numerator == denominator)
        return value;
    const double product = value * numerator;
    const double quotient = product / denominator;
    if (!std::isfinite(product))
        return value / denominator * numerator;
    const double lost = std::fma(value, numerator, -product) - std::fma(quotient, denominator, -product);
    return lost == 0 ? quotient : quotient + lost / denominator;
}

} // namespace

std::span<const UnitItem> unitItems() {
    return items;
}

const UnitItem* findUnitItem(int item) {
    const auto found = std::ranges::lower_bound(items, item, {}, &UnitItem::id);
    return found != items.end() && found->id == item ? &*found : nullptr;
}

int displayUnit(int item) {
    const UnitItem* const found = findUnitItem(item);
    return found ? displayUnitOf(*found) : -1;
}

bool setDisplayUnit(int item, int unit) {
    const UnitItem* const found = findUnitItem(item);
    if (!found || unit < 0 || static_cast<std::size_t>(unit) >= found->units.size())
        return false;
    displayUnitOf(*found) = unit;
    return true;
}

double toDisplay(const Unit& unit, double value) {
    return scaled(value, unit.numerator, unit.denominator);
}

double toBase(const Unit& unit, double value) {
    return scaled(value, unit.denominator, unit.numerator);
}

} // namespace kota
