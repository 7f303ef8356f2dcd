#pragma once

#include "hub/screen/qt_screen.h"
#include "hub/shell/plug_ins.h"
#include "hub/shell/recent_files.h"
#include "platform/foundation/frames.h"
#include "platform/framework/application.h"

#include <memory>
#include <vector>

namespace kota::hub {

// The shell's main window: the documents of all editors, and the commands that belong to none of them. No
// project is open, so the editors' requests for one, its rivers and a location are answered with nothing.
class HubFrame : public CKhMDIFrameWnd {
    DECLARE_DYNAMIC(HubFrame)
public:
    // Both must outlive the window.
    HubFrame(CWinApp& application, QtScreen& screen);
    ~HubFrame() override;

    // Makes the templates and the tool bars of the plug-ins known.
    void load(PlugIns plugIns);
    // Each with a box that says why, where one cannot be opened.
    void openFiles(const QStringList& paths);

    BOOL OnCmdMsg(UINT id, int notification) override;
    void OnDropFiles(const std::vector<CString>& paths) override;
    LRESULT WindowProc(UINT message, WPARAM wParam, LPARAM lParam) override;

protected:
    void OnUpdateFrameMenu(const CDocTemplate* front) override;
    void PostNcDestroy() override;

private:
    void OnFileNew();
    void OnFileOpen();
    void OnExit();
    void OnAbout();
    bool OpenRecent(UINT id, int notification);
    void Open(const QString& path);
    bool HasEditorFor(const QString& path) const;
    // After a save of the document in front: its file may have got another name.
    void NoteSaved();
    void ListRecentFiles();

    CWinApp& application_;
    QtScreen& screen_;
    std::vector<PlugIn> plugIns_;
    std::vector<std::unique_ptr<CKhToolBarEx>> toolBars_;
    RecentFiles recent_;
    std::vector<QPixmap> editorPictures_;
};

} // namespace kota::hub
