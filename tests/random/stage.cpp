#include "tests/random/stage.h"

#include "editing/base/unit_items.h"
#include "editing/dlg_property_sheet.h"
#include "platform/foundation/units.h"
#include "platform/framework/template.h"
#include "tests/random/plays.h"

#include <algorithm>
#include <filesystem>
#include <iterator>

namespace fs = std::filesystem;

namespace kota::random_user {

namespace {

void collect(const CWnd& around, std::initializer_list<WindowKind> kinds, std::vector<CWnd*>& found) {
    for (const HWND handle : around.State()->children) {
        CWnd* const child = CWnd::FromHandle(handle);
        if (!child)
            continue;
        if (std::ranges::find(kinds, child->State()->setup.kind) != kinds.end())
            found.push_back(child);
        collect(*child, kinds, found);
    }
}

bool isDocument(const fs::path& path) {
    const bool isResult = path.stem().extension() == ".becomes";
    return !isResult && (path.extension() == ".ad31" || path.extension() == ".AD31");
}

std::vector<fs::path> documentsIn(const fs::path& folder) {
    std::vector<fs::path> paths;
    for (const fs::directory_entry& entry : fs::directory_iterator(folder))
        if (isDocument(entry.path()))
            paths.push_back(entry.path());
    std::ranges::sort(paths);
    return paths;
}

// The documents that come with the tests.
const std::vector<fs::path>& provided() {
    static const std::vector<fs::path> paths = [] {
        std::vector<fs::path> all = documentsIn(fs::path(KOTA_TEST_DATA) / "good");
        std::ranges::copy(documentsIn(fs::path(KOTA_EXAMPLES) / "missouri"), std::back_inserter(all));
        return all;
    }();
    return paths;
}

} // namespace

Stage::Stage()
    : session_([](const std::string& text) { throw Broken("a question nobody foresaw: " + text); }) {
    attachScreen(&screen_);
    screen_.nextName = [this] { return nextName(); };
    session_.load(KOTA_PLUG_IN);
}

Stage::~Stage() {
    session_.mainWindow().onMessage = nullptr;
    screen_.onBox = nullptr;
    session_.closeMainWindow();
    setDisplayUnit(::UnitItem::Chainage, 0);
    setDisplayUnit(::UnitItem::FirstOrderRate, 0);
}

std::vector<CMDIChildWnd*> Stage::frames() {
    return session_.mainWindow().Children();
}

CMDIChildWnd* Stage::front() {
    return session_.mainWindow().MDIGetActive();
}

CKota0_adView* Stage::viewOf(const CMDIChildWnd& frame) {
    return dynamic_cast<CKota0_adView*>(frame.GetActiveView());
}

CKota0_adView* Stage::view() {
    const CMDIChildWnd* const frame = front();
    return frame ? viewOf(*frame) : nullptr;
}

CPropertySheet* Stage::sheet() {
    return view() ? view()->Sheet() : nullptr;
}

CPropertyPage* Stage::page() {
    return sheet() ? sheet()->GetActivePage() : nullptr;
}

CKota0_adDoc* Stage::document() {
    return view() ? view()->GetDocument() : nullptr;
}

std::vector<CKota0_adDoc*> Stage::documents() {
    std::vector<CKota0_adDoc*> all;
    for (const CDocTemplate* docTemplate : session_.application().Templates())
        for (CDocument* document : docTemplate->Documents())
            all.push_back(static_cast<CKota0_adDoc*>(document));
    return all;
}

CGXGridCore* Stage::grid() {
    CWnd* const inFront = page();
    if (!inFront || !inFront->GetSafeHwnd())
        return nullptr;
    auto* const focused = dynamic_cast<CGXGridCore*>(CWnd::GetFocus());
    if (focused && inFront->IsChild(focused))
        return focused;
    const std::vector<CGXGridCore*> grids = gridsOf(*inFront);
    return grids.empty() ? nullptr : grids.front();
}

std::vector<CWnd*> Stage::controls(std::initializer_list<WindowKind> kinds) {
    std::vector<CWnd*> found;
    if (page() && page()->GetSafeHwnd())
        collect(*page(), kinds, found);
    return found;
}

std::vector<CGXGridCore*> Stage::gridsOf(const CWnd& page) {
    std::vector<CWnd*> windows;
    if (page.GetSafeHwnd())
        collect(page, {WindowKind::Grid}, windows);
    std::vector<CGXGridCore*> grids;
    for (CWnd* window : windows)
        if (auto* const grid = dynamic_cast<CGXGridCore*>(window))
            grids.push_back(grid);
    return grids;
}

std::string Stage::string(UINT id) {
    return std::string(session_.application().Templates().front()->Module().string(id).View());
}

std::string Stage::file(int number) const {
    const std::vector<fs::path> own = documentsIn(folder_.path());
    const auto place = static_cast<std::size_t>(wrapped(number, provided().size() + own.size()) - 1);
    if (place >= provided().size())
        return own[place - provided().size()].string();
    const fs::path copy = folder_.path() / provided()[place].filename();
    fs::copy_file(provided()[place], copy, fs::copy_options::skip_existing);
    return copy.string();
}

std::string Stage::nextName() {
    return folder_.file("unnamed" + std::to_string(++names_) + ".ad31");
}

} // namespace kota::random_user
