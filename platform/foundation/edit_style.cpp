#include "platform/foundation/edit_style.h"

#include "platform/framework/platform_texts.h"

#include <cstddef>

CKhEditStyle& CKhEditStyle::SetUomUnitBaseGroup(int item) {
    return SetUomUnitBaseGroup(item, kota::displayUnit(item));
}

CKhEditStyle& CKhEditStyle::SetUomUnitBaseGroup(int item, int unit) {
    const kota::UnitItem* const found = kota::findUnitItem(item);
    item_ = item;
    unitId_ = -1;
    unit_ = nullptr;
    if (found) {
        const bool hasUnit = unit >= 0 && static_cast<std::size_t>(unit) < found->units.size();
        unitId_ = hasUnit ? unit : 0;
        unit_ = &found->units[static_cast<std::size_t>(unitId_)];
    }
    return *this;
}

void CKhEditStyle::SetFormat(const char* format) {
    format_ = kota::NumberFormat(format ? format : "");
}

double CKhEditStyle::UnitConvertFromBase(double value, int direction) const {
    if (!unit_)
        return value;
    return direction == 0 ? kota::toBase(*unit_, value) : kota::toDisplay(*unit_, value);
}

CString CKhEditStyle::UnitConvertFromBase_T(double value, int direction) const {
    return format_(UnitConvertFromBase(value, direction));
}

std::string_view CKhEditStyle::print(double value, int direction, kota::NumberBuffer& buffer) const {
    return format_.print(UnitConvertFromBase(value, direction), buffer);
}

CString CKhEditStyle::GetUomToolTipText() const {
    if (!unit_ || unit_->symbol == kota::dimensionless)
        return {};
    return kota::platformText(kota::PlatformText::UnitOf, unit_->symbol.data());
}

int CKhEditStyle::GetUomItemId() const {
    return item_;
}
int CKhEditStyle::GetUomUnitId() const {
    return unitId_;
}
