#pragma once

#include "document/kota0_ad_doc.h"
#include "hub/screen/grid_view.h"
#include "hub/screen/qt_screen.h"
#include "hub/shell/hub_frame.h"
#include "hub/shell/panels.h"
#include "platform/framework/application.h"
#include "platform/framework/document.h"
#include "tests/hub/shell_user.h"
#include "tests/support/owned.h"
#include "tests/support/temp_folder.h"

#include <QFileInfo>
#include <QMdiSubWindow>
#include <QSettings>
#include <QStatusBar>
#include <QToolBar>

#include <gmock/gmock.h>

#include <string>

namespace kota::test {

// The user's settings in a folder that goes with everything in it.
class OwnSettings {
public:
    OwnSettings() {
        QCoreApplication::setOrganizationName("KOTA");
        QCoreApplication::setApplicationName("KOTAHub");
        QCoreApplication::setAttribute(Qt::AA_DontUseNativeDialogs);
        QSettings::setDefaultFormat(QSettings::IniFormat);
        QSettings::setPath(QSettings::IniFormat, QSettings::UserScope,
                           QString::fromStdString(folder.path().string()));
    }

    TempFolder folder;
};

// A shell on the screen, made as the program makes it.
struct RunningShell {
    RunningShell() : before(attachScreen(&screen)), frame(application, screen) {
        forgetEndBefore();
        window = screen.makeMainWindow(frame);
        panels.emplace(*window, frame, screen);
        window->resize(1280, 800);
        window->show();
        window->activateWindow();
        EXPECT_TRUE(QTest::qWaitForWindowActive(window));
    }
    ~RunningShell() { attachScreen(before); }
    RunningShell(const RunningShell&) = delete;
    RunningShell& operator=(const RunningShell&) = delete;

    CWinApp application;
    hub::QtScreen screen;
    Screen* before;
    hub::HubFrame frame;
    QPointer<QMainWindow> window;
    std::optional<hub::Panels> panels;

private:
    // A shell that ended has told the toolkit to leave its event loops, also those that come later.
    static void forgetEndBefore() {
        QTimer::singleShot(0, qApp, &QCoreApplication::quit);
        QApplication::exec();
    }
};

// A shell without a plug-in yet, with a user at mouse and keyboard.
class AnEmptyShell : public testing::Test, public ShellUser {
protected:
    AnEmptyShell() { use(*shell.window); }

    void loadPlugIns(const QString& from) {
        shell.screen.perform([this, from] { shell.frame.load(hub::loadPlugIns(from)); });
        settle();
    }
    void open(const QStringList& paths) {
        shell.screen.perform([this, paths] { shell.frame.openFiles(paths); });
        settle();
    }
    void open(const std::string& path) { open(QStringList(QString::fromStdString(path))); }

    OwnSettings settings;
    const TempFolder& folder = settings.folder;
    RunningShell shell;
};

// A shell with the editor.
class ShownShell : public AnEmptyShell {
protected:
    ShownShell() { loadPlugIns(QFileInfo(KOTA_PLUG_IN).path()); }

    void createDocument() { choose("File", "New"); }
    // A copy of the example, not opened yet.
    std::string copyExample(const std::string& name = "river.AD31") const {
        return folder.write(name, readFile(KOTA_EXAMPLES "/missouri/missouri.AD31"));
    }
    std::vector<CMDIChildWnd*> frames() const { return shell.frame.Children(); }
    // The document in front. There must be one.
    CKota0_adDoc& document() const {
        return *static_cast<CKota0_adDoc*>(shell.frame.MDIGetActive()->GetActiveDocument());
    }
    std::string frontTitle() const {
        const CMDIChildWnd* const front = shell.frame.MDIGetActive();
        return front ? std::string(front->GetWindowText().View()) : "";
    }
    // The toolkit's window around a frame; null when it shows none.
    QMdiSubWindow* windowOf(const CMDIChildWnd* frame) const {
        QWidget* const widget = frame ? shell.screen.widgetOf(*frame) : nullptr;
        return widget ? qobject_cast<QMdiSubWindow*>(widget->parentWidget()) : nullptr;
    }
    QMdiSubWindow& front() const { return *windowOf(shell.frame.MDIGetActive()); }
    // The grid that is to be seen in front.
    hub::GridView& grid() const {
        for (hub::GridView* const view : front().findChildren<hub::GridView*>())
            if (view->isVisible())
                return *view;
        throw std::runtime_error("there is no grid in front");
    }
    QModelIndex index(int line, int column) const { return grid().model()->index(line - 1, column - 1); }
    std::string displayed(int line, int column) const {
        return index(line, column).data(Qt::DisplayRole).toString().toStdString();
    }
    int lineCount() const { return grid().model()->rowCount(); }
    void clickCell(int line, int column) {
        click(*grid().viewport(), grid().visualRect(index(line, column)).center());
    }
    void clickTab(const char* caption) { clickTabOf(front(), caption); }
    // Gives the decay line in front this constant, up to the end of the edit.
    void changeDecay(const char* constant) {
        clickTab("Decay");
        clickCell(1, 2);
        type(constant);
        press(Qt::Key_Return);
    }
    // Names the first component of the document in front.
    void nameComponent(const char* name) {
        clickTab("Components");
        clickCell(1, 1);
        type(name);
        press(Qt::Key_Return);
    }
    double storedDecay() const { return recordOf(document().decayList).decayConst; }
    // The decay constant that a file holds.
    static double decayIn(const std::string& path) {
        OwnedDocument read;
        read.ReadData(path.c_str());
        return recordOf(read.decayList).decayConst;
    }
    // The name of the first component that a file holds.
    static std::string componentIn(const std::string& path) {
        OwnedDocument read;
        read.ReadData(path.c_str());
        return std::string(recordOf(read.compList).name.View());
    }
};

} // namespace kota::test
