#include "platform/foundation/frames.h"

#include "platform/framework/document.h"
#include "platform/framework/template.h"
#include "platform/framework/turn.h"

#include <algorithm>
#include <string_view>

IMPLEMENT_DYNCREATE(CKhMDIChildWnd, CMDIChildWnd, kota::platformModule)
IMPLEMENT_DYNAMIC(SECMDIFrameWnd, CMDIFrameWnd, kota::platformModule)
IMPLEMENT_DYNAMIC(CKhMDIFrameWnd, SECMDIFrameWnd, kota::platformModule)

CKhMDIChildWnd::CKhMDIChildWnd() = default;
CKhMDIChildWnd::~CKhMDIChildWnd() = default;

SECMDIFrameWnd::SECMDIFrameWnd() = default;
SECMDIFrameWnd::~SECMDIFrameWnd() = default;

void SECMDIFrameWnd::EnableDocking(UINT sides, UINT /*flags*/) {
    dockingSides_ = sides;
}

void SECMDIFrameWnd::DockControlBar(CControlBar* bar, UINT /*sides*/, const CRect* rect) {
    if (!bar || !bar->GetSafeHwnd() || bar->GetParent() != this)
        return;
    if (rect)
        bar->SetWindowRect(*rect);
    if (std::ranges::find(docked_, bar->GetSafeHwnd()) == docked_.end())
        docked_.push_back(bar->GetSafeHwnd());
    kota::noteChange(bar->GetSafeHwnd(), kota::Change::State);
}

std::vector<CControlBar*> SECMDIFrameWnd::DockedBars() const {
    std::vector<CControlBar*> bars;
    for (const HWND handle : docked_)
        if (CWnd* const bar = FromHandle(handle))
            bars.push_back(static_cast<CControlBar*>(bar));
    return bars;
}

CKhMDIFrameWnd::CKhMDIFrameWnd() = default;
CKhMDIFrameWnd::~CKhMDIFrameWnd() = default;

namespace {

constexpr std::size_t documentsPlace = 2;

void append(CMenu& bar, const kota::MenuPopupTemplate& popup) {
    CMenu& menu = bar.AppendPopup(popup.text);
    for (const kota::MenuItemTemplate& item : popup.items) {
        if (item.id == 0)
            menu.AppendSeparator();
        else
            menu.AppendMenu(item.id, item.text, item.greyed ? MF_GRAYED : MF_ENABLED);
    }
}

// Whether two menus are the same one. Their captions may be in different languages, so that their commands
// tell, where the shell's has any.
bool isSame(const kota::MenuPopupTemplate& own, const kota::MenuPopupTemplate& documents) {
    if (own.items.empty())
        return std::string_view(own.text) == documents.text;
    return std::ranges::any_of(own.items, [&](const kota::MenuItemTemplate& item) {
        return item.id != 0 && std::ranges::find(documents.items, item.id, &kota::MenuItemTemplate::id) !=
                                   documents.items.end();
    });
}

bool hasPopup(const kota::MenuTemplate& menu, const kota::MenuPopupTemplate& documents) {
    return std::ranges::any_of(menu.popups,
                               [&](const kota::MenuPopupTemplate& own) { return isSame(own, documents); });
}

const kota::Module* moduleInFront(const CMDIFrameWnd& frame) {
    const CDocument* const document = frame.FrontDocument();
    const CDocTemplate* const docTemplate = document ? document->GetDocTemplate() : nullptr;
    return docTemplate ? &docTemplate->Module() : nullptr;
}

} // namespace

void CKhMDIFrameWnd::LoadMenu(const kota::MenuTemplate& own) {
    own_ = &own;
    OnUpdateFrameMenu(nullptr);
}

void CKhMDIFrameWnd::OnUpdateFrameMenu(const CDocTemplate* front) {
    if (!own_)
        return;
    CMenu& bar = *GetMenu();
    bar.Clear();
    const kota::MenuTemplate* const documents = front ? front->Module().menu(front->Id()) : nullptr;
    for (std::size_t i = 0; i < own_->popups.size(); ++i) {
        if (i == documentsPlace && documents)
            for (const kota::MenuPopupTemplate& popup : documents->popups)
                if (!hasPopup(*own_, popup))
                    append(bar, popup);
        append(bar, own_->popups[i]);
    }
}

void CKhMDIFrameWnd::ShowToolBar(UINT command, bool show) {
    const kota::Module* const front = moduleInFront(*this);
    for (CControlBar* bar : DockedBars()) {
        const auto* const toolBar = dynamic_cast<const CKhFlatToolBar*>(bar);
        if (toolBar && toolBar->HasCommand(command) && (!show || toolBar->ResourceModule() == front))
            bar->ShowWindow(show);
    }
}

void CKhMDIFrameWnd::PassOn(UINT message, WPARAM wParam, LPARAM lParam) {
    std::vector<HWND> views;
    for (const CMDIChildWnd* child : Children())
        if (const CView* const view = child->GetActiveView())
            views.push_back(view->GetSafeHwnd());
    for (const HWND view : views)
        ::SendMessage(view, message, wParam, lParam);
}
