#pragma once

#include "platform/foundation/units.h"
#include "platform/framework/number_text.h"
#include "platform/framework/text.h"

#include <string_view>

// How a number of a record, held in the base unit of its unit item, is shown to the user: in which unit, and
// in which format. From the start it is bound to no item (noUnitItem), converts one to one and prints as
// "%-lf". A value: a copy keeps the unit and the format of its original.
class KOTA_API CKhEditStyle {
public:
    // Binds the style to `item`, in the unit that is the user's setting now: a later setDisplayUnit does not
    // change it. An item that the catalogue does not have converts one to one.
    CKhEditStyle& SetUomUnitBaseGroup(int item);
    // The same in the unit at position `unit` of the item's units; in its base unit where there is none.
    CKhEditStyle& SetUomUnitBaseGroup(int item, int unit);

    // A printf format of one double, by the rules of kota::NumberFormat: an invalid one, a null pointer
    // included, prints like "%f".
    void SetFormat(const char* format);

    // `value` from the base unit to the display unit for direction 1, from the display unit to the base unit
    // for direction 0. No value is an exception: infinities, nan and 1e10 are numbers like others.
    double UnitConvertFromBase(double value, int direction) const;
    // The same as text in the style's format.
    CString UnitConvertFromBase_T(double value, int direction) const;
    // The same text in `buffer`, for those who fill many cells: it lives as long as the buffer does, and no
    // NUL ends it.
    std::string_view print(double value, int direction, kota::NumberBuffer& buffer) const;

    // As "Unit: m". Empty when the style has no unit to name: no item of the catalogue, or a dimensionless
    // one.
    CString GetUomToolTipText() const;

    // The item as it was bound, known to the catalogue or not.
    int GetUomItemId() const;
    // The position of the style's unit in its item's units; -1 when the catalogue does not have the item.
    int GetUomUnitId() const;

private:
    int item_ = kota::noUnitItem;
    int unitId_ = -1;
    const kota::Unit* unit_ = nullptr; // in the catalogue; null when that does not have the item
    kota::NumberFormat format_ = kota::NumberFormat("%-lf");
};
