#include "hub/screen/qt_screen.h"

#include "hub/screen/text.h"
#include "hub/screen/top_window.h"
#include "platform/framework/dialog.h"
#include "platform/framework/message_box.h"
#include "platform/framework/turn.h"

#include <QApplication>
#include <QEventLoop>
#include <QFileDialog>
#include <QMessageBox>

#include <utility>

namespace kota::hub {

QtScreen::QtScreen() : queue_([this] { afterAction(); }), parts_(queue_) {
    nextTurn_.setSingleShot(true);
    nextTurn_.setInterval(0);
    QObject::connect(&nextTurn_, &QTimer::timeout, &nextTurn_, [] { const Turn turn; });
}

QtScreen::~QtScreen() {
    for (const QPointer<QWidget>& window : windows_)
        delete window.data();
}

QWidget* QtScreen::makeWindow(const CWnd& window) {
    Part* const part = parts_.make(window.GetSafeHwnd());
    if (!part)
        return nullptr;
    auto* const made = new TopWindow(parts_, *part, nullptr);
    windows_.emplace_back(made);
    parts_.settle();
    return made;
}

QMainWindow* QtScreen::makeMainWindow(const CMDIFrameWnd& frame) {
    Part* const part = parts_.make(frame.GetSafeHwnd());
    parts_.settle();
    return part ? static_cast<QMainWindow*>(part->widget()) : nullptr;
}

void QtScreen::perform(std::function<void()> action) {
    queue_.add([act = std::move(action)] {
        const Turn turn;
        act();
    });
}

QWidget* QtScreen::widgetOf(const CWnd& window) const {
    const Part* const part = parts_.find(window.GetSafeHwnd());
    return part ? part->widget() : nullptr;
}

QWidget* QtScreen::desktopWindowOf(HWND window) const {
    for (const CWnd* around = CWnd::FromHandle(window); around; around = around->GetParent())
        if (QWidget* const widget = widgetOf(*around))
            return widget->window();
    return QApplication::activeWindow();
}

int QtScreen::showMessageBox(const MessageBoxRequest& request) {
    const InputQueue::Level level(queue_);
    QMessageBox box(desktopWindowOf(request.owner));
    box.setTextFormat(Qt::PlainText);
    box.setText(toQt(request.text));
    box.setWindowTitle(request.caption ? toQt(*request.caption) : QApplication::applicationDisplayName());
    const bool asks = request.type == MB_YESNOCANCEL;
    box.setIcon(asks ? QMessageBox::Question : QMessageBox::Warning);
    box.setStandardButtons(asks ? QMessageBox::Yes | QMessageBox::No | QMessageBox::Cancel : QMessageBox::Ok);
    switch (box.exec()) {
    case QMessageBox::Ok:
        return IDOK;
    case QMessageBox::Yes:
        return IDYES;
    case QMessageBox::No:
        return IDNO;
    default:
        return asks ? IDCANCEL : IDOK;
    }
}

QStringList QtScreen::askOpenNames(const QString& filters) {
    const InputQueue::Level level(queue_);
    return QFileDialog::getOpenFileNames(QApplication::activeWindow(), QString(), QString(), filters);
}

std::optional<CString> QtScreen::askSaveName(const CString& proposal) {
    const InputQueue::Level level(queue_);
    const QString name =
        QFileDialog::getSaveFileName(QApplication::activeWindow(), QString(), toQt(proposal));
    return name.isEmpty() ? std::nullopt : std::optional<CString>(toPlatform(name).constData());
}

void QtScreen::showDialog(CDialog& dialog) {
    Part* const part = parts_.make(dialog.GetSafeHwnd());
    if (!part)
        return;
    const InputQueue::Level level(queue_);
    const CWnd* const around = dialog.GetParent();
    const QPointer<QWidget> shown = part->widget();
    const QPointer<TopWindow> window =
        new TopWindow(parts_, *part, desktopWindowOf(around ? around->GetSafeHwnd() : nullptr));
    QEventLoop loop;
    const auto outer = std::exchange(leaveDialog_, [&] {
        if (dialog.IsEnded() || !dialog.GetSafeHwnd())
            loop.quit();
    });
    window->setModal(true);
    window->show();
    parts_.settle();
    if (!dialog.IsEnded())
        loop.exec();
    leaveDialog_ = outer;
    if (shown)
        shown->setParent(nullptr); // its part deletes it
    delete window.data();
}

void QtScreen::windowsChanged(std::span<const WindowChange> changes) {
    for (const WindowChange& change : changes)
        parts_.change(change);
    afterAction();
}

void QtScreen::changesPending() {
    nextTurn_.start();
}

void QtScreen::afterAction() {
    parts_.settle();
    if (leaveDialog_)
        leaveDialog_();
}

} // namespace kota::hub
