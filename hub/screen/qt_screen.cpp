#include "hub/screen/qt_screen.h"

#include "hub/screen/text.h"
#include "hub/screen/top_window.h"
#include "platform/framework/dialog.h"
#include "platform/framework/guard.h"
#include "platform/framework/message_box.h"
#include "platform/framework/messages.h"
#include "platform/framework/turn.h"

#include <QApplication>
#include <QClipboard>
#include <QComboBox>
#include <QEventLoop>
#include <QFileDialog>
#include <QFontDatabase>
#include <QFontInfo>
#include <QInputDialog>
#include <QLineEdit>
#include <QLocale>
#include <QMessageBox>

#include <utility>

namespace kota::hub {

namespace {

// While a box waits for the user, input is taken again, and the program is not busy.
class Answering {
public:
    explicit Answering(InputQueue& queue) : level_(queue) {
        if (wasBusy_)
            QGuiApplication::setOverrideCursor(Qt::ArrowCursor);
    }
    ~Answering() {
        if (wasBusy_)
            QGuiApplication::restoreOverrideCursor();
    }
    Answering(const Answering&) = delete;
    Answering& operator=(const Answering&) = delete;

private:
    InputQueue::Level level_;
    bool wasBusy_ = QGuiApplication::overrideCursor() != nullptr;
};

QMessageBox::StandardButtons buttonsOf(UINT type) {
    switch (type) {
    case MB_YESNOCANCEL:
        return QMessageBox::Yes | QMessageBox::No | QMessageBox::Cancel;
    case MB_YESNO:
        return QMessageBox::Yes | QMessageBox::No;
    default:
        return QMessageBox::Ok;
    }
}

} // namespace

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
        guarded(act);
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
    const Answering scope(queue_);
    QMessageBox box(desktopWindowOf(request.owner));
    box.setTextFormat(Qt::PlainText);
    box.setText(toQt(request.text));
    box.setWindowTitle(request.caption ? toQt(*request.caption) : QApplication::applicationDisplayName());
    box.setIcon(request.type == MB_OK ? QMessageBox::Warning : QMessageBox::Question);
    box.setStandardButtons(buttonsOf(request.type));
    switch (box.exec()) {
    case QMessageBox::Ok:
        return IDOK;
    case QMessageBox::Yes:
        return IDYES;
    case QMessageBox::No:
        return IDNO;
    default:
        return request.type == MB_OK ? IDOK : request.type == MB_YESNO ? IDNO : IDCANCEL;
    }
}

QStringList QtScreen::askOpenNames(const QString& filters) {
    const Answering scope(queue_);
    return QFileDialog::getOpenFileNames(QApplication::activeWindow(), QString(), QString(), filters);
}

QString QtScreen::askOpenName(const QString& filters) {
    const Answering scope(queue_);
    return QFileDialog::getOpenFileName(QApplication::activeWindow(), QString(), QString(), filters);
}

std::optional<int> QtScreen::askChoice(const QString& title, const QString& question,
                                       const QStringList& entries) {
    const Answering scope(queue_);
    bool accepted = false;
    const QString chosen =
        QInputDialog::getItem(QApplication::activeWindow(), title, question, entries, 0, false, &accepted);
    return accepted ? std::optional(static_cast<int>(entries.indexOf(chosen))) : std::nullopt;
}

bool QtScreen::ask(QDialog& dialog) {
    const Answering scope(queue_);
    return dialog.exec() == QDialog::Accepted;
}

void QtScreen::showAbout(const QString& title, const QString& text, const QPixmap& picture) {
    const Answering scope(queue_);
    QMessageBox box(QMessageBox::NoIcon, title, text, QMessageBox::Ok, QApplication::activeWindow());
    box.setTextFormat(Qt::PlainText);
    box.setIconPixmap(picture);
    box.exec();
}

std::optional<CString> QtScreen::askSaveName(const CString& proposal) {
    const Answering scope(queue_);
    const QString name =
        QFileDialog::getSaveFileName(QApplication::activeWindow(), QString(), toQt(proposal));
    return name.isEmpty() ? std::nullopt : std::optional<CString>(toPlatform(name).constData());
}

void QtScreen::showDialog(CDialog& dialog) {
    Part* const part = parts_.make(dialog.GetSafeHwnd());
    if (!part)
        return;
    const Answering scope(queue_);
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

CString QtScreen::clipboardText() const {
    return CString(toPlatform(QGuiApplication::clipboard()->text()).constData());
}

void QtScreen::setClipboardText(const CString& text) {
    QGuiApplication::clipboard()->setText(toQt(text));
}

bool QtScreen::editText(UINT command, bool asked) {
    QWidget* const focus = QApplication::focusWidget();
    const auto* const box = qobject_cast<QComboBox*>(focus);
    auto* const line = box ? box->lineEdit() : qobject_cast<QLineEdit*>(focus);
    if (!line)
        return false;
    const bool can = command == ID_EDIT_PASTE  ? !line->isReadOnly()
                     : command == ID_EDIT_UNDO ? line->isUndoAvailable()
                                               : line->hasSelectedText();
    if (asked || !can)
        return can;
    switch (command) {
    case ID_EDIT_UNDO:
        line->undo();
        break;
    case ID_EDIT_CUT:
        line->cut();
        break;
    case ID_EDIT_COPY:
        line->copy();
        break;
    default:
        line->paste();
    }
    return true;
}

bool QtScreen::usesDecimalComma() const {
    return QLocale::system().decimalPoint() == u",";
}

CString QtScreen::fontFor(int language) const {
    constexpr int japanese = 1041;
    if (language != japanese)
        return {};
    const QString own = QFontInfo(QApplication::font()).family();
    const QStringList families = QFontDatabase::families(QFontDatabase::Japanese);
    if (families.isEmpty() || families.contains(own))
        return {};
    // The proportional ones of the usual families, and else whatever is there.
    for (const char* const name : {"Noto Sans CJK JP", "Noto Sans JP", "IPAexGothic", "IPAPGothic",
                                   "VL PGothic", "TakaoPGothic", "IPAGothic"})
        if (families.contains(QLatin1String(name)))
            return name;
    return toPlatform(families.first()).constData();
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
