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
    // the user changed their mind. It asks the user before it gives the name of a file that is there. The
    // document may write under another extension than the name's, and asks for that file itself.
    virtual std::optional<CString> askSaveName(const CString& proposal) = 0;
    // Shows a dialog that is ready to be used, and hands the user's input to it until it is ended
    // (CDialog::IsEnded).
    virtual void showDialog(CDialog& dialog) = 0;

    // The text on the clipboard, empty when there is none. The base keeps a clipboard of its own.
    virtual CString clipboardText() const;
    virtual void setClipboardText(const CString& text);
    // Carries out a command of the Edit menu in the line of text that the user is typing: in the edit that
    // has the focus, or in the cell that is open; `asked` only tells whether that can be. The screen alone
    // knows what of the text is selected. The base does nothing.
    virtual bool editText(UINT command, bool asked);
    // Whether the user writes numbers with a decimal comma; the base says no.
    virtual bool usesDecimalComma() const;
    // The face of a font for the texts of a language (1041: Japanese); empty, as the base says, where the
    // screen's own font shows them.
    virtual CString fontFor(int language) const;

    // What changed, each window once, in the order in which the windows were first touched.
    virtual void windowsChanged(std::span<const WindowChange> changes);
    // Something changed outside a turn: the screen is to make one soon.
    virtual void changesPending();

private:
    CString clipboard_;
};

// Attaches a screen, which must outlive its use, or none with null. Gives the one before.
KOTA_API Screen* attachScreen(Screen* screen);
KOTA_API Screen* attachedScreen();

} // namespace kota
