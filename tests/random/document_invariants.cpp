// What holds of documents and their files.
#include "editing/dlg_property_sheet.h"
#include "platform/framework/frame.h"
#include "platform/framework/input.h"
#include "platform/framework/number_text.h"
#include "platform/framework/turn.h"
#include "tests/random/invariants.h"
#include "tests/support/owned.h"

#include <algorithm>
#include <cmath>
#include <iterator>
#include <sstream>

namespace kota::random_user {

namespace {

// The first line in which two texts differ.
std::string difference(const std::string& left, const std::string& right) {
    std::size_t start = 0;
    for (std::size_t i = 0; i < std::min(left.size(), right.size()) && left[i] == right[i]; ++i)
        if (left[i] == '\n')
            start = i + 1;
    const auto lineOf = [start](const std::string& text) {
        return text.substr(std::min(start, text.size()),
                           std::min(text.find('\n', start), text.size()) - std::min(start, text.size()));
    };
    return "\n  " + lineOf(left) + "\nis then\n  " + lineOf(right);
}

std::vector<std::string> wordsOf(const std::string& content) {
    std::istringstream words(content);
    return {std::istream_iterator<std::string>(words), {}};
}

bool isAlmost(const std::string& left, const std::string& right) {
    constexpr double shown = 0.51e-6; // six decimals
    constexpr double exact = 1e-12;
    const double first = textToDouble(left);
    const double second = textToDouble(right);
    const bool areNumbers = left.find_first_not_of("0123456789.eE+-,") == std::string::npos &&
                            right.find_first_not_of("0123456789.eE+-,") == std::string::npos;
    return areNumbers && std::abs(first - second) <= std::max(shown, exact * std::abs(first));
}

// A page that was filled since an edit shows six decimals of it, and stores those.
bool areAlmostSame(const std::string& left, const std::string& right) {
    return std::ranges::equal(wordsOf(left), wordsOf(right), [](const auto& first, const auto& second) {
        return first == second || isAlmost(first, second);
    });
}

void checkPageLines(Stage& stage, const Surroundings& surroundings, After after) {
    const CPropertyPage& page = *stage.page();
    for (CGXGridCore* const grid : Stage::gridsOf(page))
        if (const CObList* const records = surroundings.listOf(page, *grid, *stage.document()))
            checkLines(stage, *grid, *records, after);
}

bool hasPendingEdit(Stage& stage) {
    return std::ranges::any_of(Stage::gridsOf(*stage.page()),
                               [](const CGXGridCore* grid) { return grid->IsEditPending(); });
}

// Whether the page may show lines that no store has seen, or components their old numbers.
bool hasNewLines(Stage& stage, const Surroundings& surroundings) {
    const CPropertyPage& page = *stage.page();
    return stage.linesChanged || std::ranges::any_of(Stage::gridsOf(page), [&](const CGXGridCore* grid) {
               const CObList* const records = surroundings.listOf(page, *grid, *stage.document());
               return records &&
                      grid->GetRowCount() - grid->GetHeaderRows() != static_cast<ROWCOL>(records->GetCount());
           });
}

// Shows every tab that can be shown.
void visitAll(Stage& stage) {
    for (int index = 0; stage.sheet() && index < stage.sheet()->GetPageCount(); ++index)
        input::selectTab(*stage.sheet(), index);
}

void closeAll(Stage& stage) {
    stage.screen().answer = Answer::No;
    const Turn turn;
    for (CMDIChildWnd* const frame : stage.frames())
        frame->DestroyWindow();
}

// Opens a file, shows all of it, and saves it under another name. Empty when one of it is refused.
std::string shownAndSaved(Stage& stage, const std::string& path, const std::string& name) {
    closeAll(stage);
    CDocument* const document = stage.session().open(path);
    if (!document)
        return {};
    visitAll(stage);
    if (!stage.session().saveAs(*document, stage.folder().file(name)))
        return {};
    return std::string(document->GetPathName().View());
}

} // namespace

std::string contentOf(Stage& stage, CKota0_adDoc& document) {
    const std::string path = stage.folder().file("content");
    document.WriteData(path.c_str());
    return test::readFile(path);
}

bool checkStored(Stage& stage, const Surroundings& surroundings) {
    CKota0_adView* const view = stage.view();
    if (!view || !stage.page() || !stage.page()->GetSafeHwnd() || hasPendingEdit(stage))
        return false;
    CKota0_adDoc& document = *stage.document();
    const std::string left = contentOf(stage, document);
    const bool isNew = hasNewLines(stage, surroundings);
    const Turn turn;
    view->OnUpdate(nullptr, UpdateHint::Store, nullptr);
    const std::string stored = contentOf(stage, document);
    if (!isNew && !areAlmostSame(left, stored))
        throw Broken("an edit that was left is in the document: before a store" + difference(left, stored));
    checkPageLines(stage, surroundings, After::Store);
    document.UpdateAllViews(view, UpdateHint::Fill);
    if (const std::string filled = contentOf(stage, document); filled != stored)
        throw Broken("filling other windows changes no record:" + difference(stored, filled));
    stage.linesChanged = false;
    return true;
}

void checkSaved(Stage& stage, const CKota0_adDoc& document, const Surroundings& surroundings) {
    const std::string path(document.GetPathName().View());
    if (path.empty())
        throw Broken("a saved document has a name: it has none");
    checkRoundTrip(stage, path);
    if (stage.document() == &document && stage.page() && !hasPendingEdit(stage))
        checkPageLines(stage, surroundings, After::Save);
}

void checkRoundTrip(Stage& stage, const std::string& path) {
    test::OwnedDocument again;
    again.ReadData(path.c_str());
    const std::string first = test::readFile(path);
    if (const std::string second = contentOf(stage, again); first != second)
        throw Broken("a saved file is read and written the same:" + difference(first, second));
}

void checkShownTwice(Stage& stage) {
    CKota0_adDoc* const document = stage.document();
    stage.screen().answer = Answer::Yes;
    if (!document || !stage.session().saveAs(*document, stage.folder().file("first.ad31")))
        return;
    const std::string second = shownAndSaved(stage, stage.folder().file("first.AD31"), "second.ad31");
    const std::string third = second.empty() ? second : shownAndSaved(stage, second, "third.ad31");
    if (third.empty())
        return;
    const std::string before = test::readFile(second);
    if (const std::string after = test::readFile(third); before != after)
        throw Broken("what was shown once is shown again the same:" + difference(before, after));
}

} // namespace kota::random_user
