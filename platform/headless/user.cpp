#include "platform/headless/user.h"

#include "platform/framework/document.h"
#include "platform/framework/frame.h"
#include "platform/framework/property_sheet.h"
#include "platform/headless/session.h"

#include <algorithm>
#include <stdexcept>

namespace kota::headless {

namespace {

template <class Window>
Window* firstOf(const CWnd& around) {
    for (const HWND handle : around.State()->children) {
        CWnd* const child = CWnd::FromHandle(handle);
        if (!child)
            continue;
        if (auto* const wanted = dynamic_cast<Window*>(child))
            return wanted;
        if (auto* const deeper = firstOf<Window>(*child))
            return deeper;
    }
    return nullptr;
}

template <class Window>
Window& required(Window* window, const char* what) {
    if (!window)
        throw std::runtime_error(std::string("there is no ") + what);
    return *window;
}

std::string text(const CString& bytes) {
    return std::string(bytes.View());
}

} // namespace

User::User(Session& session)
    : view_(required(required(session.mainWindow().MDIGetActive(), "open document").GetActiveView(), "view")
                .GetSafeHwnd()) {}

User::User(CView& view) : view_(view.GetSafeHwnd()) {}

CView& User::view() const {
    return required(static_cast<CView*>(CWnd::FromHandle(view_)), "view any more");
}

CPropertySheet& User::sheet() const {
    return required(firstOf<CPropertySheet>(view()), "sheet");
}

CWnd& User::page() const {
    return required<CWnd>(sheet().GetActivePage(), "page");
}

CWnd& User::control(UINT id) const {
    return required(page().GetDlgItem(id), "control of that number");
}

CGXGridCore& User::grid() const {
    auto* const focused = dynamic_cast<CGXGridCore*>(CWnd::GetFocus());
    return focused && page().IsChild(focused) ? *focused : required(firstOf<CGXGridCore>(page()), "grid");
}

CGXGridCore& User::grid(UINT id) const {
    return required(dynamic_cast<CGXGridCore*>(&control(id)), "grid of that number");
}

bool User::selectTab(const std::string& caption) {
    for (int index = 0; index < sheet().GetPageCount(); ++index)
        if (sheet().GetPage(index)->GetCaption() == caption.c_str())
            return input::selectTab(sheet(), index);
    throw std::runtime_error("there is no tab " + caption);
}

std::string User::tab() const {
    return text(required(sheet().GetActivePage(), "page").GetCaption());
}

bool User::key(WPARAM key, input::Modifiers modifiers) {
    return input::key(key, modifiers);
}
bool User::command(UINT id) {
    return input::command(id);
}

bool User::putCursor(ROWCOL row, ROWCOL col) {
    return grid::clickCell(grid(), row, col);
}
bool User::type(const std::string& text) {
    return grid::typeText(grid(), text.c_str());
}
bool User::enter(const std::string& text) {
    return type(text) && key(VK_RETURN) && !grid().IsEditPending();
}

bool User::choose(const std::string& entry) {
    grid::dropDown(grid(), true); // the list may be filled by that alone
    const auto [row, col] = cursor();
    CGXStyle style;
    grid().ComposeStyleRowCol(row, col, &style);
    const bool chosen = grid::chooseEntry(
        grid(), CGXControl::FindStringInChoiceList(entry.c_str(), style.GetChoiceList(), TRUE));
    if (!chosen)
        grid::dropDown(grid(), false);
    return chosen;
}

bool User::clickBox(ROWCOL row, ROWCOL col) {
    return grid::clickCell(grid(), row, col);
}

bool User::selectLines(ROWCOL first, ROWCOL last) {
    return grid::clickLineHeader(grid(), first) &&
           (last == first || grid::clickLineHeader(grid(), last, grid::Selecting::Extend));
}

std::string User::shown(ROWCOL row, ROWCOL col) const {
    return text(grid().GetDisplayText(row, col));
}
std::string User::held(ROWCOL row, ROWCOL col) const {
    return text(grid().GetValueRowCol(row, col));
}

bool User::isReadOnly(ROWCOL row, ROWCOL col) const {
    CGXStyle style;
    grid().ComposeStyleRowCol(row, col, &style);
    return style.GetReadOnly();
}

std::pair<ROWCOL, ROWCOL> User::cursor() const {
    ROWCOL row = 0;
    ROWCOL col = 0;
    grid().GetCurrentCell(&row, &col);
    return {row, col};
}

std::string User::warning() const {
    return text(grid().Warning().text);
}

bool User::typeInto(UINT edit, const std::string& typed) {
    return input::typeText(control(edit), typed.c_str());
}
bool User::enterInto(UINT edit, const std::string& typed) {
    return typeInto(edit, typed) && input::focus(required(sheet().GetTabControl(), "tab control"));
}
std::string User::textOf(UINT id) const {
    return text(control(id).GetWindowText());
}
bool User::goTo(UINT id) {
    return input::focus(control(id));
}

bool User::newWindow() {
    return command(ID_WINDOW_NEW);
}
bool User::closeWindow() {
    return input::close(required(view().GetParentFrame(), "frame"));
}

} // namespace kota::headless
