#include "hub/screen/text.h"
#include "hub/shell/menu.h"
#include "hub/shell/panels.h"
#include "hub/shell/program_icon.h"
#include "hub/shell/settings.h"
#include "hub/shell/tour.h"
#include "hub/shell/workspace.h"
#include "platform/language/language.h"

#include <QApplication>
#include <QCommandLineParser>
#include <QLibraryInfo>
#include <QScreen>
#include <QSettings>
#include <QTemporaryDir>
#include <QTextStream>
#include <QTranslator>

#include <functional>
#include <memory>
#include <span>
#include <utility>

namespace {

using kota::hub::HubFrame;
using kota::hub::QtScreen;
using kota::hub::Workspace;

constexpr QSize firstSize(1280, 800);
constexpr QSize leastSize(640, 440);

// Does something as soon as a window is being painted, so that the user sees that the program is busy with
// it.
class AfterFirstPaint : public QObject {
public:
    AfterFirstPaint(QWidget& window, std::function<void()> action) : action_(std::move(action)) {
        window.installEventFilter(this);
    }

protected:
    bool eventFilter(QObject* window, QEvent* event) override {
        if (event->type() == QEvent::Paint) {
            window->removeEventFilter(this);
            action_();
        }
        return QObject::eventFilter(window, event);
    }

private:
    std::function<void()> action_;
};

constexpr int english = 1033;
constexpr int japanese = 1041;

// What the program was asked for when it was started.
struct Start {
    QStringList files;
    int language = 0;   // 0 for the environment's
    QString tourFolder; // empty for no tour
};

// Has the program, the platform and the toolkit speak the user's language, and in letters that show it.
void speak(int language, const QtScreen& screen, QTranslator& toolkitTexts) {
    kota::setLanguage(language);
    kota::hub::loadLanguage();
    if (KhLangGetLanguage() != japanese)
        return;
    if (toolkitTexts.load("qtbase_ja", QLibraryInfo::path(QLibraryInfo::TranslationsPath)))
        QCoreApplication::installTranslator(&toolkitTexts);
    if (const CString face = screen.fontFor(japanese); !face.IsEmpty()) {
        QFont font = QApplication::font();
        font.setFamily(kota::hub::toQt(face));
        QApplication::setFont(font);
    }
}

// As the user left it, or of the usual size.
void placeWindow(QMainWindow& window, const Workspace& workspace, bool forPictures) {
    window.setMinimumSize(leastSize);
    if (!forPictures && workspace.restoreGeometry(window))
        return;
    const QSize room = forPictures ? firstSize : window.screen()->availableSize();
    window.resize(firstSize.boundedTo(room)); // pictures are of one size, whatever the display
}

int runHub(const Start& start) {
    CWinApp application;
    QtScreen screen;
    QTranslator toolkitTexts;
    speak(start.language, screen, toolkitTexts);
    kota::Screen* const before = kota::attachScreen(&screen);
    int result = 0;
    {
        const Workspace workspace = Workspace::load();
        HubFrame frame(application, screen);
        QMainWindow* const window = screen.makeMainWindow(frame);
        const kota::hub::Panels panels(*window, frame, screen);
        placeWindow(*window, workspace, !start.tourFolder.isEmpty());
        window->show();
        frame.onEnd = [&] {
            Workspace last{frame.projects().path(), frame.documents(), {}, {}};
            last.take(*window);
            last.save();
        };
        screen.perform([&] { frame.load(kota::hub::loadPlugIns(kota::hub::plugInFolder())); });
        if (start.tourFolder.isEmpty()) {
            AfterFirstPaint opening(*window, [&] {
                screen.perform([&] {
                    frame.resume(workspace, start.files);
                    workspace.restoreLayout(*window); // which says, too, whether the map is to be seen
                });
            });
            result = QApplication::exec();
        } else {
            result = kota::hub::takeTour(frame, *window, start.files.value(0), start.tourFolder);
        }
    }
    kota::attachScreen(before);
    return result;
}

// A question about the program itself needs no display, nor does the tour.
std::unique_ptr<QCoreApplication> makeApplication(int& argc, char** argv) {
    for (const QByteArray argument : std::span(argv, static_cast<std::size_t>(argc))) {
        if (argument == "--help" || argument == "--version")
            return std::make_unique<QCoreApplication>(argc, argv);
        if (argument.startsWith("--tour") && !qEnvironmentVariableIsSet("QT_QPA_PLATFORM"))
            qputenv("QT_QPA_PLATFORM", "offscreen");
    }
    QApplication::setStyle("Fusion");
    auto application = std::make_unique<QApplication>(argc, argv);
    QApplication::setWindowIcon(kota::hub::programIcon());
    return application;
}

} // namespace

int main(int argc, char** argv) {
    const auto application = makeApplication(argc, argv);
    QCoreApplication::setOrganizationName("KOTA");
    QCoreApplication::setApplicationName("KOTAHub");
    QCoreApplication::setApplicationVersion(KOTA_VERSION);
    QCommandLineParser options;
    options.setApplicationDescription("Opens the documents of a river model in their editors.");
    options.addHelpOption();
    options.addVersionOption();
    const QCommandLineOption tour("tour", "Play a short session on a copy of FILE and leave pictures of it.",
                                  "folder");
    options.addOption(tour);
    const QCommandLineOption language("language", "Show texts in English (en) or Japanese (ja).", "en|ja");
    options.addOption(language);
    options.addPositionalArgument("files", "The documents to open.", "[files...]");
    options.process(*application);
    const QTemporaryDir tourSettings; // the tour leaves the user's own alone
    if (options.isSet(tour)) {
        QSettings::setDefaultFormat(QSettings::IniFormat);
        QSettings::setPath(QSettings::IniFormat, QSettings::UserScope, tourSettings.path());
    }
    const QString asked = options.value(language);
    if (!QStringList{"", "en", "ja"}.contains(asked)) {
        QTextStream(stderr) << "There are no texts in '" << asked << "': en or ja is expected." << Qt::endl;
        return 1;
    }
    const auto settings = kota::hub::Settings::load();
    settings.applyUnits();
    const int chosen = asked.isEmpty() ? settings.language : asked == "ja" ? japanese : english;
    return runHub({options.positionalArguments(), chosen, options.value(tour)});
}
