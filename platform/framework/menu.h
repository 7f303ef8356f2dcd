#pragma once

#include "platform/framework/export.h"
#include "platform/framework/text.h"
#include "platform/framework/types.h"

#include <memory>
#include <vector>

inline constexpr UINT MF_ENABLED = 0x0000;
inline constexpr UINT MF_GRAYED = 0x0001;
inline constexpr UINT MF_BYCOMMAND = 0x0000;
inline constexpr UINT MF_BYPOSITION = 0x0400;

// A menu: entries in their order, each with a command or with a menu of its own.
class KOTA_API CMenu {
public:
    struct Entry {
        CString text; // "&" marks the access key, a tab stands before the shortcut; empty for a separator
        UINT id = 0;  // the command; 0 for a separator and for a submenu
        bool enabled = true;
        std::unique_ptr<CMenu> submenu;
    };

    struct Command {
        UINT id;
        CString text;
    };

    CMenu();
    ~CMenu();
    CMenu(const CMenu&) = delete;
    CMenu& operator=(const CMenu&) = delete;

    // Takes all entries out.
    void Clear();
    void AppendMenu(UINT id, const char* text, UINT flags = MF_ENABLED);
    void AppendSeparator();
    // The menu behind the new entry, owned by this one.
    CMenu& AppendPopup(const char* text);

    // Puts commands in the place of those from `first` to before `end` that stand together, at any depth.
    void ReplaceCommands(UINT first, UINT end, const std::vector<Command>& commands);
    // Enables an entry or greys it: that at a zero-based place of this menu (MF_BYPOSITION), or that of a
    // command, at any depth. Gives the state before (MF_ENABLED or MF_GRAYED), -1 when there is no such
    // entry.
    int EnableMenuItem(UINT item, UINT flags);
    int GetMenuItemCount() const { return static_cast<int>(entries_.size()); }
    const std::vector<Entry>& Entries() const { return entries_; }

private:
    Entry* Find(UINT item, bool byPosition);

    std::vector<Entry> entries_;
};
