#include "editing/base/main_menu.h"

#include "platform/framework/application.h"

void enableGridMenu(UINT state) {
    constexpr UINT gridMenu = 2;
    CWnd* const mainWindow = AfxGetMainWnd();
    CMenu* const menu = mainWindow ? mainWindow->GetMenu() : nullptr;
    if (!menu)
        return;
    menu->EnableMenuItem(gridMenu, MF_BYPOSITION | state);
    mainWindow->DrawMenuBar();
}
