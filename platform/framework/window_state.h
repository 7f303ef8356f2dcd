#pragma once

#include "platform/framework/text.h"
#include "platform/framework/types.h"

#include <vector>

// A handle of a window: a number that is never used twice, so that a handle kept across a message can be
// checked. Null is none.
struct WindowHandle;
using HWND = WindowHandle*;

class CWnd;

// A rectangle, in the pixels of a screen without scaling.
struct CRect {
    int left = 0;
    int top = 0;
    int right = 0;
    int bottom = 0;

    constexpr int Width() const { return right - left; }
    constexpr int Height() const { return bottom - top; }
    friend bool operator==(const CRect&, const CRect&) = default;
};

namespace kota {

// What kind of thing a window is to the user, and so what it does by itself with input and messages.
enum class WindowKind {
    Plain,
    Label,
    Group,
    Row,
    Edit,
    PushButton,
    CheckBox,
    RadioButton,
    ComboBox,
    Tabs,
    Grid,
    Page,
    Dialog,
    Sheet,
    View,
    Frame,
    ToolBar,
};

// What a window is made with.
struct WindowSetup {
    HWND parent = nullptr; // null: a window of its own
    UINT id = 0;           // its number among the parent's controls
    WindowKind kind = WindowKind::Plain;
};

// All that is known of a window; what a screen draws it from. Changed through CWnd alone.
struct WindowState {
    CWnd* object = nullptr; // null until somebody asks for one
    WindowSetup setup;
    std::vector<HWND> children; // in the order in which they were made, which is that of the Tab key
    CString text;
    CString label; // of edits and combo boxes: what stands in front of them
    CString toolTip;
    unsigned style = 0;
    unsigned extendedStyle = 0;
    CRect rect;          // in the parent; a wish, since a screen lays windows out by their contents
    bool enabled = true; // by itself: it takes input only while all windows around it do
    bool visible = true;
    bool startsGroup = false;     // of radio buttons: the first of those that belong together
    bool modified = false;        // of frames: its document has changes that are not saved
    bool checked = false;         // of check boxes and radio buttons
    int textLimit = 0;            // of edits: characters that a user may type, 0 for any number
    std::vector<CString> choices; // of combo boxes
    int chosen = -1;              // of combo boxes and tabs; -1 for none
};

// What of a window changed since the screen was told last.
enum class Change : unsigned {
    Made = 1,       // the window is new
    Gone = 2,       // the window is no more
    Text = 4,       // text or tool tip
    State = 8,      // enabled, visible, checked, how much may be typed
    Choices = 16,   // choices or which is chosen
    Focus = 32,     // it has or had the focus
    Menu = 64,      // the window's menu
    Raised = 128,   // it wants to be in front
    Contents = 256, // what only the object itself can tell: of a grid, of a sheet
};

} // namespace kota
