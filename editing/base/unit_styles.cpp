#include "editing/base/unit_styles.h"

#include "platform/framework/exception.h"

CKhEditStyle& UnitStyles::Bind(std::size_t entry, int unitItem, const char* format) {
    if (entry >= styles_.size())
        throw CInvalidArgException("a unit style beyond the page's");
    auto& style = styles_[entry];
    if (!style) {
        style = std::make_unique<CKhEditStyle>();
        style->SetUomUnitBaseGroup(unitItem).SetFormat(format);
    }
    return *style;
}

CKhEditStyle& UnitStyles::At(std::size_t entry) const {
    if (entry >= styles_.size() || !styles_[entry])
        throw CInvalidArgException("a unit style that the page does not have");
    return *styles_[entry];
}
