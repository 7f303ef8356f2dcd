#include "hub/shell/hub_frame.h"
#include "hub/shell/robot.h"
#include "hub/shell/tour.h"

#include <QApplication>
#include <QCommandLineParser>

#include <memory>
#include <span>

namespace {

constexpr QSize firstSize(1280, 800);

int runHub(const QStringList& files, const QString& tourFolder) {
    CWinApp application;
    kota::hub::QtScreen screen;
    kota::Screen* const before = kota::attachScreen(&screen);
    int result = 0;
    {
        kota::hub::HubFrame frame(application, screen);
        QMainWindow* const window = screen.makeMainWindow(frame);
        window->resize(firstSize);
        window->show();
        screen.perform([&] { frame.load(kota::hub::loadPlugIns(kota::hub::plugInFolder())); });
        if (tourFolder.isEmpty()) {
            screen.perform([&] { frame.openFiles(files); });
            result = QApplication::exec();
        } else {
            kota::hub::Robot::settle();
            result = kota::hub::takeTour(frame, *window, files.value(0), tourFolder);
        }
    }
    kota::attachScreen(before);
    return result;
}

// A question about the program itself needs no display.
std::unique_ptr<QCoreApplication> makeApplication(int& argc, char** argv) {
    for (const QByteArray argument : std::span(argv, static_cast<std::size_t>(argc)))
        if (argument == "--help" || argument == "--version")
            return std::make_unique<QCoreApplication>(argc, argv);
    QApplication::setStyle("Fusion");
    return std::make_unique<QApplication>(argc, argv);
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
    options.addPositionalArgument("files", "The documents to open.", "[files...]");
    options.process(*application);
    return runHub(options.positionalArguments(), options.value(tour));
}
