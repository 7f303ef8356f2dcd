#include "platform/framework/document.h"
#include "platform/framework/frame.h"
#include "platform/framework/template.h"
#include "platform/framework/turn.h"

#include <algorithm>

IMPLEMENT_DYNCREATE(CMDIChildWnd, CFrameWnd, kota::platformModule)
IMPLEMENT_DYNAMIC(CMDIFrameWnd, CFrameWnd, kota::platformModule)

namespace {

CMDIFrameWnd* mainFrameOf(const CWnd& child) {
    CWnd* const parent = child.GetParent();
    return parent && parent->IsKindOf(RUNTIME_CLASS(CMDIFrameWnd)) ? static_cast<CMDIFrameWnd*>(parent)
                                                                   : nullptr;
}

CDocument* documentOf(const CMDIChildWnd* child) {
    return child ? child->GetActiveDocument() : nullptr;
}

CDocTemplate* templateOf(const CDocument* document) {
    return document ? document->GetDocTemplate() : nullptr;
}

} // namespace

CMDIChildWnd::CMDIChildWnd() = default;
CMDIChildWnd::~CMDIChildWnd() = default;

void CMDIChildWnd::ActivateFrame() {
    if (CMDIFrameWnd* const mainFrame = mainFrameOf(*this))
        mainFrame->MDIActivate(this);
    else
        CFrameWnd::ActivateFrame();
}

BOOL CMDIChildWnd::LoadFrame(CWnd* parent, const CCreateContext& context) {
    const BOOL loaded = CFrameWnd::LoadFrame(parent, context);
    if (CMDIFrameWnd* const mainFrame = mainFrameOf(*this); loaded && mainFrame)
        mainFrame->ShowMenuOf(this); // the view may enable and grey entries before it is in front
    return loaded;
}

BOOL CMDIChildWnd::DestroyWindow() {
    CMDIFrameWnd* const mainFrame = mainFrameOf(*this);
    const bool wasActive = mainFrame && mainFrame->MDIGetActive() == this;
    if (wasActive)
        mainFrame->MDIActivate(nullptr);
    const BOOL destroyed = CFrameWnd::DestroyWindow();
    if (wasActive && !mainFrame->Children().empty())
        mainFrame->MDIActivate(mainFrame->Children().back());
    if (mainFrame)
        mainFrame->ShowMenuOf(mainFrame->MDIGetActive());
    return destroyed;
}

CMDIFrameWnd::CMDIFrameWnd() = default;
CMDIFrameWnd::~CMDIFrameWnd() = default;

CMDIChildWnd* CMDIFrameWnd::MDIGetActive() const {
    return static_cast<CMDIChildWnd*>(FromHandle(activeChild_));
}

CDocument* CMDIFrameWnd::FrontDocument() const {
    return documentOf(MDIGetActive());
}

void CMDIFrameWnd::MDIActivate(CMDIChildWnd* child) {
    CMDIChildWnd* const before = MDIGetActive();
    if (child == before)
        return;
    const HWND entered = child ? child->GetSafeHwnd() : nullptr;
    activeChild_ = entered;
    if (CView* const left = before ? before->GetActiveView() : nullptr)
        left->OnActivateView(FALSE, left, left);
    // Whoever was told may have brought another frame to the front, or closed this one.
    const bool isEntered = child && activeChild_ == entered && IsWindow(entered);
    CView* const view = isEntered ? child->GetActiveView() : nullptr;
    if (!view)
        return;
    ShowMenuOf(child);
    child->BringWindowToTop();
    view->OnActivateView(TRUE, view, view);
    if (activeChild_ == entered && IsWindow(entered))
        view->SetFocus();
}

void CMDIFrameWnd::ShowMenuOf(CMDIChildWnd* child) {
    const HWND shown = child ? child->GetSafeHwnd() : nullptr;
    if (shown == menuOf_)
        return;
    if (auto* const before = static_cast<CMDIChildWnd*>(FromHandle(menuOf_))) {
        before->topEntries_.clear();
        for (const CMenu::Entry& entry : menu_.Entries())
            before->topEntries_.push_back(entry.enabled);
    }
    menuOf_ = shown;
    OnUpdateFrameMenu(templateOf(documentOf(child)));
    for (std::size_t i = 0; child && i < child->topEntries_.size(); ++i)
        menu_.EnableMenuItem(static_cast<UINT>(i),
                             MF_BYPOSITION | (child->topEntries_[i] ? MF_ENABLED : MF_GRAYED));
    DrawMenuBar();
}

