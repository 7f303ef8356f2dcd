#pragma once

#include "hub/shell/commands.h"
#include "platform/framework/messages.h"
#include "platform/framework/module.h"

namespace kota::hub {

// What the shell's menu says in one language: "&" marks an access key, a tab stands before the shortcut.
struct MenuTexts {
    const char* file;
    const char* fileNew;
    const char* fileOpen;
    const char* fileClose;
    const char* fileSave;
    const char* fileSaveAs;
    const char* recentFile;
    const char* openProject;
    const char* closeProject;
    const char* dataUtility;
    const char* settings;
    const char* exit;
    const char* edit;
    const char* undo;
    const char* cut;
    const char* copy;
    const char* paste;
    const char* view;
    const char* toolbar;
    const char* statusBar;
    const char* riverMap;
    const char* exchange;
    const char* window;
    const char* newWindow;
    const char* cascade;
    const char* tile;
    const char* arrangeIcons;
    const char* help;
    const char* about;
};

// The menu with the texts of a language.
template <const MenuTexts& text>
class MenuTree {
    static constexpr MenuItemTemplate fileItems[] = {
        {ID_FILE_NEW, text.fileNew},
        {ID_FILE_OPEN, text.fileOpen},
        {ID_FILE_CLOSE, text.fileClose},
        {ID_FILE_SAVE, text.fileSave},
        {ID_FILE_SAVE_AS, text.fileSaveAs},
        {},
        {ID_FILE_MRU_FILE1, text.recentFile, true},
        {},
        {HubCommand::OpenProject, text.openProject},
        {HubCommand::CloseProject, text.closeProject},
        {},
        {HubCommand::DataUtility, text.dataUtility, true},
        {HubCommand::Settings, text.settings},
        {},
        {ID_APP_EXIT, text.exit},
    };

    static constexpr MenuItemTemplate editItems[] = {
        {ID_EDIT_UNDO, text.undo},   {}, {ID_EDIT_CUT, text.cut}, {ID_EDIT_COPY, text.copy},
        {ID_EDIT_PASTE, text.paste},
    };

    static constexpr MenuItemTemplate viewItems[] = {
        {ID_VIEW_TOOLBAR, text.toolbar},      {ID_VIEW_STATUS_BAR, text.statusBar},      {},
        {HubCommand::ShowMap, text.riverMap}, {HubCommand::ShowExchange, text.exchange},
    };

    static constexpr MenuItemTemplate windowItems[] = {
        {ID_WINDOW_NEW, text.newWindow},
        {ID_WINDOW_CASCADE, text.cascade},
        {ID_WINDOW_TILE_HORZ, text.tile},
        {ID_WINDOW_ARRANGE, text.arrangeIcons},
    };

    static constexpr MenuItemTemplate helpItems[] = {{ID_APP_ABOUT, text.about}};

    static constexpr MenuPopupTemplate popups[] = {
        {text.file, fileItems},     {text.edit, editItems}, {text.view, viewItems},
        {text.window, windowItems}, {text.help, helpItems},
    };

public:
    static constexpr MenuTemplate all[] = {{.id = 1, .popups = popups}};
};

} // namespace kota::hub
