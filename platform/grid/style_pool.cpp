#include "platform/grid/style_pool.h"

#include <functional>
#include <string_view>

namespace kota::grid {

namespace {

std::size_t hashOf(const CGXStyle& style) {
    std::size_t hash = 0;
    const auto add = [&hash](std::size_t part) { hash = hash * 1000003 + part; };
    const auto addText = [&add](const CString& text) { add(std::hash<std::string_view>{}(text.View())); };
    add(style.GetControl());
    add(style.GetInterior());
    add(style.GetReadOnly());
    add(static_cast<std::size_t>(style.GetHorizontalAlignment()));
    addText(style.GetValue());
    addText(style.GetChoiceList());
    addText(style.GetUserAttribute(GX_IDS_UA_TOOLTIPTEXT));
    return hash;
}

} // namespace

StylePool::StylePool() {
    intern(CGXStyle());
}

StyleId StylePool::layOver(StyleId lower, const CGXStyle& upper) {
    if (lower == lastLower_ && upper == lastUpper_)
        return lastResult_;
    CGXStyle laid = styles_[lower];
    laid.ChangeStyle(upper);
    lastResult_ = intern(laid);
    lastLower_ = lower;
    lastUpper_ = upper;
    return lastResult_;
}

StyleId StylePool::intern(const CGXStyle& style) {
    const std::size_t hash = hashOf(style);
    const auto [begin, end] = byHash_.equal_range(hash);
    for (auto found = begin; found != end; ++found)
        if (styles_[found->second] == style)
            return found->second;
    styles_.push_back(style);
    const auto id = static_cast<StyleId>(styles_.size() - 1);
    byHash_.emplace(hash, id);
    return id;
}

} // namespace kota::grid
