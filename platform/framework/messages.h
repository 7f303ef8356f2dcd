#pragma once

#include "platform/framework/types.h"

// The numbers of the framework's messages, notifications, keys and commands, as far as the system uses them.

inline constexpr UINT WM_SETFOCUS = 0x0007;  // wParam: the window that had the focus
inline constexpr UINT WM_KILLFOCUS = 0x0008; // wParam: the window that gets it
inline constexpr UINT WM_CLOSE = 0x0010;
inline constexpr UINT WM_HELP = 0x0053;
inline constexpr UINT WM_KEYDOWN = 0x0100; // wParam: a VK_ key
inline constexpr UINT WM_COMMAND =
    0x0111; // wParam: commandParam(id, notification); lParam: the control's handle
inline constexpr UINT WM_MOUSEMOVE = 0x0200;
inline constexpr UINT WM_LBUTTONDOWN = 0x0201;
inline constexpr UINT WM_LBUTTONUP = 0x0202;

inline constexpr UINT EM_LIMITTEXT = 0x00C5;   // wParam: characters that a user may type, 0 for any number
inline constexpr UINT CB_GETCURSEL = 0x0147;   // gives the chosen entry from 0, -1 for none
inline constexpr UINT CB_SETCURSEL = 0x014E;   // wParam: the entry; an entry that is not there chooses none
inline constexpr UINT TTM_RELAYEVENT = 0x0407; // lParam: the MSG of a tool

// What a control tells its parent by WM_COMMAND.
inline constexpr int BN_CLICKED = 0;
inline constexpr int CBN_SELCHANGE = 1;
inline constexpr int EN_SETFOCUS = 0x0100;
inline constexpr int EN_KILLFOCUS = 0x0200;
inline constexpr int EN_CHANGE = 0x0300;

inline constexpr WPARAM VK_BACK = 8;
inline constexpr WPARAM VK_TAB = 9;
inline constexpr WPARAM VK_RETURN = 13;
inline constexpr WPARAM VK_SHIFT = 16;
inline constexpr WPARAM VK_CONTROL = 17;
inline constexpr WPARAM VK_MENU = 18;
inline constexpr WPARAM VK_ESCAPE = 27;
inline constexpr WPARAM VK_SPACE = 32;
inline constexpr WPARAM VK_PRIOR = 33;
inline constexpr WPARAM VK_NEXT = 34;
inline constexpr WPARAM VK_END = 35;
inline constexpr WPARAM VK_HOME = 36;
inline constexpr WPARAM VK_LEFT = 37;
inline constexpr WPARAM VK_UP = 38;
inline constexpr WPARAM VK_RIGHT = 39;
inline constexpr WPARAM VK_DOWN = 40;
inline constexpr WPARAM VK_INSERT = 45;
inline constexpr WPARAM VK_DELETE = 46;
inline constexpr WPARAM VK_F1 = 112;
inline constexpr WPARAM VK_F2 = 113;
inline constexpr WPARAM VK_F3 = 114;
inline constexpr WPARAM VK_F4 = 115;
inline constexpr WPARAM VK_F6 = 117;
inline constexpr WPARAM VK_F7 = 118;

inline constexpr UINT ID_FILE_NEW = 57600;
inline constexpr UINT ID_FILE_OPEN = 57601;
inline constexpr UINT ID_FILE_CLOSE = 57602;
inline constexpr UINT ID_FILE_SAVE = 57603;
inline constexpr UINT ID_FILE_SAVE_AS = 57604;
inline constexpr UINT ID_FILE_PRINT_SETUP = 57606;
inline constexpr UINT ID_FILE_PRINT = 57607;
inline constexpr UINT ID_FILE_PRINT_DIRECT = 57608;
inline constexpr UINT ID_FILE_PRINT_PREVIEW = 57609;
inline constexpr UINT ID_FILE_MRU_FILE1 = 57616; // and those behind it: the files used last
inline constexpr UINT ID_EDIT_COPY = 57634;
inline constexpr UINT ID_EDIT_CUT = 57635;
inline constexpr UINT ID_EDIT_PASTE = 57637;
inline constexpr UINT ID_EDIT_UNDO = 57643;
inline constexpr UINT ID_WINDOW_NEW = 57648;
inline constexpr UINT ID_WINDOW_ARRANGE = 57649;
inline constexpr UINT ID_WINDOW_CASCADE = 57650;
inline constexpr UINT ID_WINDOW_TILE_HORZ = 57651;
inline constexpr UINT ID_APP_ABOUT = 57664;
inline constexpr UINT ID_APP_EXIT = 57665;
inline constexpr UINT ID_HELP_INDEX = 57667;
inline constexpr UINT ID_HELP = 57670;
inline constexpr UINT ID_NEXT_PANE = 57680;
inline constexpr UINT ID_PREV_PANE = 57681;
inline constexpr UINT ID_VIEW_TOOLBAR = 59392;
inline constexpr UINT ID_VIEW_STATUS_BAR = 59393;

// wParam of WM_COMMAND. A menu's or an accelerator's command has the notification 0.
constexpr WPARAM commandParam(UINT id, int notification) {
    return (static_cast<WPARAM>(notification) << 16) | id;
}
constexpr UINT commandId(WPARAM wParam) {
    return static_cast<UINT>(wParam & 0xFFFF);
}
constexpr int commandNotification(WPARAM wParam) {
    return static_cast<int>(wParam >> 16);
}
