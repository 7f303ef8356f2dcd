#include "platform/framework/data_exchange.h"

#include "platform/framework/platform_texts.h"

#include <charconv>
#include <vector>

namespace {

// The radio buttons of the group that begins with `first`.
std::vector<CWnd*> radioGroup(CWnd* first) {
    std::vector<CWnd*> group;
    const CWnd* const around = first ? first->GetParent() : nullptr;
    if (!around)
        return group;
    for (const HWND handle : around->State()->children) {
        CWnd* const button = CWnd::FromHandle(handle);
        const bool follows = !group.empty() && !button->State()->startsGroup &&
                             button->State()->setup.kind == kota::WindowKind::RadioButton;
        if (button == first || follows)
            group.push_back(button);
        else if (!group.empty())
            break;
    }
    return group;
}

} // namespace

void DDX_Control(CDataExchange* exchange, UINT id, CWnd& control) {
    if (!control.GetSafeHwnd())
        control.SubclassDlgItem(id, exchange->dialog);
}

void DDX_Text(CDataExchange* exchange, UINT id, CString& value) {
    CWnd* const control = exchange->dialog->GetDlgItem(id);
    if (!control)
        return;
    if (exchange->saveAndValidate)
        value = control->GetWindowText();
    else
        control->SetWindowText(value);
}

void DDX_Text(CDataExchange* exchange, UINT id, int& value) {
    if (!exchange->dialog->GetDlgItem(id))
        return;
    CString text;
    if (!exchange->saveAndValidate)
        text.Format("%d", value);
    DDX_Text(exchange, id, text);
    if (!exchange->saveAndValidate)
        return;
    const std::string_view digits = text.View();
    int number = 0;
    const auto [end, error] = std::from_chars(digits.data(), digits.data() + digits.size(), number);
    if (error != std::errc() || end != digits.data() + digits.size()) {
        exchange->dialog->MessageBox(kota::platformText(kota::PlatformText::IntegerRequired));
        throw kota::ExchangeFailure();
    }
    value = number;
}

void DDX_Check(CDataExchange* exchange, UINT id, int& value) {
    CWnd* const control = exchange->dialog->GetDlgItem(id);
    if (!control)
        return;
    if (exchange->saveAndValidate)
        value = control->GetCheck();
    else
        control->SetCheck(value);
}

void DDX_Radio(CDataExchange* exchange, UINT id, int& value) {
    const std::vector<CWnd*> group = radioGroup(exchange->dialog->GetDlgItem(id));
    if (exchange->saveAndValidate && !group.empty())
        value = -1;
    for (int place = 0; place < std::ssize(group); ++place) {
        if (!exchange->saveAndValidate)
            group[static_cast<std::size_t>(place)]->SetCheck(place == value);
        else if (group[static_cast<std::size_t>(place)]->GetCheck())
            value = place;
    }
}

void DDX_CBIndex(CDataExchange* exchange, UINT id, int& index) {
    CWnd* const control = exchange->dialog->GetDlgItem(id);
    if (!control)
        return;
    if (exchange->saveAndValidate)
        index = static_cast<int>(control->SendMessage(CB_GETCURSEL));
    else
        control->SendMessage(CB_SETCURSEL, static_cast<WPARAM>(static_cast<std::intptr_t>(index)));
}
