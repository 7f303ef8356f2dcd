#pragma once

#include "document/kota0_ad_doc.h"
#include "editing/kota0_ad_view.h"
#include "platform/grid/grid.h"
#include "platform/headless/session.h"
#include "tests/random/action.h"
#include "tests/random/answering_screen.h"
#include "tests/support/temp_folder.h"

#include <deque>
#include <optional>
#include <stdexcept>
#include <string>
#include <vector>

class CMDIChildWnd;
class CPropertyPage;
class CPropertySheet;

namespace kota::random_user {

// The system does not hold what it should. The words begin with the name of what is broken and a colon.
class Broken : public std::runtime_error {
public:
    using std::runtime_error::runtime_error;
};

// A message of the editor, or a box, at which the shell does something.
struct Armed {
    std::string moment;
    Action action;
};

// Where a script is played: a shell that has loaded the plug-in, with whatever documents and windows the
// script has opened by now, and a folder of its own for their files.
class Stage {
public:
    Stage();
    // Closes all without asking. Display units are base units again.
    ~Stage();
    Stage(const Stage&) = delete;
    Stage& operator=(const Stage&) = delete;

    headless::Session& session() { return session_; }
    AnsweringScreen& screen() { return screen_; }
    const test::TempFolder& folder() const { return folder_; }

    // The windows, and the one in front, null when there is none.
    std::vector<CMDIChildWnd*> frames();
    CMDIChildWnd* front();
    CKota0_adView* view();
    static CKota0_adView* viewOf(const CMDIChildWnd& frame);
    CPropertySheet* sheet();
    CPropertyPage* page();
    CKota0_adDoc* document();
    std::vector<CKota0_adDoc*> documents();
    // The grid on which the user works: that with the focus, else the first of the page; null for none.
    CGXGridCore* grid();

    // The controls of those kinds on the page in front, in their order.
    std::vector<CWnd*> controls(std::initializer_list<WindowKind> kinds);
    static std::vector<CGXGridCore*> gridsOf(const CWnd& page);
    // The text of the plug-in's string table.
    std::string string(UINT id);

    // The n-th file that may be opened, for any number: a copy of one that comes with the tests, or one that
    // was saved.
    std::string file(int number) const;
    // A name for a document that has none yet.
    std::string nextName();

    std::deque<Armed> armed;
    int callBacks = 0;         // how often the shell did something
    bool linesChanged = false; // lines came or went: what is shown may not be what is held
    HWND keptFocus = nullptr;  // the grid behind that keeps the focus
    bool isInside = false;     // in the shell's doing

private:
    AnsweringScreen screen_; // outlives the session
    test::TempFolder folder_;
    headless::Session session_;
    int names_ = 0;
};

} // namespace kota::random_user
