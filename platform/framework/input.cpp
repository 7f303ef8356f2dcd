#include "platform/framework/input.h"

#include "platform/framework/application.h"
#include "platform/framework/frame.h"
#include "platform/framework/guard.h"
#include "platform/framework/property_sheet.h"
#include "platform/framework/tab_order.h"
#include "platform/framework/turn.h"

#include <algorithm>
#include <string_view>
#include <utility>

namespace {

kota::input::Modifiers held;

class HeldScope {
public:
    explicit HeldScope(kota::input::Modifiers modifiers) : before_(std::exchange(held, modifiers)) {}
    ~HeldScope() { held = before_; }
    HeldScope(const HeldScope&) = delete;
    HeldScope& operator=(const HeldScope&) = delete;

private:
    kota::input::Modifiers before_;
};

} // namespace

short GetKeyState(WPARAM key) {
    const bool down = (key == VK_SHIFT && held.shift) || (key == VK_CONTROL && held.control) ||
                      (key == VK_MENU && held.alt);
    return down ? -128 : 0;
}

namespace kota::input {

namespace {

bool takesInput(const CWnd& window) {
    return window.IsWindowEnabled() && window.IsWindowVisible();
}

// Moves the focus to a window. Whoever loses it may disable or close the window on the way.
bool moveFocus(CWnd& window) {
    if (!takesInput(window))
        return false;
    window.SetFocus();
    return takesInput(window) && ::GetFocus() == window.GetSafeHwnd();
}

// Whether the menu has the command greyed, by itself or with the menu around it.
bool isGreyed(const CMenu& menu, UINT id, bool enabledAround = true) {
    return std::ranges::any_of(menu.Entries(), [&](const CMenu::Entry& entry) {
        const bool enabled = enabledAround && entry.enabled;
        return entry.submenu ? isGreyed(*entry.submenu, id, enabled) : entry.id == id && !enabled;
    });
}

// One input: a turn, guarded.
template <class Action>
bool perform(Action action) {
    const Turn turn;
    bool result = false;
    return guarded([&] { result = action(); }) && result;
}

bool translated(MSG& message) {
    for (CWnd* window = CWnd::FromHandle(message.hwnd); window; window = window->GetParent())
        if (window->PreTranslateMessage(&message))
            return true;
    return false;
}

bool isInDialog(HWND handle) {
    for (const CWnd* window = CWnd::FromHandle(handle); window; window = window->GetParent())
        if (window->State()->setup.kind == WindowKind::Dialog)
            return true;
    return false;
}

// Runs the command of a key. The key goes no further, also where the command is greyed or has no handler: to
// the window it would be another key. A dialog's keys are its own.
bool accelerated(const Accelerator& pressed) {
    auto* const mainFrame = dynamic_cast<CMDIFrameWnd*>(AfxGetMainWnd());
    const UINT id = mainFrame && !isInDialog(::GetFocus()) ? mainFrame->CommandOf(pressed) : 0;
    if (id != 0)
        command(id);
    return id != 0;
}

void tellParent(const CWnd& control, int notification) {
    for (CWnd* around = control.GetParent(); around; around = around->GetParent()) {
        const WindowKind kind = around->State()->setup.kind;
        if (kind == WindowKind::Group || kind == WindowKind::Row)
            continue;
        around->SendMessage(WM_COMMAND, commandParam(control.GetDlgCtrlID(), notification),
                            reinterpret_cast<LPARAM>(control.GetSafeHwnd()));
        return;
    }
}

// The first characters of a text, at most so many.
std::string_view firstCharacters(std::string_view text, int count) {
    const auto startsCharacter = [](char byte) {
        return (static_cast<unsigned char>(byte) & 0xC0U) != 0x80U;
    };
    for (std::size_t i = 0; i < text.size(); ++i)
        if (startsCharacter(text[i]) && count-- == 0)
            return text.substr(0, i);
    return text;
}

void comeOn(CWnd& radio) {
    for (CWnd* const other : radioGroupOf(radio))
        other->SetCheck(other == &radio);
}

} // namespace

bool key(WPARAM key, Modifiers modifiers) {
    const HeldScope scope(modifiers); // what the turn posts is delivered while they are held
    return perform([&] {
        MSG message{.hwnd = ::GetFocus(), .message = WM_KEYDOWN, .wParam = key, .lParam = 0};
        if (translated(message) ||
            accelerated(
                {.key = key, .control = modifiers.control, .shift = modifiers.shift, .alt = modifiers.alt}))
            return true;
        if (key == VK_F1)
            return ::SendMessage(message.hwnd, WM_HELP, 0, 0) != 0;
        return ::SendMessage(message.hwnd, WM_KEYDOWN, key, 0) != 0;
    });
}

bool focus(CWnd& window) {
    return perform([&] { return moveFocus(window); });
}

bool typeText(CWnd& edit, const char* text) {
    return perform([&] {
        if (!takesInput(edit) || edit.State()->setup.kind != WindowKind::Edit || !moveFocus(edit))
            return false;
        const int limit = edit.State()->textLimit;
        edit.SetWindowText(limit > 0 ? CString(firstCharacters(text, limit)) : CString(text));
        return true;
    });
}

bool click(CWnd& button) {
    return perform([&] {
        if (!moveFocus(button))
            return false;
        switch (button.State()->setup.kind) {
        case WindowKind::CheckBox:
            button.SetCheck(!button.GetCheck());
            break;
        case WindowKind::RadioButton:
            comeOn(button);
            break;
        case WindowKind::PushButton:
            break;
        default:
            return false;
        }
        tellParent(button, BN_CLICKED);
        return true;
    });
}

bool choose(CWnd& comboBox, int entry) {
    return perform([&] {
        const bool exists =
            takesInput(comboBox) && entry >= 0 && entry < std::ssize(comboBox.State()->choices);
        if (!exists || !moveFocus(comboBox))
            return false;
        comboBox.SendMessage(CB_SETCURSEL, static_cast<WPARAM>(entry));
        tellParent(comboBox, CBN_SELCHANGE);
        return true;
    });
}

bool selectTab(CPropertySheet& sheet, int index) {
    return perform([&] {
        CWnd* const tabs = sheet.GetTabControl();
        if (!tabs || !takesInput(*tabs))
            return false;
        const HWND before = ::GetFocus();
        tabs->SetFocus();
        if (::GetFocus() != tabs->GetSafeHwnd())
            return false;
        if (sheet.SetActivePage(index))
            return true;
        ::SetFocus(before);
        return false;
    });
}

bool command(UINT id) {
    return perform([&] {
        CWnd* const mainWindow = AfxGetMainWnd();
        const CMenu* const menu = mainWindow ? mainWindow->GetMenu() : nullptr;
        if (menu && isGreyed(*menu, id))
            return false;
        return mainWindow && mainWindow->SendMessage(WM_COMMAND, commandParam(id, 0)) != 0;
    });
}

bool canCommand(UINT id) {
    CWnd* const mainWindow = AfxGetMainWnd();
    const CMenu* const menu = mainWindow ? mainWindow->GetMenu() : nullptr;
    return mainWindow && !(menu && isGreyed(*menu, id)) && mainWindow->OnCmdMsg(id, CN_UPDATE_COMMAND_UI);
}

bool activate(CMDIChildWnd& frame) {
    return perform([&] {
        const HWND handle = frame.GetSafeHwnd();
        CWnd* const holder = CWnd::GetFocus();
        const bool leaves = holder && holder != &frame && !frame.IsChild(holder);
        if (!takesInput(frame) || (leaves && !holder->LetFocusGo()) || !IsWindow(handle))
            return false;
        frame.ActivateFrame();
        return true;
    });
}

void drop(CMDIFrameWnd& frame, const std::vector<CString>& paths) {
    perform([&] {
        frame.OnDropFiles(paths);
        return true;
    });
}

bool close(CWnd& window) {
    return perform([&] {
        const HWND handle = window.GetSafeHwnd();
        if (!takesInput(window))
            return false;
        ::SendMessage(handle, WM_CLOSE, 0, 0);
        return !IsWindow(handle);
    });
}

} // namespace kota::input