void CMDIFrameWnd::OnUpdateFrameMenu(const CDocTemplate* /*front*/) {}

UINT CMDIFrameWnd::CommandOf(const kota::Accelerator& pressed) const {
    const auto commandIn = [&](const kota::AcceleratorTable& table) -> UINT {
        const auto found = std::ranges::find_if(table.keys, [&](const kota::Accelerator& entry) {
            return entry.key == pressed.key && entry.control == pressed.control &&
                   entry.shift == pressed.shift && entry.alt == pressed.alt;
        });
        return found == table.keys.end() ? 0 : found->command;
    };
    if (const CDocTemplate* const docTemplate = templateOf(FrontDocument()))
        for (const kota::AcceleratorTable& table : docTemplate->Module().accelerators())
            if (const UINT command = commandIn(table))
                return command;
    return ownKeys_ ? commandIn(*ownKeys_) : 0;
}

CString CMDIFrameWnd::GetMessageString(UINT id) const {
    const CDocTemplate* const docTemplate = templateOf(FrontDocument());
    const CString documents = docTemplate ? docTemplate->Module().string(id) : CString();
    return documents.IsEmpty() ? GetRuntimeClass()->Module().string(id) : documents;
}

std::vector<CMDIChildWnd*> CMDIFrameWnd::Children() const {
    std::vector<CMDIChildWnd*> frames;
    for (const HWND handle : State() ? State()->children : std::vector<HWND>())
        if (CWnd* const child = FromHandle(handle); child->IsKindOf(RUNTIME_CLASS(CMDIChildWnd)))
            frames.push_back(static_cast<CMDIChildWnd*>(child));
    return frames;
}

// All questions come first: a user who changes their mind at the last one has lost nothing.
void CMDIFrameWnd::OnClose() {
    std::vector<HWND> frames;
    for (const CMDIChildWnd* child : Children())
        frames.push_back(child->GetSafeHwnd());
    std::vector<const CDocument*> asked;
    for (const HWND frame : frames) {
        auto* const child = static_cast<CMDIChildWnd*>(FromHandle(frame));
        CDocument* const document = documentOf(child);
        if (!document || std::ranges::find(asked, document) != asked.end())
            continue;
        asked.push_back(document);
        if (document->IsModified())
            child->ActivateFrame(); // so that the user sees what the question is about
        if (!document->TakePendingInput() || !document->SaveModified())
            return;
    }
    CFrameWnd::OnClose();
}

BOOL CMDIFrameWnd::OnCmdMsg(UINT id, int notification) {
    static constexpr auto commands = kota::commandMap<CMDIFrameWnd>({
        {ID_WINDOW_NEW, 0, &CMDIFrameWnd::OnWindowNew},
        {ID_NEXT_PANE, 0, &CMDIFrameWnd::OnNextPane},
        {ID_PREV_PANE, 0, &CMDIFrameWnd::OnPreviousPane},
    });
    CMDIChildWnd* const child = MDIGetActive();
    return (child && child->OnCmdMsg(id, notification)) ||
           (child && kota::runCommand(*this, commands, id, notification)) ||
           CFrameWnd::OnCmdMsg(id, notification);
}

bool CMDIFrameWnd::TakePendingInput() const {
    CDocument* const document = FrontDocument();
    return !document || document->TakePendingInput();
}

void CMDIFrameWnd::OnDropFiles(const std::vector<CString>& /*paths*/) {}

void CMDIFrameWnd::OnNextPane() {
    ActivateBeside(1);
}
void CMDIFrameWnd::OnPreviousPane() {
    ActivateBeside(-1);
}

void CMDIFrameWnd::ActivateBeside(std::ptrdiff_t step) {
    if (!TakePendingInput())
        return;
    const std::vector<CMDIChildWnd*> frames = Children();
    const auto here = std::ranges::find(frames, MDIGetActive());
    if (here == frames.end())
        return;
    const auto count = std::ssize(frames);
    frames[static_cast<std::size_t>((here - frames.begin() + step + count) % count)]->ActivateFrame();
}

void CMDIFrameWnd::OnWindowNew() {
    CDocument* const document = FrontDocument();
    CDocTemplate* const docTemplate = templateOf(document);
    if (!docTemplate || !TakePendingInput())
        return;
    if (CFrameWnd* const frame = docTemplate->CreateNewFrame(document, MDIGetActive()))
        docTemplate->InitialUpdateFrame(frame, document, TRUE);
}
