#pragma once

#include "platform/framework/number_text.h"
#include "platform/grid/grid.h"

// The control ids under which every grid of the editor registers its cell editors.
namespace CellControl {
inline constexpr UINT UpperCase = 4788;     // text in upper case
inline constexpr UINT ThreeDecimals = 4789; // a number, shown with three decimals
inline constexpr UINT Quality = 4790;       // an integer from 0 to 6
inline constexpr UINT NoDecimals = 4791;    // a number, shown without decimals
} // namespace CellControl

// A number. What was typed stays in the cell; what is shown is rounded.
class CGridDoubleEdit : public CGXEditControl {
public:
    // `width` is kept and read by nothing. Without `fixedNotation` the number shows with an exponent.
    CGridDoubleEdit(int decimals, int width, bool fixedNotation, CGXGridCore* grid, UINT itemId);
    ~CGridDoubleEdit() override;

    BOOL OnValidate() override;
    CString GetDisplayText(const CString& value, const CGXStyle& style) override;

private:
    int decimals;
    int width;
    bool fixedNotation;
    kota::NumberFormat format_;
};

// Text that is stored and shown in upper case.
class CGridStringEdit : public CGXEditControl {
public:
    CGridStringEdit(CGXGridCore* grid, UINT itemId);
    ~CGridStringEdit() override;

    BOOL GetValue(CString& value) override;
    CString GetDisplayText(const CString& value, const CGXStyle& style) override;
};

// An integer within bounds, both of them included.
class CQualityEdit : public CGXEditControl {
public:
    CQualityEdit(int minimum, int maximum, CGXGridCore* grid, UINT itemId);
    ~CQualityEdit() override;

    BOOL OnValidate() override;
    CString GetDisplayText(const CString& value, const CGXStyle& style) override;

private:
    int minimum;
    int maximum;
};

// Registers the four of them with a grid.
void registerCellEditors(CGXGridCore& grid);
