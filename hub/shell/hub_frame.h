#pragma once

#include "hub/screen/qt_screen.h"
#include "hub/shell/exchange.h"
#include "hub/shell/plug_ins.h"
#include "hub/shell/recent_files.h"
#include "hub/shell/workspace.h"
#include "platform/foundation/frames.h"
#include "platform/framework/application.h"

#include <functional>
#include <memory>
#include <vector>

namespace kota::hub {

// The shell's main window: the documents of all editors, the project that they belong to, and the commands
// that belong to none of them.
class HubFrame : public CKhMDIFrameWnd {
    DECLARE_DYNAMIC(HubFrame)
public:
    // Both must outlive the window.
    HubFrame(CWinApp& application, QtScreen& screen);
    ~HubFrame() override;

    // Makes the templates and the tool bars of the plug-ins known.
    void load(PlugIns plugIns);
    // Documents, and river networks, which are projects. Each with a box that says why, where one cannot be
    // opened.
    void openFiles(const QStringList& paths);
    // Goes on where the user stopped: opens what is asked for, or else the documents that were open, and the
    // project that was, unless another one is asked for.
    void resume(const Workspace& workspace, const QStringList& asked);
    // The documents that are open and have a file, the one in front last.
    QStringList documents() const;

    const Projects& projects() const { return projects_; }
    Exchange& exchange() { return exchange_; }

    // A project was opened or closed.
    std::function<void()> onProject;
    // The program ends: all questions are answered, and everything is still open.
    std::function<void()> onEnd;

    BOOL OnCmdMsg(UINT id, int notification) override;
    BOOL DestroyWindow() override;
    void OnDropFiles(const std::vector<CString>& paths) override;
    LRESULT WindowProc(UINT message, WPARAM wParam, LPARAM lParam) override;

protected:
    void OnUpdateFrameMenu(const CDocTemplate* front) override;
    void PostNcDestroy() override;

private:
    void OnFileNew();
    void OnFileOpen();
    void OnProjectOpen();
    void OnProjectClose();
    void OnSettings();
    void OnExit();
    void OnAbout();
    bool OpenRecent(UINT id, int notification);
    void Open(const QString& path);
    void OpenProject(const QString& path);
    void ProjectChanged();
    bool HasEditorFor(const QString& path) const;
    // After a save of the document in front: its file may have got another name.
    void NoteSaved();
    void ListRecentFiles();

    CWinApp& application_;
    QtScreen& screen_;
    std::vector<PlugIn> plugIns_;
    std::vector<std::unique_ptr<CKhToolBarEx>> toolBars_;
    RecentFiles recent_;
    Projects projects_;
    Exchange exchange_{projects_};
    std::vector<QPixmap> editorPictures_;
};

} // namespace kota::hub
