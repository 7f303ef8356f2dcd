#include "hub/shell/menu.h"

#include "platform/framework/messages.h"

namespace kota::hub {

namespace {

constexpr UINT dataUtility = 32773;

constexpr MenuItemTemplate fileItems[] = {
    {ID_FILE_NEW, "&New\tCtrl+N"},
    {ID_FILE_OPEN, "&Open...\tCtrl+O"},
    {ID_FILE_CLOSE, "&Close"},
    {ID_FILE_SAVE, "&Save\tCtrl+S"},
    {ID_FILE_SAVE_AS, "Save &As..."},
    {},
    {ID_FILE_MRU_FILE1, "Recent File", true},
    {},
    {dataUtility, "Data Utility...", true},
    {},
    {ID_APP_EXIT, "E&xit\tCtrl+Q"},
};

constexpr MenuItemTemplate editItems[] = {
    {ID_EDIT_UNDO, "&Undo\tCtrl+Z"},   {}, {ID_EDIT_CUT, "Cu&t\tCtrl+X"}, {ID_EDIT_COPY, "&Copy\tCtrl+C"},
    {ID_EDIT_PASTE, "&Paste\tCtrl+V"},
};

constexpr MenuItemTemplate viewItems[] = {
    {ID_VIEW_TOOLBAR, "&Toolbar"},
    {ID_VIEW_STATUS_BAR, "&Status Bar"},
};

constexpr MenuItemTemplate windowItems[] = {
    {ID_WINDOW_NEW, "&New Window"},
    {ID_WINDOW_CASCADE, "&Cascade"},
    {ID_WINDOW_TILE_HORZ, "&Tile"},
    {ID_WINDOW_ARRANGE, "&Arrange Icons"},
};

constexpr MenuItemTemplate helpItems[] = {{ID_APP_ABOUT, "&About KOTAHub..."}};

constexpr MenuPopupTemplate popups[] = {
    {"&File", fileItems},     {"&Edit", editItems}, {"&View", viewItems},
    {"&Window", windowItems}, {"&Help", helpItems},
};
constexpr MenuTemplate menu{.id = 1, .popups = popups};

constexpr Accelerator keys[] = {
    {.key = 'N', .command = ID_FILE_NEW, .control = true},
    {.key = 'O', .command = ID_FILE_OPEN, .control = true},
    {.key = 'Q', .command = ID_APP_EXIT, .control = true},
};
constexpr AcceleratorTable keyTable{.id = 1, .keys = keys};

constexpr StringResource prompts[] = {
    {ID_FILE_NEW, "Create a new document."},
    {ID_FILE_OPEN, "Open an existing document."},
    {ID_FILE_CLOSE, "Close the document and all its windows."},
    {ID_FILE_SAVE, "Save the document."},
    {ID_FILE_SAVE_AS, "Save the document under another name."},
    {ID_FILE_MRU_FILE1, "Open this document."},
    {ID_APP_EXIT, "Close all documents and end the program."},
    {ID_EDIT_UNDO, "Undo the last action."},
    {ID_EDIT_CUT, "Move the selection to the clipboard."},
    {ID_EDIT_COPY, "Copy the selection to the clipboard."},
    {ID_EDIT_PASTE, "Insert what is on the clipboard."},
    {ID_VIEW_TOOLBAR, "Show or hide the tool bar."},
    {ID_VIEW_STATUS_BAR, "Show or hide the status bar."},
    {ID_WINDOW_NEW, "Open another window of the document."},
    {ID_WINDOW_CASCADE, "Arrange the windows so that they overlap."},
    {ID_WINDOW_TILE_HORZ, "Arrange the windows beside one another."},
    {ID_WINDOW_ARRANGE, "Show the windows that are reduced to icons."},
    {ID_APP_ABOUT, "Show the program's version and its editors."},
};

} // namespace

const Module& hubModule() {
    static const Module module("kota_hub", {.strings = prompts});
    return module;
}
const MenuTemplate& hubMenu() {
    return menu;
}
const AcceleratorTable& hubKeys() {
    return keyTable;
}

} // namespace kota::hub
