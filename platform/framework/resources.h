#pragma once

#include "platform/framework/dialog_template.h"
#include "platform/framework/types.h"

#include <span>

// What a library brings along for its user interface, as constant tables.
namespace kota {

// One row of a string table. The string of a command's number is its prompt in the status bar and, behind a
// line feed, its tool tip.
struct StringResource {
    UINT id;
    const char* text;
};

// An entry of a menu; a separator without a number.
struct MenuItemTemplate {
    UINT id = 0;
    const char* text = ""; // "&" marks the access key, a tab stands before the shortcut
    bool greyed = false;   // whatever its handler
};

struct MenuPopupTemplate {
    const char* text;
    std::span<const MenuItemTemplate> items;
};

// A menu bar.
struct MenuTemplate {
    UINT id;
    std::span<const MenuPopupTemplate> popups;
};

// A key, alone or with others held, that runs a command.
struct Accelerator {
    WPARAM key = 0; // a VK_ key, or a capital letter
    UINT command = 0;
    bool control = false;
    bool shift = false;
    bool alt = false;
};

struct AcceleratorTable {
    UINT id;
    std::span<const Accelerator> keys;
};

// A tool bar: its commands in their order, 0 for a gap. The bitmap of the same number has a button's picture
// for each command, beside one another.
struct ToolBarTemplate {
    UINT id;
    int buttonWidth; // in pixels of a screen without scaling
    int buttonHeight;
    std::span<const UINT> commands;
};

// A picture in the text form of X pixmaps, version 3: size, colours, rows.
struct BitmapResource {
    UINT id;
    std::span<const char* const> rows;
};

struct Resources {
    std::span<const StringResource> strings = {};
    std::span<const DialogTemplate> dialogs = {};
    std::span<const MenuTemplate> menus = {};
    std::span<const AcceleratorTable> accelerators = {};
    std::span<const ToolBarTemplate> toolBars = {};
    std::span<const BitmapResource> bitmaps = {};
    std::span<const BitmapResource> icons = {};
};

} // namespace kota
