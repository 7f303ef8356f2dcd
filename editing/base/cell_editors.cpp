#include "editing/base/cell_editors.h"

#include "editing/base/number_form.h"
#include "platform/framework/upper_case.h"
#include "resources/ids.h"
#include "resources/module.h"

namespace {

kota::NumberFormat formatOf(int decimals, bool fixedNotation) {
    CString format;
    format.Format(fixedNotation ? "%%-.%dlf" : "%%-.%dE", decimals);
    return kota::NumberFormat(format.View());
}

constexpr int editWidth = 40;
constexpr int qualityMinimum = 0;
constexpr int qualityMaximum = 6;

} // namespace

CGridDoubleEdit::CGridDoubleEdit(int decimalsShown, int textWidth, bool fixed, CGXGridCore* grid, UINT itemId)
    : CGXEditControl(grid, itemId), decimals(decimalsShown), width(textWidth), fixedNotation(fixed),
      format_(formatOf(decimals, fixedNotation)) {
    static_cast<void>(width);
}
CGridDoubleEdit::~CGridDoubleEdit() = default;

BOOL CGridDoubleEdit::OnValidate() {
    if (GetCurrentText().IsEmpty() || isNumberText(GetCurrentText().View()))
        return TRUE;
    Grid()->SetWarningText(kota0AdModule().string(StringId::DoubleRequired));
    return FALSE;
}

CString CGridDoubleEdit::GetDisplayText(const CString& value, const CGXStyle& style) {
    return value.IsEmpty() ? CGXEditControl::GetDisplayText(value, style)
                           : format_(kota::textToDouble(value.View()));
}

CGridStringEdit::CGridStringEdit(CGXGridCore* grid, UINT itemId) : CGXEditControl(grid, itemId) {}
CGridStringEdit::~CGridStringEdit() = default;

BOOL CGridStringEdit::GetValue(CString& value) {
    value = kota::upperCase(GetCurrentText());
    return TRUE;
}

CString CGridStringEdit::GetDisplayText(const CString& value, const CGXStyle& style) {
    return value.IsEmpty() ? CGXEditControl::GetDisplayText(value, style) : kota::upperCase(value);
}

CQualityEdit::CQualityEdit(int least, int most, CGXGridCore* grid, UINT itemId)
    : CGXEditControl(grid, itemId), minimum(least), maximum(most) {}
CQualityEdit::~CQualityEdit() = default;

BOOL CQualityEdit::OnValidate() {
    const int number = kota::textToInt(GetCurrentText().View());
    if (GetCurrentText().IsEmpty() || (number >= minimum && number <= maximum))
        return TRUE;
    CString warning;
    warning.Format(kota0AdModule().string(StringId::IntegerBetween), minimum, maximum);
    Grid()->SetWarningText(warning);
    return FALSE;
}

CString CQualityEdit::GetDisplayText(const CString& value, const CGXStyle& style) {
    if (value.IsEmpty())
        return CGXEditControl::GetDisplayText(value, style);
    CString shown;
    shown.Format("%d", kota::textToInt(value.View()));
    return shown;
}

void registerCellEditors(CGXGridCore& grid) {
    grid.RegisterControl(CellControl::UpperCase, std::make_unique<CGridStringEdit>(&grid, 1103));
    grid.RegisterControl(CellControl::ThreeDecimals,
                         std::make_unique<CGridDoubleEdit>(3, editWidth, true, &grid, 1104));
    grid.RegisterControl(CellControl::Quality,
                         std::make_unique<CQualityEdit>(qualityMinimum, qualityMaximum, &grid, 1105));
    grid.RegisterControl(CellControl::NoDecimals,
                         std::make_unique<CGridDoubleEdit>(0, editWidth, true, &grid, 1106));
}
