#pragma once

#include "platform/framework/export.h"
#include "platform/framework/text.h"
#include "platform/framework/window.h"

#include <optional>

namespace kota {

// What a message box shows. `type` is one of the MB_ constants.
struct MessageBoxRequest {
    HWND owner = nullptr;
    CString text;
    std::optional<CString> caption; // none: the screen's default
    UINT type = 0;
};

// The port to whatever draws the platform's windows and brings the user's input. One screen is attached at
// a time; the platform asks it where the user has to answer before the program can go on.
class KOTA_API Screen {
public:
    Screen();
    virtual ~Screen();
    Screen(const Screen&) = delete;
    Screen& operator=(const Screen&) = delete;

    // Shows the box, waits for the user, and gives the button pressed (IDOK, IDYES, ...).
    virtual int showMessageBox(const MessageBoxRequest& request) = 0;
    // Asks for the name to save a document under; `proposal` is what the user may just accept. None when
    // the user changed their mind. The document may write under another extension than the name's.
    virtual std::optional<CString> askSaveName(const CString& proposal) = 0;
};

// Attaches a screen, which must outlive its use, or none with null. Gives the one before.
KOTA_API Screen* attachScreen(Screen* screen);
KOTA_API Screen* attachedScreen();

} // namespace kota
