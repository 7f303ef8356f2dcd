#include "exchange/packages/packages.h"
#include "platform/foundation/units.h"
#include "tests/hub/shown_shell.h"

#include "hub/shell/settings.h"
#include "hub/shell/settings_dialog.h"
#include "hub/shell/workspace.h"

#include <QClipboard>
#include <QDropEvent>
#include <QMimeData>
#include <QPushButton>

#include <cmath>

namespace {

using namespace kota::hub;
using kota::test::recordOf;
using testing::ElementsAre;
using testing::HasSubstr;

// One river of 1000 m to the east, and one without a bend to the north of it.
constexpr const char* twoRivers =
    R"({"type": "FeatureCollection", "crs": {"type": "name", "properties": {"name": "EPSG:32614"}},
  "features": [
  {"type": "Feature", "properties": {"river": "MISSOURI", "chainage_start": 0, "chainage_end": 1000},
   "geometry": {"type": "LineString", "coordinates": [[0, 0], [1000, 0]]}},
  {"type": "Feature", "properties": {"river": "PLATTE", "chainage_start": 0, "chainage_end": 500},
   "geometry": {"type": "LineString", "coordinates": [[0, 300], [500, 300]]}}]})";

class AProject : public kota::test::ShownShell {
protected:
    std::string network() const { return folder.write("two.geojson", twoRivers); }
    void openProject() { open(network()); }
    RiverMap& map() { return shell.panels->map().map(); }
    // Where the map shows a place of the plane.
    QPoint pixel(double x, double y) { return map().viewPort().toScreen({x, y}).toPoint(); }
    // A new document on a tab, with the cursor in a cell.
    void createOn(const char* tab) {
        createDocument();
        clickTabOf(front(), tab);
        clickCell(1, 2);
    }
    // Brings the n-th frame to the front.
    void clickFrame(std::size_t n) {
        shell.screen.perform([this, n] { kota::input::activate(*frames()[n]); });
        settle();
    }
    void clickCell(int line, int column) {
        click(*grid().viewport(), grid().visualRect(index(line, column)).center());
    }
    int lastLine() const { return grid().model()->rowCount(); }
    // A dispersion line at a place picked on the map, with the cursor in the line above it.
    void insertPickedLine() {
        openProject();
        createOn("Dispersion");
        click(map(), pixel(250, 0));
        clickCell(1, 3);
        press(Qt::Key_Insert);
        clickCell(1, 4);
    }
    std::string textAt(int line, int column) const {
        return index(line, column).data().toString().toStdString();
    }
};

TEST_F(AProject, IsNamedInTheTitleAndShownOnTheMap) {
    EXPECT_FALSE(map().isVisible());

    openProject();

    EXPECT_TRUE(map().isVisible());
    EXPECT_THAT(shell.window->windowTitle().toStdString(), HasSubstr("two.geojson"));
    EXPECT_THAT(boxes(), ElementsAre());
}

TEST_F(AProject, IsThatOfDocumentsThatAreOpenedInIt) {
    createDocument();
    EXPECT_EQ(document().projectHandle, 0);

    openProject();
    createDocument();

    EXPECT_NE(document().projectHandle, 0);
    EXPECT_EQ(shell.frame.projects().network(document().projectHandle), shell.frame.projects().network());
}

TEST_F(AProject, OffersItsRiversInTheRiverColumn) {
    openProject();
    createOn("Dispersion");
    clickCell(1, 1);

    press(Qt::Key_F2);

    const auto* const box = grid().findChild<QComboBox*>();
    ASSERT_NE(box, nullptr);
    ASSERT_EQ(box->count(), 2);
    EXPECT_EQ(box->itemText(0), "MISSOURI");
    EXPECT_EQ(box->itemText(1), "PLATTE");
}

TEST_F(AProject, HasAPlacePickedOnTheMapInserted) {
    openProject();
    createOn("Dispersion");
    click(map(), pixel(250, 0));
    ASSERT_TRUE(map().picked());
    EXPECT_NEAR(map().picked()->chainage, 250, 2);
    clickCell(1, 3);

    press(Qt::Key_Insert);

    const int last = lastLine();
    EXPECT_EQ(textAt(last, 1), "MISSOURI");
    EXPECT_NEAR(index(last, 2).data().toString().toDouble(), 250, 2);
    const AD_Dispersion& record = recordOf(document().dispersList, last);
    EXPECT_EQ(record.riverName, "MISSOURI");
    EXPECT_EQ(record.chainage, std::round(map().picked()->chainage)) << "as the pin says";
}

