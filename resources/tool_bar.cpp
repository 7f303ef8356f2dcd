#include "resources/tool_bar.h"
#include "platform/framework/messages.h"
#include "resources/ids.h"

namespace {

constexpr UINT commands[] = {CommandId::Search, CommandId::FindNext};
constexpr kota::ToolBarTemplate bars[] = {
    {.id = MenuId::Document, .buttonWidth = 16, .buttonHeight = 15, .commands = commands}};

constexpr kota::Accelerator keys[] = {
    {.key = 'C', .command = ID_EDIT_COPY, .control = true},
    {.key = VK_INSERT, .command = ID_EDIT_COPY, .control = true},
    {.key = 'V', .command = ID_EDIT_PASTE, .control = true},
    {.key = VK_INSERT, .command = ID_EDIT_PASTE, .shift = true},
    {.key = 'X', .command = ID_EDIT_CUT, .control = true},
    {.key = VK_DELETE, .command = ID_EDIT_CUT, .shift = true},
    {.key = 'Z', .command = ID_EDIT_UNDO, .control = true},
    {.key = VK_BACK, .command = ID_EDIT_UNDO, .alt = true},
    {.key = 'N', .command = ID_FILE_NEW, .control = true},
    {.key = 'O', .command = ID_FILE_OPEN, .control = true},
    {.key = 'P', .command = ID_FILE_PRINT, .control = true},
    {.key = 'S', .command = ID_FILE_SAVE, .control = true},
    {.key = VK_F6, .command = ID_NEXT_PANE},
    {.key = VK_F6, .command = ID_PREV_PANE, .shift = true},
};
constexpr kota::AcceleratorTable tables[] = {{.id = MenuId::Accelerators, .keys = keys}};

} // namespace

std::span<const kota::ToolBarTemplate> toolBars() {
    return bars;
}
std::span<const kota::AcceleratorTable> acceleratorTables() {
    return tables;
}
