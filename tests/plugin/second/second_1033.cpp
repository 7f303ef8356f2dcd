#include "platform/framework/messages.h"
#include "platform/framework/resources.h"
#include "tests/plugin/second/ids.h"

namespace {

// The name of the tool bar and the document's names are left to the module.
constexpr kota::StringResource strings[] = {
    {Second::EditorName, "Translated name"},
    {Second::Command, "Translated prompt.\nTranslated tip"},
};

// A whole menu bar, none of whose captions is the shell's.
constexpr kota::MenuItemTemplate files[] = {{}, {ID_FILE_PRINT, "&Sortie"}, {ID_FILE_CLOSE, "&Au revoir"}};
constexpr kota::MenuItemTemplate edits[] = {{ID_EDIT_UNDO, "&Annuler"}};
constexpr kota::MenuItemTemplate views[] = {{ID_VIEW_STATUS_BAR, "&Etat"}};
constexpr kota::MenuItemTemplate items[] = {{Second::Command, "&Translated command"}, {}};
constexpr kota::MenuItemTemplate windows[] = {{ID_WINDOW_NEW, "&Nouvelle"}};
constexpr kota::MenuItemTemplate helps[] = {{ID_HELP_INDEX, "&Sujets"}, {ID_APP_ABOUT, "A &propos"}};
constexpr kota::MenuPopupTemplate popups[] = {{"Fi&chier", files},   {"E&dition", edits},
                                              {"A&ffichage", views}, {"&Translated", items},
                                              {"Fe&netre", windows}, {"A&ide", helps}};
constexpr kota::MenuTemplate menus[] = {{.id = Second::Document, .popups = popups}};

constexpr kota::Resources resources{.strings = strings, .menus = menus};

} // namespace

extern "C" KOTA_EXPORT const kota::Resources* KotaResources();

const kota::Resources* KotaResources() {
    return &resources;
}
