#include "platform/framework/messages.h"
#include "platform/grid/grid_data.h"
#include "platform/grid/user.h"

#include <array>

namespace {

struct Key {
    WPARAM key;
    int direction;
    int withControl;
};

constexpr std::array<Key, 8> movingKeys = {{
    {VK_UP, GX_UP, GX_TOP},
    {VK_DOWN, GX_DOWN, GX_BOTTOM},
    {VK_LEFT, GX_LEFT, GX_MOSTLEFT},
    {VK_RIGHT, GX_RIGHT, GX_MOSTRIGHT},
    {VK_PRIOR, GX_PAGEUP, GX_PAGEUP},
    {VK_NEXT, GX_PAGEDOWN, GX_PAGEDOWN},
    {VK_HOME, GX_MOSTLEFT, GX_TOPLEFT},
    {VK_END, GX_MOSTRIGHT, GX_BOTTOMRIGHT},
}};

} // namespace

BOOL CGXGridCore::ProcessKeys(CWnd* /*window*/, UINT message, UINT key, UINT /*repeat*/, UINT /*flags*/) {
    if (message != WM_KEYDOWN)
        return FALSE;
    const bool control = GetKeyState(VK_CONTROL) < 0;
    const bool shift = GetKeyState(VK_SHIFT) < 0;
    for (const Key& moving : movingKeys)
        if (moving.key == key) {
            const int direction = control ? moving.withControl : moving.direction;
            if (shift && !IsEditing())
                data_->extendSelection(direction);
            else
                MoveCurrentCell(direction);
            return TRUE;
        }
    if (key == VK_F2)
        return data_->beginEdit();
    if (key == VK_SPACE && shift)
        return kota::grid::clickLineHeader(*this, data_->current.row);
    if (key == 'A' && control && !IsEditing())
        return kota::grid::selectCells(*this, CGXRange(1, 1, GetRowCount(), GetColCount()));
    if (control && (key == 'Y' || (key == 'Z' && shift)))
        return Redo();
    if (key != VK_ESCAPE || !IsEditing())
        return FALSE;
    CancelEdit();
    return TRUE;
}

LRESULT CGXGridCore::WindowProc(UINT message, WPARAM wParam, LPARAM lParam) {
    switch (message) {
    case WM_KEYDOWN: {
        if (!IsWindowEnabled())
            return 0;
        const kota::grid::CellPlace before = data_->current;
        if (!ProcessKeys(this, message, static_cast<UINT>(wParam), 1, 0))
            return DefWindowProc(message, wParam, lParam);
        if (data_->current != before)
            data_->select({});
        return 1;
    }
    case WM_SETFOCUS:
    case WM_KILLFOCUS:
        data_->note(&kota::GridChanges::current);
        OnActivateGrid(message == WM_SETFOCUS);
        return DefWindowProc(message, wParam, lParam);
    default:
        return CWnd::WindowProc(message, wParam, lParam);
    }
}

BOOL CGXGridCore::OnCmdMsg(UINT id, int notification) {
    const bool asked = notification == CN_UPDATE_COMMAND_UI;
    if (notification != 0 && !asked)
        return CWnd::OnCmdMsg(id, notification);
    switch (id) {
    case ID_EDIT_UNDO:
        return asked ? CanUndo() : Undo();
    case ID_EDIT_CUT:
    case ID_EDIT_COPY:
    case ID_EDIT_PASTE:
        return data_->editCommand(id, asked);
    default:
        return CWnd::OnCmdMsg(id, notification);
    }
}

void CGXGridCore::OnActivateGrid(BOOL /*active*/) {}
