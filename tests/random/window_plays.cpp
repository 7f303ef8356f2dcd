// What a user does with the windows around a grid: tabs, controls, keys, commands, dialogs.
#include "editing/dlg_property_sheet.h"
#include "platform/framework/dialog.h"
#include "platform/framework/frame.h"
#include "platform/framework/input.h"
#include "platform/framework/messages.h"
#include "resources/ids.h"
#include "tests/random/plays.h"

#include <algorithm>
#include <array>

namespace kota::random_user {

namespace {

struct NamedKey {
    std::string_view name;
    WPARAM key;
};
constexpr std::array<NamedKey, 24> keys = {{
    {"Tab", VK_TAB},
    {"Enter", VK_RETURN},
    {"Escape", VK_ESCAPE},
    {"Space", VK_SPACE},
    {"Up", VK_UP},
    {"Down", VK_DOWN},
    {"Left", VK_LEFT},
    {"Right", VK_RIGHT},
    {"Home", VK_HOME},
    {"End", VK_END},
    {"PageUp", VK_PRIOR},
    {"PageDown", VK_NEXT},
    {"Insert", VK_INSERT},
    {"Delete", VK_DELETE},
    {"Back", VK_BACK},
    {"F1", VK_F1},
    {"F2", VK_F2},
    {"F3", VK_F3},
    {"F6", VK_F6},
    {"A", 'A'},
    {"C", 'C'},
    {"V", 'V'},
    {"Y", 'Y'},
    {"Z", 'Z'},
}};

struct NamedCommand {
    std::string_view name;
    UINT id;
};
constexpr std::array<NamedCommand, 13> commands = {{
    {"insert-line", CommandId::InsertLine},
    {"delete-line", CommandId::DeleteLine},
    {"find-next", CommandId::FindNext},
    {"insert-probe", CommandId::InsertProbe},
    {"undo", ID_EDIT_UNDO},
    {"cut", ID_EDIT_CUT},
    {"copy", ID_EDIT_COPY},
    {"paste", ID_EDIT_PASTE},
    {"save", ID_FILE_SAVE},
    {"close", ID_FILE_CLOSE},
    {"next-window", ID_NEXT_PANE},
    {"previous-window", ID_PREV_PANE},
    {"help", ID_HELP},
}};

// A control that is there at that place.
CWnd* controlAt(const std::vector<CWnd*>& controls, int number) {
    return controls.empty() ? nullptr
                            : controls[static_cast<std::size_t>(wrapped(number, controls.size()) - 1)];
}

bool playTab(Stage& stage, const Action& action) {
    CPropertySheet* const sheet = stage.sheet();
    for (int index = 0; sheet && index < sheet->GetPageCount(); ++index)
        if (sheet->GetPage(index)->GetCaption() == action.texts[0].c_str())
            return input::selectTab(*sheet, index);
    return false;
}

bool playGo(Stage& stage, const Action& action) {
    CWnd* const control =
        controlAt(stage.controls({WindowKind::Edit, WindowKind::CheckBox, WindowKind::RadioButton,
                                  WindowKind::PushButton, WindowKind::ComboBox, WindowKind::Grid}),
                  action.numbers[0]);
    return control && input::focus(*control);
}

bool playField(Stage& stage, const Action& action) {
    CWnd* const edit = controlAt(stage.controls({WindowKind::Edit}), action.numbers[0]);
    return edit && input::typeText(*edit, action.texts[0].c_str());
}

bool playPress(Stage& stage, const Action& action) {
    CWnd* const button =
        controlAt(stage.controls({WindowKind::CheckBox, WindowKind::RadioButton, WindowKind::PushButton}),
                  action.numbers[0]);
    return button && input::click(*button);
}

bool playPick(Stage& stage, const Action& action) {
    CWnd* const box = controlAt(stage.controls({WindowKind::ComboBox}), action.numbers[0]);
    if (!box || box->State()->choices.empty())
        return false;
    return input::choose(*box, wrapped(action.numbers[1], box->State()->choices.size()) - 1);
}

bool playKey(Stage& /*stage*/, const Action& action) {
    return pressKey(action.texts[0]);
}

bool playCommandAction(Stage& stage, const Action& action) {
    return playCommand(stage, action.texts[0]);
}

// Fills in a dialog and leaves it, by Cancel if OK does not end it.
template <class Fill>
bool playDialog(Stage& stage, UINT command, const std::string& end, Fill fill) {
    bool shown = false;
    stage.screen().user = [&](CDialog& dialog) {
        shown = true;
        const HWND window = dialog.GetSafeHwnd();
        fill(dialog);
        if (end == "ok" && IsWindow(window))
            input::click(*dialog.GetDlgItem(IDOK));
        if (IsWindow(window) && !dialog.IsEnded())
            input::key(VK_ESCAPE);
    };
    input::command(command);
    stage.screen().user = nullptr;
    return shown;
}

void typeInto(CDialog& dialog, UINT id, const std::string& text) {
    if (CWnd* const edit = dialog.GetDlgItem(id))
        input::typeText(*edit, text.c_str());
}

void comeOn(CDialog& dialog, UINT id) {
    if (CWnd* const radio = dialog.GetDlgItem(id))
        input::click(*radio);
}

bool playSearch(Stage& stage, const Action& action) {
    return playDialog(stage, CommandId::Search, action.texts[2], [&](CDialog& dialog) {
        constexpr std::array chainageTests = {ControlId::SearchBelow, ControlId::SearchEqual,
                                              ControlId::SearchAbove, ControlId::SearchNotUsed};
        constexpr std::array textTests = {ControlId::SearchPartialMatch, ControlId::SearchFullMatch};
        typeInto(dialog, ControlId::SearchRiverName, action.texts[0]);
        typeInto(dialog, ControlId::SearchChainage, action.texts[1]);
        comeOn(dialog, chainageTests[static_cast<std::size_t>(wrapped(action.numbers[0], 4) - 1)]);
        comeOn(dialog, textTests[static_cast<std::size_t>(wrapped(action.numbers[1], 2) - 1)]);
    });
}

bool playGoto(Stage& stage, const Action& action) {
    return playDialog(stage, CommandId::GotoLine, action.texts[1],
                      [&](CDialog& dialog) { typeInto(dialog, ControlId::LineNumber, action.texts[0]); });
}

} // namespace

bool playCommand(Stage& /*stage*/, const std::string& name) {
    const auto* const found = std::ranges::find(commands, name, &NamedCommand::name);
    return found != commands.end() && input::command(found->id);
}

bool pressKey(const std::string& name) {
    input::Modifiers held;
    std::string_view rest = name;
    const auto takes = [&](std::string_view prefix) {
        const bool is = rest.starts_with(prefix);
        rest.remove_prefix(is ? prefix.size() : 0);
        return is;
    };
    held.control = takes("Ctrl+");
    held.alt = takes("Alt+");
    held.shift = takes("Shift+");
    const auto* const found = std::ranges::find(keys, rest, &NamedKey::name);
    return found != keys.end() && input::key(found->key, held);
}

std::vector<std::string> commandNames() {
    std::vector<std::string> names;
    for (const NamedCommand& command : commands)
        names.emplace_back(command.name);
    return names;
}

std::vector<std::string> keyNames() {
    std::vector<std::string> names;
    for (const NamedKey& key : keys)
        names.emplace_back(key.name);
    return names;
}

Play windowPlayOf(Verb verb) {
    switch (verb) {
    case Verb::Tab:
        return playTab;
    case Verb::Go:
        return playGo;
    case Verb::Field:
        return playField;
    case Verb::Press:
        return playPress;
    case Verb::Pick:
        return playPick;
    case Verb::Key:
        return playKey;
    case Verb::Command:
        return playCommandAction;
    case Verb::Search:
        return playSearch;
    case Verb::Goto:
        return playGoto;
    default:
        return nullptr;
    }
}

} // namespace kota::random_user
