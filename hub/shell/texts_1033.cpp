#include "hub/shell/commands.h"
#include "hub/shell/menu_tree.h"
#include "hub/shell/texts.h"

namespace kota::hub {

namespace {

constexpr MenuTexts menu{
    .file = "&File",
    .fileNew = "&New\tCtrl+N",
    .fileOpen = "&Open...\tCtrl+O",
    .fileClose = "&Close",
    .fileSave = "&Save\tCtrl+S",
    .fileSaveAs = "Save &As...",
    .recentFile = "Recent File",
    .openProject = "Open &Project...",
    .closeProject = "Close Pro&ject",
    .dataUtility = "Data Utility...",
    .settings = "Se&ttings...",
    .exit = "E&xit\tCtrl+Q",
    .edit = "&Edit",
    .undo = "&Undo\tCtrl+Z",
    .cut = "Cu&t\tCtrl+X",
    .copy = "&Copy\tCtrl+C",
    .paste = "&Paste\tCtrl+V",
    .view = "&View",
    .toolbar = "&Toolbar",
    .statusBar = "&Status Bar",
    .riverMap = "River &Map",
    .exchange = "&Exchange",
    .window = "&Window",
    .newWindow = "&New Window",
    .cascade = "&Cascade",
    .tile = "&Tile",
    .arrangeIcons = "&Arrange Icons",
    .help = "&Help",
    .about = "&About KOTAHub...",
};

constexpr UINT id(HubText text) {
    return static_cast<UINT>(text);
}

constexpr StringResource strings[] = {
    {id(HubText::NoEditorFor), "%1 cannot be opened: no editor here is for files of its kind."},
    {id(HubText::New), "New"},
    {id(HubText::WhatKind), "What kind of document?"},
    {id(HubText::About), "About KOTAHub"},
    {id(HubText::VersionAndEditors), "KOTAHub %1\n\nEditors: %2"},
    {id(HubText::NoEditors), "none"},
    {id(HubText::NotLoaded), "%1 could not be loaded: %2"},
    {id(HubText::NoEditorIn), "There is no editor in %1."},
    {id(HubText::RecentFile), "Recent File"},
    {id(HubText::RiverMap), "River Map"},
    {id(HubText::Exchange), "Exchange"},
    {id(HubText::RiverNetworks), "River networks"},
    {id(HubText::Filter), "Show what contains..."},
    {id(HubText::CopyMessages), "Copy"},
    {id(HubText::ClearMessages), "Clear"},
    {id(HubText::ColumnTime), "Time"},
    {id(HubText::ColumnCode), "Code"},
    {id(HubText::ColumnMeaning), "Meaning"},
    {id(HubText::ColumnSender), "Sender"},
    {id(HubText::ColumnRiver), "River"},
    {id(HubText::ColumnChainage), "Chainage (m)"},
    {id(HubText::ColumnData), "Data"},
    {id(HubText::LeavesProject), "leaves the project"},
    {id(HubText::JoinsProject), "asks for the project"},
    {id(HubText::AsksForRivers), "asks for the rivers"},
    {id(HubText::AsksForLocation), "asks for a location"},
    {id(HubText::LocationChanged), "location changed"},
    {id(HubText::DataChanged), "data changed"},
    {id(HubText::ShowsToolBar), "shows its tool bar"},
    {id(HubText::HidesToolBar), "hides its tool bar"},
    {id(HubText::UnknownCode), "unknown"},
    {id(HubText::DataInit), "Init"},
    {id(HubText::DataSediment), "Sediment"},
    {id(HubText::DataNonCohesive), "Non Cohesive"},
    {id(HubText::DataLayer), "Layer"},
    {id(HubText::DataDecay), "Decay"},
    {id(HubText::DataDispersion), "Dispersion"},
    {id(HubText::DataIce), "Ice Data"},
    {id(HubText::DataBoundary), "Boundary"},
    {id(HubText::Settings), "Settings"},
    {id(HubText::Language), "Language"},
    {id(HubText::LanguageOfEnvironment), "as the system"},
    {id(HubText::DisplayUnits), "Display units"},
    {id(HubText::UnitChainage), "Chainage"},
    {id(HubText::UnitWidth), "Width"},
    {id(HubText::UnitLayerHeight), "Layer height"},
    {id(HubText::UnitRate), "First-order rate"},
    {id(HubText::AtNextStart), "Changes take effect at the next start."},
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
    {HubCommand::OpenProject, "Open a river network as the project."},
    {HubCommand::CloseProject, "Close the project. Documents stay open."},
    {HubCommand::Settings, "Choose the language and the display units."},
    {HubCommand::ShowMap, "Show or hide the river map."},
    {HubCommand::ShowExchange, "Show or hide the messages of the editors."},
};

} // namespace

const Resources& englishTexts() {
    static const Resources texts{.strings = strings, .menus = MenuTree<menu>::all};
    return texts;
}

} // namespace kota::hub
