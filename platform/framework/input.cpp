#include "platform/framework/input.h"

#include "platform/framework/application.h"
#include "platform/framework/frame.h"
#include "platform/framework/guard.h"
#include "platform/framework/property_sheet.h"
#include "platform/framework/turn.h"

#include <algorithm>
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

void comeOn(CWnd& radio) {
    const auto& siblings = radio.GetParent()->State()->children;
    const auto isRadio = [](HWND handle) {
        return CWnd::FromHandle(handle)->State()->setup.kind == WindowKind::RadioButton;
    };
    const auto startsGroup = [](HWND handle) { return CWnd::FromHandle(handle)->State()->startsGroup; };
    const auto here = std::ranges::find(siblings, radio.GetSafeHwnd());
    auto first = here;
    while (first != siblings.begin() && !startsGroup(*first) && isRadio(*std::prev(first)))
        --first;
    for (auto other = first; other != siblings.end() && isRadio(*other); ++other) {
        if (other != first && startsGroup(*other))
            break;
        CWnd::FromHandle(*other)->SetCheck(other == here);
    }
}

} // namespace

bool key(WPARAM key, Modifiers modifiers) {
    return perform([&] {
        const HeldScope scope(modifiers);
        MSG message{.hwnd = ::GetFocus(), .message = WM_KEYDOWN, .wParam = key, .lParam = 0};
        if (!IsWindow(message.hwnd) || translated(message))
            return IsWindow(message.hwnd);
        if (key == VK_F1)
            return ::SendMessage(message.hwnd, WM_HELP, 0, 0) != 0;
        return ::SendMessage(message.hwnd, WM_KEYDOWN, key, 0) != 0;
    });
}

bool focus(CWnd& window) {
    return perform([&] {
        if (!takesInput(window))
            return false;
        window.SetFocus();
        return ::GetFocus() == window.GetSafeHwnd();
    });
}

bool typeText(CWnd& edit, const char* text) {
    return perform([&] {
        if (!takesInput(edit) || edit.State()->setup.kind != WindowKind::Edit || !focus(edit))
            return false;
        const std::string_view typed(text);
        const int limit = edit.State()->textLimit;
        const std::size_t length = limit > 0 ? static_cast<std::size_t>(limit) : typed.size();
        edit.SetWindowText(CString(typed.substr(0, length)));
        return true;
    });
}

bool click(CWnd& button) {
    return perform([&] {
        if (!takesInput(button) || !focus(button))
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
        if (!exists || !focus(comboBox))
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
        return mainWindow && mainWindow->SendMessage(WM_COMMAND, commandParam(id, 0)) != 0;
    });
}

bool close(CWnd& window) {
    return perform([&] {
        const HWND handle = window.GetSafeHwnd();
        ::SendMessage(handle, WM_CLOSE, 0, 0);
        return !IsWindow(handle);
    });
}

} // namespace kota::input
