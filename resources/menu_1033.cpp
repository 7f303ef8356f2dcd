#include "platform/framework/messages.h"
#include "resources/ids.h"
#include "resources/menu.h"

namespace {

constexpr kota::MenuItemTemplate fileItems[] = {
    {ID_FILE_NEW, "&New\tCtrl+N"},
    {ID_FILE_OPEN, "&Open...\tCtrl+O"},
    {ID_FILE_CLOSE, "&Close"},
    {ID_FILE_SAVE, "&Save\tCtrl+S"},
    {ID_FILE_SAVE_AS, "Save &As..."},
    {},
    {ID_FILE_PRINT, "&Print...\tCtrl+P"},
    {ID_FILE_PRINT_PREVIEW, "Print Pre&view"},
    {ID_FILE_PRINT_SETUP, "P&rint Setup..."},
    {},
    {ID_FILE_MRU_FILE1, "Recent File", true},
    {},
    {CommandId::DataUtility, "Data Utility..."},
    {},
    {ID_APP_EXIT, "E&xit"},
};

constexpr kota::MenuItemTemplate editItems[] = {
    {ID_EDIT_UNDO, "&Undo\tCtrl+Z"},   {}, {ID_EDIT_CUT, "Cu&t\tCtrl+X"}, {ID_EDIT_COPY, "&Copy\tCtrl+C"},
    {ID_EDIT_PASTE, "&Paste\tCtrl+V"},
};

constexpr kota::MenuItemTemplate viewItems[] = {
    {ID_VIEW_TOOLBAR, "&Toolbar..."},
    {ID_VIEW_STATUS_BAR, "&Status Bar"},
};

constexpr kota::MenuItemTemplate gridItems[] = {
    {CommandId::InsertLine, "&Insert line\tIns"},
    {CommandId::DeleteLine, "&Delete line\tDel"},
    {},
    {CommandId::Search, "&Search\tF7"},
    {CommandId::FindNext, "Find &next\tF3"},
    {CommandId::GotoLine, "Go &to..."},
};

constexpr kota::MenuItemTemplate windowItems[] = {
    {ID_WINDOW_NEW, "&New Window"},
    {ID_WINDOW_CASCADE, "&Cascade"},
    {ID_WINDOW_TILE_HORZ, "&Tile"},
    {ID_WINDOW_ARRANGE, "&Arrange Icons"},
};

constexpr kota::MenuItemTemplate helpItems[] = {
    {ID_HELP_INDEX, "&Help Topics..."},
    {},
    {ID_APP_ABOUT, "&About KOTAHub..."},
};

constexpr kota::MenuPopupTemplate popups[] = {
    {"&File", fileItems}, {"&Edit", editItems},     {"&View", viewItems},
    {"&Grid", gridItems}, {"&Window", windowItems}, {"&Help", helpItems},
};

constexpr kota::MenuTemplate menus[] = {{.id = MenuId::Document, .popups = popups}};

} // namespace

std::span<const kota::MenuTemplate> englishMenus() {
    return menus;
}
