#pragma once

#include "platform/framework/window_state.h"

#include <span>

namespace kota {

// One thing in a dialog: what it is and what it says, not where it stands. A screen lays a dialog out for its
// font and language: items stand below one another, those of a row beside one another, and grids take the
// room that is left.
struct DialogItem {
    WindowKind kind = WindowKind::Label;
    UINT id = 0;                            // 0 for what no code asks for
    const char* caption = "";               // "&" marks the access key
    std::span<const DialogItem> items = {}; // inside a group or a row
    const char* choices = "";               // of a combo box: its entries, joined by line feeds
    bool enabled = true;
    bool visible = true;
    bool startsGroup = false; // of radio buttons
};

// A dialog of a module, known by its number.
struct DialogTemplate {
    UINT id = 0;
    const char* caption = "";
    std::span<const DialogItem> items = {};
};

constexpr DialogItem label(const char* caption) {
    return {.kind = WindowKind::Label, .caption = caption};
}
constexpr DialogItem group(const char* caption, std::span<const DialogItem> items) {
    return {.kind = WindowKind::Group, .caption = caption, .items = items};
}
constexpr DialogItem row(std::span<const DialogItem> items) {
    return {.kind = WindowKind::Row, .items = items};
}
constexpr DialogItem control(WindowKind kind, UINT id, const char* caption = "") {
    return {.kind = kind, .id = id, .caption = caption};
}
// An edit with its label in front.
constexpr DialogItem field(const char* caption, UINT id) {
    return {.kind = WindowKind::Edit, .id = id, .caption = caption};
}

} // namespace kota
