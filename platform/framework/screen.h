#pragma once

#include "platform/framework/export.h"
#include "platform/framework/text.h"
#include "platform/framework/window_state.h"

#include <optional>
#include <span>

class CDialog;

namespace kota {

// What a message box shows. `type` is one of the MB_ constants.
struct MessageBoxRequest {
    HWND owner = nullptr;
    CString text;
    std::optional<CString> caption; // none: the screen's default
    UINT type = 0;
};

// A window of which something changed. `changes` is a union of Change bits.
struct WindowChange {
    HWND window = nullptr; // dead already, if it is gone
    unsigned changes = 0;

    bool has(Change change) const { return (changes & static_cast<unsigned>(change)) != 0; }
};

// The port to whatever draws the platform's windows and brings the user's input. One screen is attached at
// a time. The platform asks it where the user has to answer before the program can go on, and tells it after
// each turn what changed; what there is to draw, the screen reads from the windows themselves.
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
    // Shows a dialog that is ready to be used, and hands the user's input to it until it is ended
    // (CDialog::IsEnded).
    virtual void showDialog(CDialog& dialog) = 0;

    // What changed, each window once, in the order in which the windows were first touched.
    virtual void windowsChanged(std::span<const WindowChange> changes);
    // Something changed outside a turn: the screen is to make one soon.
    virtual void changesPending();
};

// Attaches a screen, which must outlive its use, or none with null. Gives the one before.
KOTA_API Screen* attachScreen(Screen* screen);
KOTA_API Screen* attachedScreen();

} // namespace kota
