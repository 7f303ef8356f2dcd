#include "platform/framework/message_box.h"

#include "platform/framework/application.h"
#include "platform/framework/screen.h"
#include "platform/framework/turn.h"

#include <cstdio>

namespace {
unsigned shown = 0;
} // namespace

unsigned kota::boxesShown() {
    return shown;
}

int MessageBox(HWND owner, const char* text, const char* caption, UINT type) {
    kota::Screen* screen = kota::attachedScreen();
    if (!screen) {
        std::fprintf(stderr, "%s\n", text ? text : "");
        return 0;
    }
    kota::MessageBoxRequest request{.owner = owner, .text = text, .caption = {}, .type = type};
    if (caption)
        request.caption = caption;
    ++shown;
    kota::tellScreen(); // a screen draws on while the box is open
    return screen->showMessageBox(request);
}

int AfxMessageBox(const char* text, UINT type) {
    const CWnd* mainWindow = AfxGetMainWnd();
    return MessageBox(mainWindow ? mainWindow->GetSafeHwnd() : nullptr, text, nullptr, type);
}
