// What holds of windows and boxes.
#include "editing/dlg_property_sheet.h"
#include "platform/framework/frame.h"
#include "tests/random/invariants.h"

#include <algorithm>

namespace kota::random_user {

namespace {

constexpr int tabCount = 9;

void checkSheet(const CKota0_adView& view) {
    const CPropertySheet* const sheet = view.Sheet();
    if (!sheet || sheet->GetPageCount() != tabCount || !sheet->GetActivePage())
        throw Broken("a window has nine tabs: one of them in front");
    for (int index = 0; index < tabCount; ++index) {
        const CPropertyPage* const page = sheet->GetPage(index);
        const bool isInFront = index == sheet->GetActiveIndex();
        if (page->GetSafeHwnd() ? (page->State()->visible != isInFront) : isInFront)
            throw Broken("the page in front alone is seen: " + std::string(page->GetCaption().View()));
    }
    const CWnd* const tabs = sheet->GetTabControl();
    if (!tabs || tabs->State()->chosen != sheet->GetActiveIndex())
        throw Broken("the tab of the page in front is chosen: " + std::to_string(sheet->GetActiveIndex()));
}

void checkFocus(Stage& stage) {
    const CWnd* const focus = CWnd::GetFocus();
    if (!focus)
        return;
    if (!focus->IsWindowVisible() || !focus->IsWindowEnabled())
        throw Broken("the focus is with a window that is seen and enabled: kind " +
                     std::to_string(static_cast<int>(focus->State()->setup.kind)));
    const CFrameWnd* const frame = focus->GetParentFrame();
    const bool isInAFrame = frame && frame != &stage.session().mainWindow();
    const bool isBehind = isInAFrame && frame != stage.front();
    // A text that was refused keeps the focus where it is, for as long as the focus does not move.
    const auto* const grid = dynamic_cast<const CGXGridCore*>(focus);
    if (!isBehind || (grid && grid->IsEditPending()))
        stage.keptFocus = isBehind ? focus->GetSafeHwnd() : nullptr;
    if (isBehind && stage.keptFocus != focus->GetSafeHwnd())
        throw Broken("the focus is in the window in front: kind " +
                     std::to_string(static_cast<int>(focus->State()->setup.kind)));
}

// Where a grid is in front, its commands can be had.
void checkGridMenu(Stage& stage) {
    constexpr std::size_t gridEntry = 2;
    const CMenu* const menu = stage.session().mainWindow().GetMenu();
    if (!stage.page() || Stage::gridsOf(*stage.page()).empty() || menu->Entries().size() <= gridEntry)
        return;
    if (!menu->Entries()[gridEntry].enabled)
        throw Broken("a grid in front has its menu: it is greyed");
}

} // namespace

void checkWindows(Stage& stage) {
    std::size_t views = 0;
    for (const CKota0_adDoc* const document : stage.documents())
        views += document->Views().size();
    if (views != stage.frames().size())
        throw Broken("a window for each view: " + std::to_string(stage.frames().size()) + " windows, " +
                     std::to_string(views) + " views");
    if (!stage.frames().empty() && !stage.front())
        throw Broken("a window is in front: none is");
    for (const CMDIChildWnd* const frame : stage.frames()) {
        const CKota0_adView* const view = Stage::viewOf(*frame);
        if (!view)
            throw Broken("a window has a view: one has none");
        checkSheet(*view);
        if (frame->State()->modified != (view->GetDocument()->IsModified() != 0))
            throw Broken("a window bears its document's mark: it does not");
    }
    checkFocus(stage);
    checkGridMenu(stage);
}

void checkBoxes(Stage& stage) {
    for (const std::string& words : stage.screen().boxes)
        if (words.find("invalid argument") != std::string::npos)
            throw Broken("no argument is invalid: " + words);
}

} // namespace kota::random_user
