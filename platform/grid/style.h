#pragma once

#include "platform/framework/export.h"
#include "platform/framework/text.h"
#include "platform/framework/types.h"

#include <cstdint>
#include <memory>
#include <string_view>

// A colour: 0x00BBGGRR, or one of the screen's own colours with the top byte set.
using COLORREF = std::uint32_t;

// The alignment of a cell's text.
inline constexpr int alignLeft = 0;
inline constexpr int alignCenter = 1;
inline constexpr int alignRight = 2;

// The user attribute that holds a cell's tool tip.
inline constexpr UINT GX_IDS_UA_TOOLTIPTEXT = 51022;

// The ready-made controls of cells.
inline constexpr UINT GX_IDS_CTRL_EDIT = 0;             // text
inline constexpr UINT GX_IDS_CTRL_TEXTFIT = 52517;      // a combo box that also takes free text
inline constexpr UINT GX_IDS_CTRL_CHECKBOX = 52523;     // 0 or 1
inline constexpr UINT GX_IDS_CTRL_ONEBASED_EX = 52531;  // a choice list whose value counts from 1
inline constexpr UINT GX_IDS_CTRL_ZEROBASED_EX = 52532; // a choice list whose value counts from 0

// A font as a screen picks it.
struct CGXFont {
    CString face; // empty: the screen's own
    int points = 0;

    friend bool operator==(const CGXFont&, const CGXFont&) = default;
};

// The attributes of cells. Each may be set or not; styles are laid over one another (standard, column, line,
// cell), and a cell shows for each attribute the uppermost that is set. A value: copies share their memory
// until one is changed.
class KOTA_API CGXStyle {
public:
    CGXStyle();
    CGXStyle(const CGXStyle& other);
    CGXStyle& operator=(const CGXStyle& other);
    ~CGXStyle();

    CGXStyle& SetValue(const char* text);
    CGXStyle& SetValue(std::string_view text);
    CGXStyle& SetValue(const CString& text);
    CGXStyle& SetValue(int number);
    // The shortest text that reads back to the same number.
    CGXStyle& SetValue(double number);
    CGXStyle& SetControl(UINT id);
    // The entries of a choice list, each ended by a line feed or a carriage return and a line feed.
    CGXStyle& SetChoiceList(const char* entries);
    CGXStyle& SetReadOnly(BOOL readOnly);
    // A cell that is not enabled takes no input, and the user cannot make it current.
    CGXStyle& SetEnabled(BOOL enabled);
    CGXStyle& SetHorizontalAlignment(int alignment);
    CGXStyle& SetInterior(COLORREF colour);
    CGXStyle& SetFont(const CGXFont& font);
    CGXStyle& SetUserAttribute(UINT attribute, const char* text);

    bool HasValue() const;
    bool HasReadOnly() const;
    bool HasOnlyValue() const; // nothing else is set
    bool IsEmpty() const;      // nothing is set
    // The attributes, or what holds where nothing is set: "", 0, writable, enabled, left, white, the screen's
    // font.
    CString GetValue() const;
    // The value without a copy; valid until the style changes.
    std::string_view ValueText() const;
    UINT GetControl() const;
    CString GetChoiceList() const;
    bool GetReadOnly() const;
    bool GetEnabled() const;
    int GetHorizontalAlignment() const;
    COLORREF GetInterior() const;
    bool HasInterior() const;
    CGXFont GetFont() const;
    CString GetUserAttribute(UINT attribute) const;

    // Lays `upper` over this style: what is set in it wins.
    void ChangeStyle(const CGXStyle& upper);
    void ClearValue();
    KOTA_API friend bool operator==(const CGXStyle& left, const CGXStyle& right);

private:
    struct Attributes;
    const Attributes& Get() const;
    Attributes& Own();
    std::shared_ptr<Attributes> attributes_; // null when nothing was ever set
};
