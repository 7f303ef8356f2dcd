#include "platform/grid/style.h"

#include "platform/grid/number_value.h"

#include <algorithm>
#include <optional>
#include <utility>
#include <vector>

struct CGXStyle::Attributes {
    std::optional<CString> value;
    std::optional<UINT> control;
    std::optional<CString> choiceList;
    std::optional<bool> readOnly;
    std::optional<bool> enabled;
    std::optional<int> alignment;
    std::optional<COLORREF> interior;
    std::optional<CGXFont> font;
    std::vector<std::pair<UINT, CString>> user; // by rising number

    friend bool operator==(const Attributes&, const Attributes&) = default;
    bool emptyButValue() const {
        return !control && !choiceList && !readOnly && !enabled && !alignment && !interior && !font &&
               user.empty();
    }
};

namespace {

constexpr COLORREF white = 0xFFFFFF;

template <class T>
void layOver(std::optional<T>& lower, const std::optional<T>& upper) {
    if (upper)
        lower = upper;
}

} // namespace

CGXStyle::CGXStyle() = default;
CGXStyle::CGXStyle(const CGXStyle& other) = default;
CGXStyle& CGXStyle::operator=(const CGXStyle& other) = default;
CGXStyle::~CGXStyle() = default;

const CGXStyle::Attributes& CGXStyle::Get() const {
    static const Attributes nothing;
    return attributes_ ? *attributes_ : nothing;
}

CGXStyle::Attributes& CGXStyle::Own() {
    if (!attributes_)
        attributes_ = std::make_shared<Attributes>();
    else if (attributes_.use_count() > 1)
        attributes_ = std::make_shared<Attributes>(*attributes_);
    return *attributes_;
}

CGXStyle& CGXStyle::SetValue(const char* text) {
    return SetValue(CString(text));
}
CGXStyle& CGXStyle::SetValue(std::string_view text) {
    return SetValue(CString(text));
}
CGXStyle& CGXStyle::SetValue(const CString& text) {
    Own().value = text;
    return *this;
}
CGXStyle& CGXStyle::SetValue(int number) {
    kota::grid::NumberText text;
    return SetValue(kota::grid::print(number, text));
}
CGXStyle& CGXStyle::SetValue(double number) {
    kota::grid::NumberText text;
    return SetValue(kota::grid::print(number, text));
}
CGXStyle& CGXStyle::SetControl(UINT id) {
    Own().control = id;
    return *this;
}
CGXStyle& CGXStyle::SetChoiceList(const char* entries) {
    Own().choiceList = CString(entries);
    return *this;
}
CGXStyle& CGXStyle::SetReadOnly(BOOL readOnly) {
    Own().readOnly = readOnly != 0;
    return *this;
}
CGXStyle& CGXStyle::SetEnabled(BOOL enabled) {
    Own().enabled = enabled != 0;
    return *this;
}
CGXStyle& CGXStyle::SetHorizontalAlignment(int alignment) {
    Own().alignment = alignment;
    return *this;
}
CGXStyle& CGXStyle::SetInterior(COLORREF colour) {
    Own().interior = colour;
    return *this;
}
CGXStyle& CGXStyle::SetFont(const CGXFont& font) {
    Own().font = font;
    return *this;
}
CGXStyle& CGXStyle::SetUserAttribute(UINT attribute, const char* text) {
    auto& user = Own().user;
    const auto place = std::ranges::lower_bound(user, attribute, {}, &std::pair<UINT, CString>::first);
    if (place != user.end() && place->first == attribute)
        place->second = text;
    else
        user.emplace(place, attribute, CString(text));
    return *this;
}

bool CGXStyle::HasValue() const {
    return Get().value.has_value();
}
bool CGXStyle::HasReadOnly() const {
    return Get().readOnly.has_value();
}
bool CGXStyle::HasInterior() const {
    return Get().interior.has_value();
}
bool CGXStyle::HasOnlyValue() const {
    return HasValue() && Get().emptyButValue();
}
bool CGXStyle::IsEmpty() const {
    return !HasValue() && Get().emptyButValue();
}

CString CGXStyle::GetValue() const {
    return Get().value.value_or(CString());
}
std::string_view CGXStyle::ValueText() const {
    return Get().value ? Get().value->View() : std::string_view();
}
UINT CGXStyle::GetControl() const {
    return Get().control.value_or(GX_IDS_CTRL_EDIT);
}
CString CGXStyle::GetChoiceList() const {
    return Get().choiceList.value_or(CString());
}
bool CGXStyle::GetReadOnly() const {
    return Get().readOnly.value_or(false);
}
bool CGXStyle::GetEnabled() const {
    return Get().enabled.value_or(true);
}
int CGXStyle::GetHorizontalAlignment() const {
    return Get().alignment.value_or(alignLeft);
}
COLORREF CGXStyle::GetInterior() const {
    return Get().interior.value_or(white);
}
CGXFont CGXStyle::GetFont() const {
    return Get().font.value_or(CGXFont());
}
CString CGXStyle::GetUserAttribute(UINT attribute) const {
    const auto& user = Get().user;
    const auto place = std::ranges::find(user, attribute, &std::pair<UINT, CString>::first);
    return place != user.end() ? place->second : CString();
}

void CGXStyle::ChangeStyle(const CGXStyle& upper) {
    if (!upper.attributes_ || upper.attributes_ == attributes_)
        return;
    if (!attributes_) {
        attributes_ = upper.attributes_;
        return;
    }
    const Attributes& over = *upper.attributes_;
    Attributes& mine = Own();
    layOver(mine.value, over.value);
    layOver(mine.control, over.control);
    layOver(mine.choiceList, over.choiceList);
    layOver(mine.readOnly, over.readOnly);
    layOver(mine.enabled, over.enabled);
    layOver(mine.alignment, over.alignment);
    layOver(mine.interior, over.interior);
    layOver(mine.font, over.font);
    for (const auto& [attribute, text] : over.user)
        SetUserAttribute(attribute, text);
}

void CGXStyle::ClearValue() {
    if (HasValue())
        Own().value.reset();
}

bool operator==(const CGXStyle& left, const CGXStyle& right) {
    return left.attributes_ == right.attributes_ || left.Get() == right.Get();
}
