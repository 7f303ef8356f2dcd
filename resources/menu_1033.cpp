#include "resources/menu_tree.h"
#include "resources/texts.h"

namespace {

constexpr MenuTexts english{
    .file = "&File",
    .fileNew = "&New\tCtrl+N",
    .fileOpen = "&Open...\tCtrl+O",
    .fileClose = "&Close",
    .fileSave = "&Save\tCtrl+S",
    .fileSaveAs = "Save &As...",
    .filePrint = "&Print...\tCtrl+P",
    .filePrintPreview = "Print Pre&view",
    .filePrintSetup = "P&rint Setup...",
    .recentFile = "Recent File",
    .dataUtility = "Data Utility...",
    .exit = "E&xit",
    .edit = "&Edit",
    .undo = "&Undo\tCtrl+Z",
    .cut = "Cu&t\tCtrl+X",
    .copy = "&Copy\tCtrl+C",
    .paste = "&Paste\tCtrl+V",
    .view = "&View",
    .toolbar = "&Toolbar...",
    .statusBar = "&Status Bar",
    .grid = "&Grid",
    .insertLine = "&Insert line\tIns",
    .deleteLine = "&Delete line\tDel",
    .search = "&Search\tF7",
    .findNext = "Find &next\tF3",
    .gotoLine = "Go &to...",
    .window = "&Window",
    .newWindow = "&New Window",
    .cascade = "&Cascade",
    .tile = "&Tile",
    .arrangeIcons = "&Arrange Icons",
    .help = "&Help",
    .helpTopics = "&Help Topics...",
    .about = "&About KOTAHub...",
};

} // namespace

std::span<const kota::MenuTemplate> englishMenus() {
    return MenuTree<english>::all;
}
