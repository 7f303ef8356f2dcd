#pragma once

#include "hub/screen/parts.h"
#include "platform/framework/frame.h"
#include "platform/framework/screen.h"

#include <QDialog>
#include <QMainWindow>
#include <QTimer>

#include <functional>
#include <optional>
#include <vector>

namespace kota::hub {

// Draws the platform's windows with Qt. Needs a QApplication, and outlives no part of it.
class QtScreen : public Screen {
public:
    QtScreen();
    ~QtScreen() override;

    // Makes a window of the desktop for a window of the platform, not yet shown. It deletes itself when that
    // one is gone, or else with the screen.
    QWidget* makeWindow(const CWnd& window);
    // Makes the main window, not yet shown, with what is in it. It lives as long as the platform's.
    QMainWindow* makeMainWindow(const CMDIFrameWnd& frame);
    // Does something outside an input, as a turn of its own, when the event loop comes to it.
    void perform(std::function<void()> action);
    // The widget of a window; null when it is not on the screen.
    QWidget* widgetOf(const CWnd& window) const;

    // Asks for files to open; `filters` is in the toolkit's form. Empty when the user changed their mind.
    QStringList askOpenNames(const QString& filters);
    // The same for one file.
    QString askOpenName(const QString& filters);
    // Asks for one of several things; its place among them, none when the user changed their mind.
    std::optional<int> askChoice(const QString& title, const QString& question, const QStringList& entries);
    // Shows a dialog of the shell's own; whether the user accepted it.
    bool ask(QDialog& dialog);
    // Tells the user about the program, with pictures beside the text.
    void showAbout(const QString& title, const QString& text, const QPixmap& picture);
    int showMessageBox(const MessageBoxRequest& request) override;
    std::optional<CString> askSaveName(const CString& proposal) override;
    void showDialog(CDialog& dialog) override;
    CString clipboardText() const override;
    void setClipboardText(const CString& text) override;
    bool editText(UINT command, bool asked) override;
    bool usesDecimalComma() const override;
    CString fontFor(int language) const override;
    void windowsChanged(std::span<const WindowChange> changes) override;
    void changesPending() override;

private:
    QWidget* desktopWindowOf(HWND window) const;
    void afterAction();

    InputQueue queue_;
    Parts parts_;
    std::vector<QPointer<QWidget>> windows_;
    std::function<void()> leaveDialog_; // of the innermost dialog: leaves its event loop if it is ended
    QTimer nextTurn_;                   // runs while changes wait outside a turn
};

} // namespace kota::hub
