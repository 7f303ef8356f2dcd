#include "hub/shell/hub_frame.h"

#include "hub/project/geojson.h"
#include "hub/screen/pictures.h"
#include "hub/screen/text.h"
#include "hub/shell/commands.h"
#include "hub/shell/menu.h"
#include "hub/shell/settings_dialog.h"
#include "platform/framework/document.h"
#include "platform/framework/message_box.h"
#include "platform/framework/messages.h"
#include "platform/framework/template.h"
#include "platform/framework/turn.h"

#include <QApplication>
#include <QFileInfo>
#include <QPainter>

#include <algorithm>
#include <optional>

namespace kota::hub {

IMPLEMENT_DYNAMIC(HubFrame, CKhMDIFrameWnd, hubModule)

namespace {

constexpr UINT firstToolBarId = 59400;

// Shows that the program is busy before it stops answering.
class Busy {
public:
    explicit Busy() {
        QGuiApplication::setOverrideCursor(Qt::WaitCursor);
        for (QWidget* const window : QApplication::topLevelWidgets())
            if (window->isVisible())
                window->repaint();
    }
    ~Busy() { QGuiApplication::restoreOverrideCursor(); }
    Busy(const Busy&) = delete;
    Busy& operator=(const Busy&) = delete;
};

// The program's picture, and those of its editors below.
QPixmap aboutPicture(const std::vector<QPixmap>& editors) {
    constexpr int side = 64;
    constexpr int editorSide = 32;
    QPixmap whole(side, side + (editors.empty() ? 0 : editorSide + 8));
    whole.fill(Qt::transparent);
    QPainter painter(&whole);
    painter.drawPixmap(0, 0, QApplication::windowIcon().pixmap(side));
    QRect place(0, side + 8, editorSide, editorSide);
    for (const QPixmap& editor : editors) {
        painter.drawPixmap(place, editor);
        place.translate(editorSide + 4, 0);
    }
    return whole;
}

// A long path without its middle.
QString shortened(const QString& path) {
    constexpr qsizetype most = 60;
    return path.size() <= most ? path : path.left(most / 3) + "..." + path.right(2 * most / 3);
}

bool isNetwork(const QString& path) {
    const QString ending = QFileInfo(path).suffix();
    return ending.compare("geojson", Qt::CaseInsensitive) == 0 ||
           ending.compare("json", Qt::CaseInsensitive) == 0;
}

NetworkReading readBusily(const QString& path) {
    const Busy busy;
    return readNetwork(path);
}

void tell(const QString& text) {
    AfxMessageBox(toPlatform(text).constData());
}

} // namespace

HubFrame::HubFrame(CWinApp& application, QtScreen& screen) : application_(application), screen_(screen) {
    Create({.parent = nullptr, .kind = WindowKind::Frame});
    SetWindowText("KOTAHub");
    LoadMenu(hubMenu());
    LoadAccelerators(hubKeys());
    application_.SetMainWnd(this);
}

HubFrame::~HubFrame() {
    const Turn turn; // at whose end the documents' frames are deleted
    HubFrame::DestroyWindow();
}

void HubFrame::load(PlugIns plugIns) {
    plugIns_ = std::move(plugIns.loaded);
    for (const PlugIn& plugIn : plugIns_) {
        for (auto& docTemplate : plugIn.makeTemplates()) {
            if (const BitmapResource* const bitmap = docTemplate->Module().bitmap(plugIn.bitmapId()))
                editorPictures_.push_back(pictureOf(bitmap));
            application_.AddDocTemplate(std::move(docTemplate));
        }
        for (int index = 0; index < plugIn.toolBarCount(); ++index) {
            const UINT id = firstToolBarId + static_cast<UINT>(toolBars_.size());
            auto toolBar = plugIn.makeToolBar(*this, 0, id, index);
            if (!toolBar)
                continue;
            toolBar->SetWindowText(plugIn.toolBarName(index));
            toolBar->ShowWindow(FALSE); // until a document of the editor is in front
            toolBars_.push_back(std::move(toolBar));
        }
    }
    if (!plugIns.problems.empty())
        tell(plugIns.problems.join('\n'));
}

void HubFrame::openFiles(const QStringList& paths) {
    if (!TakePendingInput())
        return;
    for (const QString& path : paths) {
        if (isNetwork(path))
            OpenProject(path);
        else
            Open(path);
    }
}

void HubFrame::resume(const Workspace& workspace, const QStringList& asked) {
    if (!workspace.project.isEmpty() && std::ranges::none_of(asked, isNetwork))
        OpenProject(workspace.project);
    openFiles(asked.isEmpty() ? workspace.documents : asked);
}

QStringList HubFrame::documents() const {
    QStringList paths;
    const auto add = [&](const CDocument* document) {
        const QString path = document ? QFile::decodeName(QByteArray(document->GetPathName())) : QString();
        paths.removeAll(path);
        if (!path.isEmpty())
            paths.append(path);
    };
    for (const CMDIChildWnd* child : Children())
        add(child->GetActiveDocument());
    add(FrontDocument());
    return paths;
}

void HubFrame::OpenProject(const QString& path) {
    const QString file = QFileInfo(path).absoluteFilePath();
    const NetworkReading reading = readBusily(file);
    if (!reading.network) {
        tell(reading.error);
        return;
    }
    projects_.open(file, reading.network);
    ProjectChanged();
}

void HubFrame::ProjectChanged() {
    exchange_.offer({}); // it was picked in another project
    const QString name = QFileInfo(projects_.path()).fileName();
    SetWindowText(projects_.isOpen() ? toPlatform(QString("KOTAHub - %1").arg(name)).constData() : "KOTAHub");
    if (onProject)
        onProject();
}

void HubFrame::OnProjectOpen() {
    const QString filter = hubText(HubText::RiverNetworks) + " (*.geojson *.json)";
    if (const QString path = screen_.askOpenName(filter); !path.isEmpty())
        OpenProject(path);
}

void HubFrame::OnProjectClose() {
    projects_.close();
    ProjectChanged();
}

void HubFrame::OnSettings() {
    SettingsDialog dialog(Settings::load(), QApplication::activeWindow());
    if (screen_.ask(dialog))
        dialog.chosen().save();
}

void HubFrame::Open(const QString& path) {
    const QByteArray name = QFile::encodeName(QFileInfo(path).absoluteFilePath());
    if (!HasEditorFor(path))
        tell(hubText(HubText::NoEditorFor).arg(path));
    const Busy busy;
    if (application_.OpenDocumentFile(name.constData()))
        recent_.add(path);
    else if (!QFileInfo::exists(path))
        recent_.remove(QFileInfo(path).absoluteFilePath());
    ListRecentFiles();
}

bool HubFrame::HasEditorFor(const QString& path) const {
    const QString ending = "." + QFileInfo(path).suffix();
    return std::ranges::any_of(application_.Templates(), [&](const CDocTemplate* docTemplate) {
        const CString own = docTemplate->GetDocString(CDocTemplate::DocString::FilterExtension);
        return ending.compare(toQt(own), Qt::CaseInsensitive) == 0;
    });
}

void HubFrame::OnFileNew() {
    if (!TakePendingInput()) // the user goes on where a text is refused
        return;
    const auto& templates = application_.Templates();
    QStringList kinds;
    for (const CDocTemplate* docTemplate : templates)
        kinds.append(toQt(docTemplate->GetDocString(CDocTemplate::DocString::FileNewName)));
    const std::optional<int> chosen =
        kinds.size() > 1 ? screen_.askChoice(hubText(HubText::New), hubText(HubText::WhatKind), kinds) : 0;
    if (chosen && *chosen < kinds.size())
        templates[static_cast<std::size_t>(*chosen)]->OpenDocumentFile(nullptr);
}

void HubFrame::OnFileOpen() {
    QStringList filters;
    for (const CDocTemplate* docTemplate : application_.Templates()) {
        const QString name = toQt(docTemplate->GetDocString(CDocTemplate::DocString::FilterName));
        const QString ending = toQt(docTemplate->GetDocString(CDocTemplate::DocString::FilterExtension));
        filters.append(
            QString("%1 (*%2 *%3)").arg(name.section('(', 0, 0).trimmed(), ending, ending.toUpper()));
    }
    openFiles(screen_.askOpenNames(filters.join(";;")));
}

void HubFrame::OnDropFiles(const std::vector<CString>& paths) {
    QStringList files;
    for (const CString& path : paths)
        files.append(QFile::decodeName(QByteArray(path)));
    openFiles(files);
}

void HubFrame::OnExit() {
    OnClose();
}

BOOL HubFrame::DestroyWindow() {
    if (GetSafeHwnd() && onEnd)
        onEnd();
    return CKhMDIFrameWnd::DestroyWindow();
}

void HubFrame::OnAbout() {
    QStringList editors;
    for (const PlugIn& plugIn : plugIns_)
        editors.append(toQt(plugIn.editorName()));
    const QString text = hubText(HubText::VersionAndEditors)
                             .arg(QApplication::applicationVersion(),
                                  editors.isEmpty() ? hubText(HubText::NoEditors) : editors.join(", "));
    screen_.showAbout(hubText(HubText::About), text, aboutPicture(editorPictures_));
}

bool HubFrame::OpenRecent(UINT id, int notification) {
    const int place = static_cast<int>(id) - static_cast<int>(ID_FILE_MRU_FILE1);
    if (place < 0 || place >= recent_.paths().size())
        return false;
    if (notification == 0)
        openFiles({recent_.paths()[place]});
    return true;
}

BOOL HubFrame::OnCmdMsg(UINT id, int notification) {
    static constexpr auto commands = kota::commandMap<HubFrame>({
        {ID_FILE_NEW, 0, &HubFrame::OnFileNew},
        {ID_FILE_OPEN, 0, &HubFrame::OnFileOpen},
        {HubCommand::OpenProject, 0, &HubFrame::OnProjectOpen},
        {HubCommand::CloseProject, 0, &HubFrame::OnProjectClose},
        {HubCommand::Settings, 0, &HubFrame::OnSettings},
        {ID_APP_EXIT, 0, &HubFrame::OnExit},
        {ID_APP_ABOUT, 0, &HubFrame::OnAbout},
    });
    const bool needsEditor = id == ID_FILE_NEW || id == ID_FILE_OPEN;
    if (needsEditor && application_.Templates().empty())
        return FALSE;
    if (id == HubCommand::CloseProject && !projects_.isOpen())
        return FALSE;
    const BOOL done = runCommand(*this, commands, id, notification) || OpenRecent(id, notification) ||
                      CKhMDIFrameWnd::OnCmdMsg(id, notification);
    if (notification == 0 && (id == ID_FILE_SAVE || id == ID_FILE_SAVE_AS))
        NoteSaved();
    return done;
}

void HubFrame::NoteSaved() {
    CDocument* const document = FrontDocument();
    if (!document || document->IsModified() || document->GetPathName().IsEmpty())
        return;
    recent_.add(QFile::decodeName(QByteArray(document->GetPathName())));
    ListRecentFiles();
}

LRESULT HubFrame::WindowProc(UINT message, WPARAM wParam, LPARAM lParam) {
    if (!Exchange::isMessage(message))
        return CKhMDIFrameWnd::WindowProc(message, wParam, lParam);
    const bool shows = message == showToolbarMessage();
    if (shows || message == hideToolbarMessage()) {
        ShowToolBar(static_cast<UINT>(wParam), shows);
        return exchange_.take(message, wParam, nullptr);
    }
    const LRESULT answer = exchange_.take(message, wParam, reinterpret_cast<const CKHComm_Package*>(lParam));
    if (message == communicationMessage() && CommunicationCode::isToldToAll(wParam))
        PassOn(message, wParam, lParam);
    return answer;
}

void HubFrame::OnUpdateFrameMenu(const CDocTemplate* front) {
    CKhMDIFrameWnd::OnUpdateFrameMenu(front);
    ListRecentFiles();
}

// In the place of the entry that stands for them.
void HubFrame::ListRecentFiles() {
    const QStringList& paths = recent_.paths();
    std::vector<CMenu::Command> entries;
    for (qsizetype i = 0; i < paths.size(); ++i) {
        const QString name = QString(QFileInfo(paths[i]).fileName()).replace("&", "&&");
        const QString folder = shortened(QFileInfo(paths[i]).path()).replace("&", "&&");
        entries.push_back({ID_FILE_MRU_FILE1 + static_cast<UINT>(i),
                           toPlatform(QString("&%1 %2 - %3").arg(i + 1).arg(name, folder)).constData()});
    }
    if (paths.isEmpty())
        entries.push_back({ID_FILE_MRU_FILE1, toPlatform(hubText(HubText::RecentFile)).constData()});
    GetMenu()->ReplaceCommands(ID_FILE_MRU_FILE1, ID_FILE_MRU_FILE1 + RecentFiles::most, entries);
    DrawMenuBar();
}

void HubFrame::PostNcDestroy() {
    QCoreApplication::exit(0); // quit() would ask the windows first, and this one is gone
}

} // namespace kota::hub
