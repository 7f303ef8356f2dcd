#pragma once

#include "platform/framework/window.h"

#include <vector>

class CMDIChildWnd;
class CMDIFrameWnd;
class CPropertySheet;

// What a user does with windows. A screen calls these for mouse and keyboard, a test by itself: both go the
// same way. Each is a turn of its own; an invalid-argument failure in it is told to the user and gives false.
// What is disabled or hidden takes nothing.
namespace kota::input {

struct Modifiers {
    bool shift = false;
    bool control = false;
    bool alt = false;
};

// A key goes down: PreTranslateMessage of the window with the focus and of those around it, then the main
// window's accelerators, and then, if it is no accelerator, its own WM_KEYDOWN; F1 asks it for help. True
// when somebody took the key.
KOTA_API bool key(WPARAM key, Modifiers modifiers = {});
// A window is clicked or tabbed to. False when it, or the one that has the focus, refuses.
KOTA_API bool focus(CWnd& window);
// The text of an edit becomes this; a screen calls it for each change. Cut at the edit's limit.
KOTA_API bool typeText(CWnd& edit, const char* text);
// A button is pressed; a check box changes, a radio button comes on.
KOTA_API bool click(CWnd& button);
// An entry of a combo box is chosen.
KOTA_API bool choose(CWnd& comboBox, int entry);
// A tab is clicked. False when the focus or the page in front refuses to go.
KOTA_API bool selectTab(CPropertySheet& sheet, int index);
// A command of the main window's menu. False when it is greyed or nobody has a handler.
KOTA_API bool command(UINT id);
// Whether it would be carried out.
KOTA_API bool canCommand(UINT id);
// A document's frame is brought to the front. False when what has the focus refuses to let it go.
KOTA_API bool activate(CMDIChildWnd& frame);
// Files are dropped on the main window.
KOTA_API void drop(CMDIFrameWnd& frame, const std::vector<CString>& paths);
// The close button of a frame or a dialog.
KOTA_API bool close(CWnd& window);

} // namespace kota::input
