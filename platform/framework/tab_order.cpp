#include "platform/framework/tab_order.h"

#include <algorithm>
#include <vector>

namespace kota {

namespace {

void collect(const CWnd& window, std::vector<CWnd*>& stops) {
    for (const HWND handle : window.State()->children) {
        CWnd* const child = CWnd::FromHandle(handle);
        if (!child->State()->visible)
            continue;
        if (stopsAtTab(*child))
            stops.push_back(child);
        collect(*child, stops);
    }
}

std::vector<CWnd*> stopsOf(const CWnd& dialog) {
    std::vector<CWnd*> stops;
    if (dialog.State())
        collect(dialog, stops);
    return stops;
}

} // namespace

bool stopsAtTab(const CWnd& window) {
    switch (window.State()->setup.kind) {
    case WindowKind::Edit:
    case WindowKind::PushButton:
    case WindowKind::CheckBox:
    case WindowKind::ComboBox:
    case WindowKind::Grid:
        return window.IsWindowEnabled() && window.IsWindowVisible();
    case WindowKind::RadioButton: // of a group, the checked one alone
        return window.State()->checked && window.IsWindowEnabled() && window.IsWindowVisible();
    default:
        return false;
    }
}

std::vector<CWnd*> radioGroupOf(const CWnd& radio) {
    std::vector<CWnd*> group;
    bool isHere = false;
    for (const HWND handle : radio.GetParent()->State()->children) {
        CWnd* const sibling = CWnd::FromHandle(handle);
        const bool isRadio = sibling->State()->setup.kind == WindowKind::RadioButton;
        if (!isRadio || sibling->State()->startsGroup) {
            if (isHere)
                break;
            group.clear();
        }
        if (isRadio)
            group.push_back(sibling);
        isHere = isHere || sibling == &radio;
    }
    return group;
}

CWnd* firstInTabOrder(const CWnd& dialog) {
    const std::vector<CWnd*> stops = stopsOf(dialog);
    return stops.empty() ? nullptr : stops.front();
}

CWnd* nextInTabOrder(const CWnd& dialog, const CWnd& from, bool backward) {
    const std::vector<CWnd*> stops = stopsOf(dialog);
    const auto here = std::ranges::find(stops, &from);
    if (stops.empty() || here == stops.end())
        return stops.empty() ? nullptr : stops.front();
    const std::size_t place = static_cast<std::size_t>(here - stops.begin());
    const std::size_t next = (place + (backward ? stops.size() - 1 : 1)) % stops.size();
    return next == place ? nullptr : stops[next];
}

} // namespace kota
