#pragma once

#include "hub/screen/containers.h"
#include "hub/screen/input_queue.h"
#include "platform/foundation/frames.h"

#include <QAction>
#include <QDockWidget>
#include <QMainWindow>
#include <QMdiArea>
#include <QMdiSubWindow>
#include <QToolBar>

#include <optional>

namespace kota::hub {

// The main window: menu bar, tool bars, the documents' frames inside, status bar. How these lie on the screen
// is the screen's own matter: it carries out the commands for that by itself.
class MainPart : public Part {
public:
    MainPart(Parts& parts, HWND window);
    ~MainPart() override;

    void add(Part& child) override;
    void settle() override;

protected:
    void refresh(const WindowState& state) override;

private:
    class Window;

    CMDIFrameWnd* frame() const;
    QMainWindow& mainWindow() const;
    void showMenu();
    void fill(QMenu& menu, const CMenu& entries);
    void enableEntries(const QMenu& menu) const;
    // The commands of the screen: whether it has this one, whether it can be carried out now.
    bool isOwnCommand(UINT id) const;
    bool canRunOwn(UINT id) const;
    // The panel that a command shows and hides; null for other commands.
    QDockWidget* panelOf(UINT id) const;
    void run(UINT id);
    void runOwn(UINT id);
    void activated(const QMdiSubWindow* frame) const;
    void showFramesAsTheyStand();

    QMdiArea* area_;
    bool toolBarsWanted_ = true;
    bool settling_ = false;
};

// A document's frame, with the mark of changes that are not saved.
class FramePart : public FormPart {
public:
    using FormPart::FormPart;

protected:
    void refresh(const WindowState& state) override;
};

// The frame's window inside the main window.
class FrameWindow : public QMdiSubWindow {
public:
    FrameWindow(Part& frame, InputQueue& queue);

    HWND frame() const { return frame_; }

protected:
    void closeEvent(QCloseEvent* event) override;

private:
    HWND frame_;
    InputQueue& queue_;
};

// A tool bar of buttons with pictures.
class ToolBarPart : public Part {
public:
    ToolBarPart(Parts& parts, HWND window);

    void settle() override;

protected:
    void refresh(const WindowState& state) override;

private:
    QToolBar& bar() const;
};

} // namespace kota::hub