TEST_F(AProject, OffersNoPlaceBehindEscape) {
    openProject();
    createOn("Dispersion");
    click(map(), pixel(250, 0));
    map().setFocus();

    press(Qt::Key_Escape);
    clickCell(1, 3);
    press(Qt::Key_Insert);

    EXPECT_FALSE(shell.frame.exchange().offered());
    EXPECT_EQ(textAt(lastLine(), 1), "");
}

TEST_F(AProject, IsToldWhereTheUserIs) {
    insertPickedLine();

    clickCell(lastLine(), 3);

    ASSERT_TRUE(shell.frame.exchange().current());
    EXPECT_EQ(shell.frame.exchange().current()->river, "MISSOURI");
    const QImage with = map().grab().toImage();
    shell.panels->map().showPlace({});
    EXPECT_NE(map().grab().toImage(), with) << "the mark was there";
}

TEST_F(AProject, StaysThatOfADocumentThatGetsAnotherWindow) {
    createDocument();
    openProject();
    choose("Window", "New Window");
    EXPECT_EQ(document().projectHandle, 0) << "it was outside";
    createDocument();
    const auto handle = document().projectHandle;
    open(folder.write("other.geojson", twoRivers));

    choose("Window", "New Window");

    EXPECT_EQ(document().projectHandle, handle);
    EXPECT_NE(handle, shell.frame.projects().current());
    choose("File", "Close");
    EXPECT_EQ(shell.frame.projects().network(handle), nullptr) << "its last document has gone";
    EXPECT_TRUE(shell.frame.projects().isOpen());
}

TEST_F(AProject, OffersNoPlaceToADocumentOfAnother) {
    openProject();
    createOn("Dispersion");
    open(folder.write("other.geojson", twoRivers));
    click(map(), pixel(250, 0));
    clickCell(1, 3);

    press(Qt::Key_Insert);

    EXPECT_EQ(textAt(lastLine(), 1), "");
}

TEST_F(AProject, OffersNoPlaceOnAHiddenMap) {
    openProject();
    click(map(), pixel(250, 0));
    ASSERT_TRUE(shell.frame.exchange().offered());

    choose("View", "River Map");

    EXPECT_FALSE(shell.frame.exchange().offered());
}

TEST_F(AProject, KeepsTheMarkWhenAnotherWindowGoes) {
    insertPickedLine();
    clickCell(lastLine(), 3);
    ASSERT_TRUE(shell.frame.exchange().current());
    createDocument();

    choose("File", "Close");

    EXPECT_TRUE(shell.frame.exchange().current());
    answer(QMessageBox::No);
    choose("File", "Close");
    EXPECT_FALSE(shell.frame.exchange().current());
}

TEST_F(AProject, IsNotToldOfADocumentOutsideIt) {
    std::vector<WPARAM> codes;
    createOn("Dispersion");
    openProject();
    shell.frame.exchange().onMessage = [&](const PassedMessage& message) { codes.push_back(message.code); };

    type("A");
    press(Qt::Key_Return);
    clickCell(1, 3);

    EXPECT_THAT(codes, testing::Not(testing::Contains(503U)));
    EXPECT_THAT(codes, testing::Not(testing::Contains(523U)));
}

TEST_F(AProject, StaysOpenWhenAnotherCannotBeRead) {
    openProject();
    answer(QMessageBox::Ok);

    open(folder.write("broken.geojson", "{\"type\": \"FeatureCollection\", \"features\": []}"));

    ASSERT_EQ(boxes().size(), 1U);
    EXPECT_THAT(boxes()[0], HasSubstr("broken.geojson"));
    EXPECT_TRUE(shell.frame.projects().path().endsWith("two.geojson"));
}

TEST_F(AProject, IsChosenByTheMenu) {
    answerName(network());

    choose("File", "Open Project...");

    EXPECT_TRUE(shell.frame.projects().isOpen());
    EXPECT_TRUE(canChoose("File", "Close Project"));
}

TEST_F(AProject, IsClosedByTheMenuAndItsDocumentsStay) {
    openProject();
    createDocument();

    choose("File", "Close Project");

    EXPECT_FALSE(shell.frame.projects().isOpen());
    EXPECT_FALSE(map().isVisible());
    EXPECT_FALSE(canChoose("File", "Close Project"));
    EXPECT_EQ(frames().size(), 1U);
    EXPECT_EQ(shell.window->windowTitle().toStdString().find("two.geojson"), std::string::npos);
}

TEST_F(AProject, IsOpenedWhenItsFileIsDropped) {
    QMimeData dropped;
    dropped.setUrls({QUrl::fromLocalFile(QString::fromStdString(network()))});
    QDragEnterEvent entering(QPoint(5, 5), Qt::CopyAction, &dropped, Qt::LeftButton, Qt::NoModifier);
    QCoreApplication::sendEvent(shell.window, &entering);
    QDropEvent drop(QPointF(5, 5), Qt::CopyAction, &dropped, Qt::LeftButton, Qt::NoModifier);

    QCoreApplication::sendEvent(shell.window, &drop);
    settle();

    EXPECT_TRUE(shell.frame.projects().isOpen());
}

