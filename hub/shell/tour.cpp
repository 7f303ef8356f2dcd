#include "hub/shell/tour.h"

#include "hub/shell/robot.h"
#include "platform/framework/document.h"
#include "platform/framework/messages.h"

#include <QAbstractButton>
#include <QDir>
#include <QFileInfo>
#include <QMessageBox>
#include <QTextStream>

#include <cmath>
#include <stdexcept>

namespace kota::hub {

namespace {

// The places of tabs, and of a field of the dispersion tab.
constexpr int components = 0;
constexpr int dispersion = 1;
constexpr int decay = 4;
constexpr int minimumCoefficient = 3;
// Down the first river of the network; in the example, near Omaha.
constexpr double wayToPick = 0.827;

class Tour {
public:
    Tour(HubFrame& frame, QMainWindow& window, Robot& robot, const QDir& folder)
        : frame_(frame), window_(window), robot_(robot), folder_(folder) {}

    void play(const QString& document) {
        copy_ = folder_.filePath(QFileInfo(document).fileName());
        if (QFileInfo(copy_) == QFileInfo(document))
            throw std::runtime_error(
                ("the pictures need another folder than that of " + document).toStdString());
        QFile::remove(copy_);
        if (!QFile::copy(document, copy_))
            throw std::runtime_error(("cannot copy " + document + " to " + copy_).toStdString());
        openProject(QFileInfo(document).dir().filePath("network.geojson"));
        open("The example is open");
        visitTabs();
        renameComponent();
        insertDecayLine();
        breachBounds();
        insertPickedPlace();
        saveAndReopen();
    }

private:
    void step(const QString& what) {
        const QString name =
            QString("%1 %2.png").arg(++count_, 2, 10, QChar('0')).arg(QString(what).remove('"'));
        if (!robot_.picture().save(folder_.filePath(name)))
            throw std::runtime_error(("cannot write " + folder_.filePath(name)).toStdString());
        QTextStream(stdout) << "  " << name << Qt::endl;
    }

    static void expect(bool held, const char* what) {
        if (!held)
            throw std::runtime_error(what);
    }

    void open(const QString& what) {
        frame_.openFiles({copy_});
        robot_.settle();
        expect(frame_.MDIGetActive() != nullptr, "the document did not open");
        step(what);
    }

    // The one beside the document, if there is one.
    void openProject(const QString& network) {
        if (!QFileInfo::exists(network))
            return;
        frame_.openFiles({network});
        robot_.settle();
        expect(frame_.projects().isOpen(), "the project did not open");
        step("The project is open");
    }

    void visitTabs() {
        const QStringList tabs = robot_.tabs();
        for (int place = 0; place < tabs.size(); ++place) {
            robot_.clickTab(place);
            step("Tab " + tabs[place]);
        }
    }

    void renameComponent() {
        robot_.clickTab(components);
        robot_.clickCell(1, 1);
        robot_.type("oxygen demand");
        step("A component gets another name");
        robot_.press(Qt::Key_Return);
        step("It is in upper case");
    }

    void insertDecayLine() {
        robot_.clickTab(decay);
        robot_.clickCell(1, 2);
        robot_.press(Qt::Key_Insert);
        step("A decay line is inserted");
        const int line = robot_.lineCount();
        robot_.clickCell(line, 1);
        robot_.type("d");
        step("Its component is chosen by a letter");
        robot_.clickCell(line, 2);
        robot_.type("0.0x");
        robot_.press(Qt::Key_Return);
        step("A bad number is refused at its cell");
        robot_.press(Qt::Key_Backspace);
        robot_.type("2");
        robot_.press(Qt::Key_Return);
        step("A good one is taken");
    }

    void breachBounds() {
        robot_.clickTab(dispersion);
        robot_.fill(minimumCoefficient, "99999");
        robot_.answerNext([this](QWidget& box) {
            step("The minimum is above the maximum, and the tab stays");
            dynamic_cast<QMessageBox&>(box).buttons().first()->click();
        });
        robot_.clickTab(decay);
        robot_.fill(minimumCoefficient, "10");
        step("The minimum is mended");
        robot_.clickTab(decay);
    }

    void insertPickedPlace() {
        if (!frame_.projects().isOpen())
            return;
        const River& river = frame_.projects().network()->rivers().front();
        robot_.clickTab(dispersion);
        robot_.clickCell(robot_.lineCount(), 3);
        step("The map shows where the user is");
        robot_.clickMap(river.name, std::lerp(river.firstChainage(), river.lastChainage(), wayToPick));
        step("A place is picked on the map");
        robot_.clickTab(decay);
        robot_.clickCell(1, 2);
        robot_.press(Qt::Key_Insert);
        expect(frame_.exchange().offered().has_value(), "no place was picked");
        step("A decay line is inserted at that place");
    }

    void saveAndReopen() {
        robot_.press(Qt::Key_S, Qt::ControlModifier);
        expect(!frame_.MDIGetActive()->GetActiveDocument()->IsModified(), "the document was not saved");
        step("The document is saved");
        robot_.choose(ID_FILE_CLOSE);
        expect(frame_.MDIGetActive() == nullptr, "the document did not close");
        step("The document is closed");
        open("The saved document is open again");
        robot_.clickTab(decay);
        step("The inserted decay line is there again");
    }

    HubFrame& frame_;
    QMainWindow& window_;
    Robot& robot_;
    QDir folder_;
    QString copy_;
    int count_ = 0;
};

} // namespace

int takeTour(HubFrame& frame, QMainWindow& window, const QString& document, const QString& folder) {
    try {
        Robot robot(window);
        robot.settle();
        if (!QDir().mkpath(folder))
            throw std::runtime_error(("cannot make the folder " + folder).toStdString());
        QTextStream(stdout) << "Pictures in " << QDir(folder).absolutePath() << ':' << Qt::endl;
        Tour(frame, window, robot, QDir(folder)).play(document);
        return 0;
    } catch (const std::runtime_error& error) {
        QTextStream(stderr) << "The tour ended early: " << error.what() << Qt::endl;
        return 1;
    }
}

} // namespace kota::hub
