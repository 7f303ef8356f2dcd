#include "platform/framework/menu.h"

#include <utility>

CMenu::CMenu() = default;
CMenu::~CMenu() = default;

void CMenu::AppendMenu(UINT id, const char* text) {
    entries_.push_back({.text = text, .id = id, .enabled = true, .submenu = nullptr});
}

void CMenu::AppendSeparator() {
    entries_.push_back({});
}

CMenu& CMenu::AppendPopup(const char* text) {
    entries_.push_back({.text = text, .id = 0, .enabled = true, .submenu = std::make_unique<CMenu>()});
    return *entries_.back().submenu;
}

CMenu::Entry* CMenu::Find(UINT item, bool byPosition) {
    if (byPosition)
        return item < entries_.size() ? &entries_[item] : nullptr;
    for (Entry& entry : entries_) {
        if (entry.id == item && item != 0)
            return &entry;
        if (Entry* const deeper = entry.submenu ? entry.submenu->Find(item, false) : nullptr)
            return deeper;
    }
    return nullptr;
}

int CMenu::EnableMenuItem(UINT item, UINT flags) {
    Entry* const entry = Find(item, (flags & MF_BYPOSITION) != 0);
    if (!entry)
        return -1;
    const bool wasEnabled = std::exchange(entry->enabled, (flags & MF_GRAYED) == 0);
    return static_cast<int>(wasEnabled ? MF_ENABLED : MF_GRAYED);
}