// The panels beside the documents.
class APanel : public AProject {
protected:
    ExchangeDock& exchange() { return shell.panels->exchange(); }
    QTableView& messages() { return *exchange().findChild<QTableView*>(); }
    void clickButton(const char* text) {
        for (auto* const button : exchange().findChildren<QPushButton*>())
            if (button->text() == text)
                click(*button, button->rect().center());
    }
};

TEST_F(APanel, IsShownAndHiddenByTheMenu) {
    EXPECT_FALSE(entry("View", "Exchange").isChecked());

    choose("View", "Exchange");

    EXPECT_TRUE(exchange().isVisible());
    EXPECT_TRUE(entry("View", "Exchange").isChecked());
    EXPECT_EQ(QApplication::focusWidget(), &messages()) << "the keyboard goes with it";
    choose("View", "Exchange");
    EXPECT_FALSE(exchange().isVisible());
}

TEST_F(APanel, LeavesTheKeyboardToTheDocumentByEscape) {
    openProject();
    createOn("Dispersion");
    choose("View", "Exchange");
    ASSERT_EQ(QApplication::focusWidget(), &messages());

    press(Qt::Key_Escape);

    EXPECT_TRUE(grid().hasFocus());
}

TEST_F(APanel, KeepsKeysFromTheDocument) {
    openProject();
    createOn("Dispersion");
    const int lines = lastLine();
    map().setFocus();

    QGuiApplication::clipboard()->setText("ABC");
    press(Qt::Key_Insert);
    type("x");
    press(Qt::Key_F2);
    press(Qt::Key_V, Qt::ControlModifier);

    EXPECT_EQ(lastLine(), lines);
    EXPECT_EQ(grid().findChild<QLineEdit*>(), nullptr);
    EXPECT_FALSE(document().IsModified());
}

TEST_F(APanel, ListsWhatEditorsSay) {
    choose("View", "Exchange");
    openProject();
    createDocument();

    const QAbstractItemModel& model = *messages().model();
    ASSERT_GT(model.rowCount(), 0);
    EXPECT_THAT(exchange().copyText().toStdString(), HasSubstr("\t25\tasks for the project\t"));
}

TEST_F(APanel, FiltersCopiesAndClearsTheMessages) {
    choose("View", "Exchange");
    openProject();
    createDocument();
    auto* const filter = exchange().findChild<QLineEdit*>();
    filter->setFocus();
    type("tool bar");
    const int shown = messages().model()->rowCount();
    ASSERT_GT(shown, 0);

    clickButton("Copy");

    const QString copied = QGuiApplication::clipboard()->text();
    EXPECT_EQ(copied.count('\n'), shown);
    EXPECT_THAT(copied.toStdString(), testing::Not(HasSubstr("asks for the project")));
    messages().selectRow(0);
    messages().setFocus();
    press(Qt::Key_C, Qt::ControlModifier);
    EXPECT_EQ(QGuiApplication::clipboard()->text().count('\n'), 1);
    filter->clear();
    clickButton("Clear");
    EXPECT_EQ(messages().model()->rowCount(), 0);
}

// What the user chooses for the program as a whole.
class TheSettings : public kota::test::ShownShell {};

TEST_F(TheSettings, AreAskedForAndKept) {
    onBox([](QWidget& dialog) {
        const auto boxes = dialog.findChildren<QComboBox*>();
        ASSERT_EQ(boxes.size(), 5);
        EXPECT_EQ(boxes[0]->currentText(), "as the system");
        boxes[0]->setCurrentText("日本語");
        boxes[1]->setCurrentText("ft");
        dynamic_cast<QDialog&>(dialog).accept();
    });

    choose("File", "Settings...");

    const Settings kept = Settings::load();
    EXPECT_EQ(kept.language, 1041);
    EXPECT_EQ(kept.units, (std::map<int, QString>{{100143, "ft"}}));
    EXPECT_EQ(kota::displayUnit(100143), 0) << "it takes effect at the next start";
}

TEST_F(TheSettings, StayAsTheyWereWhenTheUserChangesTheirMind) {
    const Settings before{1041, {{100155, "mm"}}};
    before.save();
    onBox([](QWidget& dialog) {
        const auto boxes = dialog.findChildren<QComboBox*>();
        EXPECT_EQ(boxes[0]->currentText(), "日本語");
        EXPECT_EQ(boxes[3]->currentText(), "mm");
        boxes[0]->setCurrentIndex(0);
        dynamic_cast<QDialog&>(dialog).reject();
    });

    choose("File", "Settings...");

    EXPECT_EQ(Settings::load(), before);
}

