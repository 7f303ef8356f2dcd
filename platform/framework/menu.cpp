#include "platform/framework/menu.h"

#include <algorithm>
#include <iterator>
#include <utility>

CMenu::CMenu() = default;
CMenu::~CMenu() = default;

void CMenu::Clear() {
    entries_.clear();
}

void CMenu::AppendMenu(UINT id, const char* text, UINT flags) {
    entries_.push_back({.text = text, .id = id, .enabled = (flags & MF_GRAYED) == 0, .submenu = nullptr});
}

void CMenu::AppendSeparator() {
    entries_.push_back({});
}

CMenu& CMenu::AppendPopup(const char* text) {
    entries_.push_back({.text = text, .id = 0, .enabled = true, .submenu = std::make_unique<CMenu>()});
    return *entries_.back().submenu;
}

void CMenu::ReplaceCommands(UINT first, UINT end, const std::vector<Command>& commands) {
    const auto isOne = [&](const Entry& entry) { return entry.id >= first && entry.id < end; };
    const auto from = std::ranges::find_if(entries_, isOne);
    if (from == entries_.end()) {
        for (Entry& entry : entries_)
            if (entry.submenu)
                entry.submenu->ReplaceCommands(first, end, commands);
        return;
    }
    auto place = entries_.erase(from, std::find_if_not(from, entries_.end(), isOne));
    for (const Command& command : commands)
        place = std::next(entries_.insert(
            place, Entry{.text = command.text, .id = command.id, .enabled = true, .submenu = nullptr}));
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
