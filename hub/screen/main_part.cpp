#include "hub/screen/main_part.h"

#include "hub/screen/dock.h"
#include "hub/screen/parts.h"
#include "hub/screen/pictures.h"
#include "hub/screen/text.h"
#include "platform/framework/document.h"
#include "platform/framework/messages.h"
#include "platform/framework/scope.h"
#include "platform/framework/template.h"

#include <QCloseEvent>
#include <QDropEvent>
#include <QFile>
#include <QMenuBar>
#include <QMimeData>
#include <QStatusBar>

#include <algorithm>
#include <array>
#include <vector>

namespace kota::hub {

namespace {

constexpr std::array screenCommands = {ID_VIEW_TOOLBAR, ID_VIEW_STATUS_BAR, ID_WINDOW_CASCADE,
                                       ID_WINDOW_ARRANGE, ID_WINDOW_TILE_HORZ};

bool isToggle(UINT id) {
    return id == ID_VIEW_TOOLBAR || id == ID_VIEW_STATUS_BAR;
}

std::vector<CString> filesOf(const QMimeData& dropped) {
    std::vector<CString> files;
    for (const QUrl& url : dropped.urls())
        if (url.isLocalFile())
            files.emplace_back(QFile::encodeName(url.toLocalFile()).constData());
    return files;
}

} // namespace

// Asks the platform to close it when the user wants to.
class MainPart::Window : public QMainWindow {
public:
    explicit Window(MainPart& part) : part_(part) { setAcceptDrops(true); }

protected:
    void dragEnterEvent(QDragEnterEvent* event) override {
        if (!filesOf(*event->mimeData()).empty())
            event->acceptProposedAction();
    }
    void dropEvent(QDropEvent* event) override {
        part_.queue([files = filesOf(*event->mimeData())](CWnd& window) {
            input::drop(static_cast<CMDIFrameWnd&>(window), files);
        });
        event->acceptProposedAction();
    }
    void closeEvent(QCloseEvent* event) override {
        event->ignore();
        part_.queue([](CWnd& window) { input::close(window); });
    }

private:
    MainPart& part_;
};

MainPart::MainPart(Parts& parts, HWND window) : Part(parts, window, new Window(*this)), area_(new QMdiArea) {
    area_->setHorizontalScrollBarPolicy(Qt::ScrollBarAsNeeded);
    area_->setVerticalScrollBarPolicy(Qt::ScrollBarAsNeeded);
    mainWindow().setCentralWidget(area_);
    mainWindow().statusBar();
    mainWindow().setContextMenuPolicy(Qt::NoContextMenu);
    parts.keyboard().watch(mainWindow());
    QObject::connect(area_, &QMdiArea::subWindowActivated, this, &MainPart::activated);
}

MainPart::~MainPart() {
    // The area activates one frame after another while it goes with the widget, and this is no main part
    // then.
    area_->disconnect(this);
}

CMDIFrameWnd* MainPart::frame() const {
    return static_cast<CMDIFrameWnd*>(CWnd::FromHandle(window()));
}

QMainWindow& MainPart::mainWindow() const {
    return *static_cast<QMainWindow*>(widget());
}

void MainPart::add(Part& child) {
    if (auto* const bar = qobject_cast<QToolBar*>(child.widget())) {
        mainWindow().addToolBar(bar);
        return;
    }
    const bool fillsArea = !area_->activeSubWindow() || area_->activeSubWindow()->isMaximized();
    auto* const shown = new FrameWindow(child, parts().queue());
    area_->addSubWindow(shown);
    if (fillsArea)
        shown->showMaximized();
    else
        shown->show();
}

void MainPart::refresh(const WindowState& state) {
    mainWindow().setWindowTitle(toQt(state.text));
    showMenu();
}

void MainPart::showMenu() {
    QMenuBar& bar = *mainWindow().menuBar();
    bar.clear();
    for (QMenu* const old : bar.findChildren<QMenu*>(Qt::FindDirectChildrenOnly))
        old->deleteLater(); // one of its entries may be running
    const CMenu* const entries = frame() ? frame()->GetMenu() : nullptr;
    if (!entries)
        return;
    for (const CMenu::Entry& entry : entries->Entries()) {
        QMenu* const menu = bar.addMenu(toQt(entry.text));
        menu->setEnabled(entry.enabled);
        if (entry.submenu)
            fill(*menu, *entry.submenu);
        QObject::connect(menu, &QMenu::aboutToShow, menu, [this, menu] { enableEntries(*menu); });
    }
}

void MainPart::fill(QMenu& menu, const CMenu& entries) {
    for (const CMenu::Entry& entry : entries.Entries()) {
        if (entry.id == 0) {
            menu.addSeparator();
            continue;
        }
        QAction* const action = menu.addAction(toQt(entry.text));
        action->setData(entry.id);
        action->setStatusTip(toQt(frame()->GetMessageString(entry.id)).section('\n', 0, 0));
        QObject::connect(action, &QAction::triggered, this, [this, id = entry.id] { run(id); });
    }
    enableEntries(menu);
}

void MainPart::enableEntries(const QMenu& menu) const {
    for (QAction* const action : menu.actions()) {
        const UINT id = action->data().toUInt();
        if (id == 0)
            continue;
        action->setEnabled(isOwnCommand(id) ? canRunOwn(id) : input::canCommand(id));
        const QDockWidget* const panel = panelOf(id);
        action->setCheckable(panel || isToggle(id));
        if (panel)
            action->setChecked(!panel->isHidden());
        else if (id == ID_VIEW_TOOLBAR)
            action->setChecked(toolBarsWanted_);
        else if (id == ID_VIEW_STATUS_BAR)
            action->setChecked(!mainWindow().statusBar()->isHidden());
    }
}

bool MainPart::isOwnCommand(UINT id) const {
    return panelOf(id) || std::ranges::find(screenCommands, id) != screenCommands.end();
}

QDockWidget* MainPart::panelOf(UINT id) const {
    for (QDockWidget* const panel : mainWindow().findChildren<QDockWidget*>())
        if (Dock::commandOf(*panel) == id)
            return panel;
    return nullptr;
}

bool MainPart::canRunOwn(UINT id) const {
    const QList<QMdiSubWindow*> frames = area_->subWindowList();
    if (id == ID_WINDOW_ARRANGE)
        return std::ranges::any_of(frames, &QMdiSubWindow::isMinimized);
    return isToggle(id) || panelOf(id) || !frames.isEmpty();
}

void MainPart::run(UINT id) {
    parts().queue().add([this, id] {
        if (isOwnCommand(id))
            runOwn(id);
        else
            input::command(id);
    });
}

void MainPart::runOwn(UINT id) {
    if (QDockWidget* const panel = panelOf(id)) {
        panel->setVisible(panel->isHidden());
        panel->raise();
        if (!panel->isHidden())
            panel->setFocus(Qt::TabFocusReason);
        return;
    }
    switch (id) {
    case ID_VIEW_TOOLBAR:
        toolBarsWanted_ = !toolBarsWanted_;
        break;
    case ID_VIEW_STATUS_BAR:
        mainWindow().statusBar()->setVisible(mainWindow().statusBar()->isHidden());
        break;
    case ID_WINDOW_CASCADE:
        area_->cascadeSubWindows();
        break;
    case ID_WINDOW_TILE_HORZ:
        area_->tileSubWindows();
        break;
    default:
        for (QMdiSubWindow* const shown : area_->subWindowList())
            if (shown->isMinimized())
                shown->showNormal();
    }
}

// By the user, or by the toolkit itself when it puts another one in front.
void MainPart::activated(const QMdiSubWindow* shown) const {
    if (settling_ || !shown)
        return;
    const HWND entered = static_cast<const FrameWindow*>(shown)->frame();
    parts().queue().add([entered] {
        if (auto* const child = static_cast<CMDIChildWnd*>(CWnd::FromHandle(entered)))
            input::activate(*child);
    });
}

void MainPart::settle() {
    if (!frame())
        return;
    const ValueScope scope(settling_, true);
    showFramesAsTheyStand();
    for (auto* const bar : mainWindow().findChildren<QToolBar*>()) {
        const CWnd* const window =
            CWnd::FromHandle(static_cast<HWND>(bar->property("window").value<void*>()));
        bar->setVisible(toolBarsWanted_ && window && window->State()->visible);
    }
}

void MainPart::showFramesAsTheyStand() {
    const CMDIChildWnd* const front = frame()->MDIGetActive();
    for (QMdiSubWindow* const shown : area_->subWindowList()) {
        const HWND window = static_cast<FrameWindow*>(shown)->frame();
        if (!IsWindow(window))
            delete shown;
        else if (front && front->GetSafeHwnd() == window && area_->activeSubWindow() != shown)
            area_->setActiveSubWindow(shown);
    }
}

void FramePart::refresh(const WindowState& state) {
    widget()->setWindowTitle(toQt(state.text) + "[*]");
    widget()->setWindowModified(state.modified);
    const auto* const frame = static_cast<CFrameWnd*>(CWnd::FromHandle(window()));
    const CDocument* const document = frame->GetActiveDocument();
    if (const CDocTemplate* const kind = document ? document->GetDocTemplate() : nullptr)
        widget()->setWindowIcon(pictureOf(kind->Module().icon(kind->Id())));
}

FrameWindow::FrameWindow(Part& frame, InputQueue& queue) : frame_(frame.window()), queue_(queue) {
    setWidget(frame.widget());
    setAttribute(Qt::WA_DeleteOnClose, false);
    resize(900, 600);
}

void FrameWindow::closeEvent(QCloseEvent* event) {
    event->ignore();
    queue_.add([window = frame_] {
        if (CWnd* const closed = CWnd::FromHandle(window))
            input::close(*closed);
    });
}

ToolBarPart::ToolBarPart(Parts& parts, HWND window) : Part(parts, window, new QToolBar) {
    bar().setMovable(true);
    bar().setProperty("window", QVariant::fromValue(static_cast<void*>(window)));
}

QToolBar& ToolBarPart::bar() const {
    return *static_cast<QToolBar*>(widget());
}

void ToolBarPart::refresh(const WindowState& state) {
    bar().setWindowTitle(toQt(state.text).trimmed());
    const auto* const source = dynamic_cast<CKhFlatToolBar*>(CWnd::FromHandle(window()));
    const ToolBarTemplate* const buttons = source ? source->Buttons() : nullptr;
    if (!buttons || !bar().actions().isEmpty())
        return;
    bar().setObjectName(QString("bar%1").arg(buttons->id)); // by which the toolkit keeps its place
    bar().setIconSize(QSize(buttons->buttonWidth, buttons->buttonHeight));
    const BitmapResource* const pictures = source->ResourceModule()->bitmap(buttons->id);
    int place = 0;
    for (const UINT command : buttons->commands) {
        if (command == 0) {
            bar().addSeparator();
            continue;
        }
        const QString prompt = toQt(source->ResourceModule()->string(command));
        QAction* const action =
            bar().addAction(QIcon(buttonPicture(pictures, *buttons, place++)), prompt.section('\n', 1, 1));
        action->setData(command);
        action->setStatusTip(prompt.section('\n', 0, 0));
        QObject::connect(action, &QAction::triggered, this,
                         [this, command] { parts().queue().add([command] { input::command(command); }); });
    }
}

void ToolBarPart::settle() {
    for (QAction* const action : bar().actions())
        if (!action->isSeparator())
            action->setEnabled(input::canCommand(action->data().toUInt()));
}

} // namespace kota::hub