TEST_F(TheSettings, SetTheDisplayUnits) {
    Settings{0, {{100143, "ft"}, {100149, "furlong"}, {4711, "m"}}}.applyUnits();

    EXPECT_EQ(kota::displayUnit(100143), 1);
    EXPECT_EQ(kota::displayUnit(100149), 0) << "there is no such unit";
    EXPECT_EQ(chainageText(304.8), "1000 ft");
    EXPECT_EQ(metresPerChainageUnit(), 0.3048);
    kota::setDisplayUnit(100143, 0);
    EXPECT_EQ(chainageText(304.8), "305 m");
}

// What was open when the program ended.
class TheWorkspace : public AProject {};

TEST_F(TheWorkspace, ComesBackWithoutTheFilesThatAreGone) {
    const QString here = QString::fromStdString(network());
    const QString gone = QString::fromStdString(folder.file("gone.AD31"));
    Workspace{here, {here, gone}, "geometry", "layout"}.save();

    const Workspace last = Workspace::load();

    EXPECT_EQ(last.project, here);
    EXPECT_EQ(last.documents, QStringList{here});
    Workspace{gone, {}, {}, {}}.save();
    EXPECT_EQ(Workspace::load().project, "");
}

TEST_F(TheWorkspace, KeepsTheSizeOfTheWindowAndItsPanels) {
    shell.window->resize(900, 650);
    choose("View", "Exchange");
    Workspace workspace;
    workspace.take(*shell.window);
    shell.window->resize(1100, 700);
    choose("View", "Exchange");

    EXPECT_TRUE(workspace.restoreGeometry(*shell.window));
    workspace.restoreLayout(*shell.window);
    settle();

    EXPECT_EQ(shell.window->size(), QSize(900, 650));
    EXPECT_TRUE(shell.panels->exchange().isVisible());
    EXPECT_FALSE(Workspace().restoreGeometry(*shell.window));
}

TEST_F(TheWorkspace, IsNotedWhenAllQuestionsAreAnswered) {
    openProject();
    open(copyExample("first.AD31"));
    open(folder.write("river.ad31", "target KOTA0_AD {\n}\n"));
    document().SetModifiedFlag(TRUE);
    QStringList documents;
    QString project;
    shell.frame.onEnd = [&] {
        documents = shell.frame.documents();
        project = shell.frame.projects().path();
    };
    answer(QMessageBox::Cancel);
    choose("File", "Exit");
    EXPECT_TRUE(documents.isEmpty()) << "the program goes on";
    answer(QMessageBox::Yes);

    choose("File", "Exit");

    EXPECT_EQ(documents, (QStringList{QString::fromStdString(folder.file("first.AD31")),
                                      QString::fromStdString(folder.file("river.AD31"))}))
        << "under the names that were written";
    EXPECT_TRUE(project.endsWith("two.geojson"));
}

TEST_F(TheWorkspace, IsResumedWithTheDocumentThatWasInFront) {
    const QString first = QString::fromStdString(copyExample("first.AD31"));
    const QString second = QString::fromStdString(copyExample("second.AD31"));
    open(QStringList{first, second});
    clickFrame(0);
    EXPECT_EQ(shell.frame.documents(), (QStringList{second, first}));
    const Workspace workspace{QString::fromStdString(network()), {second, first}, {}, {}};
    choose("File", "Close");
    choose("File", "Close");

    shell.screen.perform([&] { shell.frame.resume(workspace, {}); });
    settle();

    EXPECT_EQ(frontTitle(), "first.AD31");
    EXPECT_EQ(frames().size(), 2U);
    EXPECT_TRUE(shell.frame.projects().isOpen());
}

TEST_F(TheWorkspace, GivesWayToWhatIsAskedFor) {
    const std::string other = folder.write("other.geojson", twoRivers);
    const Workspace workspace{
        QString::fromStdString(network()), {QString::fromStdString(copyExample("old.AD31"))}, {}, {}};

    shell.screen.perform([&] {
        shell.frame.resume(workspace,
                           {QString::fromStdString(other), QString::fromStdString(copyExample("new.AD31"))});
    });
    settle();

    EXPECT_TRUE(shell.frame.projects().path().endsWith("other.geojson"));
    EXPECT_EQ(shell.frame.projects().current(), 1) << "the last one was not opened before";
    EXPECT_EQ(frontTitle(), "new.AD31");
    EXPECT_EQ(frames().size(), 1U);
}

} // namespace
