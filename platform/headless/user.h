#pragma once

#include "platform/framework/input.h"
#include "platform/grid/user.h"

#include <string>

class CDocument;
class CPropertySheet;
class CView;

namespace kota::headless {

class Session;

// What a user does in a document's window: the frame that was in front when the user sat down, or that of a
// view. Controls are named by their numbers on the page in front. Each action gives whether it was taken.
class User {
public:
    // Throws std::runtime_error when no document is open.
    explicit User(Session& session);
    explicit User(CView& view);

    CView& view() const;
    CPropertySheet& sheet() const;
    // The page in front.
    CWnd& page() const;
    // A control of the page in front. Throws std::runtime_error when there is none of that number.
    CWnd& control(UINT id) const;
    // The grid on which the user works: the one with the focus, or else the first of the page in front.
    CGXGridCore& grid() const;
    CGXGridCore& grid(UINT id) const;

    // By the caption of its tab. Throws std::runtime_error when there is none of that caption.
    bool selectTab(const std::string& caption);
    std::string tab() const;
    // A VK_ key or a capital letter.
    bool key(WPARAM key, input::Modifiers modifiers = {});
    // An entry of the menu, by its command.
    bool command(UINT id);

    // Clicks a cell of the grid; lines and columns count from 1.
    bool putCursor(ROWCOL row, ROWCOL col);
    // Gives the current cell this text, and stays in it.
    bool type(const std::string& text);
    // Types into the current cell, and leaves it by Enter.
    bool enter(const std::string& text);
    // An entry of the current cell's list.
    bool choose(const std::string& entry);
    bool clickBox(ROWCOL row, ROWCOL col);
    // By the headers of the lines.
    bool selectLines(ROWCOL first, ROWCOL last);
    // What a cell shows, and what it holds.
    std::string shown(ROWCOL row, ROWCOL col) const;
    std::string held(ROWCOL row, ROWCOL col) const;
    bool isReadOnly(ROWCOL row, ROWCOL col) const;
    // Line and column of the current cell; zeros for none.
    std::pair<ROWCOL, ROWCOL> cursor() const;
    // Why the last text was refused; empty when none was.
    std::string warning() const;

    // Types into an edit without leaving it, and the same with leaving it for the tabs.
    bool typeInto(UINT edit, const std::string& text);
    bool enterInto(UINT edit, const std::string& text);
    std::string textOf(UINT id) const;
    // Goes to another control of the page.
    bool goTo(UINT id);

    // A further window of the document; and its window's close button.
    bool newWindow();
    bool closeWindow();

private:
    HWND view_;
};

} // namespace kota::headless
