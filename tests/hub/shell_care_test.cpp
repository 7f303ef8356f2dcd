#include "hub/shell/tour.h"
#include "platform/framework/template.h"
#include "tests/hub/shown_shell.h"

#include <QClipboard>
#include <QDropEvent>
#include <QInputDialog>
#include <QMimeData>
#include <QUrl>

#include <filesystem>

namespace {

using kota::test::AnEmptyShell;
using kota::test::readFile;
using kota::test::ShownShell;
using testing::ElementsAre;
using testing::IsEmpty;

class TheShell : public ShownShell {
protected:
    void drop(const std::string& path) {
        QMimeData files;
        files.setUrls({QUrl::fromLocalFile(QString::fromStdString(path))});
        QDragEnterEvent entering(QPoint(10, 10), Qt::CopyAction, &files, Qt::LeftButton, Qt::NoModifier);
        QCoreApplication::sendEvent(shell.window, &entering);
        ASSERT_TRUE(entering.isAccepted());
        QDropEvent event(QPointF(10, 10), Qt::CopyAction, &files, Qt::LeftButton, Qt::NoModifier);
        QCoreApplication::sendEvent(shell.window, &event);
        settle();
    }
    void typeABadNumber() {
        clickTab("Decay");
        clickCell(1, 2);
        type("0.5x");
    }
};

TEST_F(TheShell, OpensAFileThatIsDroppedOnIt) {
    drop(copyExample());
    ASSERT_EQ(frames().size(), 1U);
    EXPECT_EQ(frontTitle(), "river.AD31");
}

TEST_F(TheShell, BringsAnOpenFileToTheFrontUnderAnotherNameOfIt) {
    open(copyExample());
    std::filesystem::create_symlink(folder.file("river.AD31"), folder.file("link.AD31"));
    open(folder.file("link.AD31"));
    EXPECT_EQ(frames().size(), 1U);
}

TEST_F(TheShell, StaysWithABadNumberWhateverIsOpened) {
    open(copyExample());
    const std::string other = copyExample("other.AD31");
    typeABadNumber();
    choose("File", "New");
    choose("Window", "New Window");
    open(other);
    drop(other);
    EXPECT_EQ(frames().size(), 1U);
    EXPECT_TRUE(grid().isVisible());
}

TEST_F(TheShell, AsksForTheKindOfANewDocumentWhereThereAreSeveral) {
    for (auto& docTemplate : kota::PlugIn(KOTA_PLUG_IN).makeTemplates())
        shell.application.AddDocTemplate(std::move(docTemplate));
    onBox([](QWidget& dialog) { dynamic_cast<QInputDialog&>(dialog).reject(); });
    choose("File", "New");
    EXPECT_THAT(frames(), IsEmpty());
    onBox([](QWidget& dialog) { dynamic_cast<QInputDialog&>(dialog).accept(); });
    choose("File", "New");
    EXPECT_EQ(frames().size(), 1U);
    EXPECT_THAT(boxes(), ElementsAre("New", "New"));
}

TEST_F(TheShell, ForgetsNoRecentFileThatIsThere) {
    open(copyExample());
    choose("File", "Close");
    std::filesystem::permissions(folder.file("river.AD31"), std::filesystem::perms::none);
    std::filesystem::rename(folder.file("river.AD31"), folder.file("moved"));
    std::filesystem::create_directory(folder.file("river.AD31"));
    answer(QMessageBox::Ok);
    open(folder.file("river.AD31"));
    EXPECT_TRUE(canChoose("File", QString::fromStdString("1 river.AD31 - " + folder.path().string())));
}

TEST_F(AnEmptyShell, OffersNoDocumentsWithoutAnEditor) {
    EXPECT_FALSE(canChoose("File", "New"));
    EXPECT_FALSE(canChoose("File", "Open..."));
    EXPECT_TRUE(canChoose("File", "Exit"));
}

// Notes each painting of the main window while the program shows that it is busy, and how many documents are
// open then.
class BusyPaintings : public QObject {
public:
    explicit BusyPaintings(const kota::hub::HubFrame& frame) : frame_(frame) {}

    std::vector<std::size_t> documents;

protected:
    bool eventFilter(QObject* watched, QEvent* event) override {
        const QCursor* const mark = QGuiApplication::overrideCursor();
        if (event->type() == QEvent::Paint && mark && mark->shape() == Qt::WaitCursor)
            documents.push_back(frame_.Children().size());
        return QObject::eventFilter(watched, event);
    }

private:
    const kota::hub::HubFrame& frame_;
};

TEST_F(TheShell, ShowsThatItIsBusyBeforeItLoads) {
    BusyPaintings paintings(shell.frame);
    shell.window->installEventFilter(&paintings);
    open(copyExample());
    ASSERT_FALSE(paintings.documents.empty());
    EXPECT_EQ(paintings.documents.front(), 0U);
    EXPECT_EQ(QGuiApplication::overrideCursor(), nullptr);
}

TEST_F(TheShell, IsNotBusyWhileABoxWaits) {
    Qt::CursorShape shape = Qt::BlankCursor;
    onBox([&](QWidget& box) {
        const QCursor* const mark = QGuiApplication::overrideCursor();
        shape = mark ? mark->shape() : Qt::ArrowCursor;
        dynamic_cast<QDialog&>(box).reject();
    });
    open(folder.file("missing.AD31"));
    EXPECT_EQ(shape, Qt::ArrowCursor);
}

TEST_F(TheShell, KeepsNoMenusOfTheTabsBefore) {
    open(copyExample());
    const auto count = shell.window->menuBar()->findChildren<QMenu*>().size();
    for (int round = 0; round < 3; ++round) {
        clickTab("Decay");
        clickTab("Sediment Layers");
    }
    QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
    EXPECT_EQ(shell.window->menuBar()->findChildren<QMenu*>().size(), count);
}

TEST_F(TheShell, TakesNoTourInTheFolderOfTheDocument) {
    const std::string path = copyExample();
    const std::string before = readFile(path);
    EXPECT_EQ(kota::hub::takeTour(shell.frame, *shell.window, QString::fromStdString(path),
                                  QString::fromStdString(folder.path().string())),
              1);
    EXPECT_EQ(readFile(path), before);
}

TEST_F(TheShell, EndsItsTourAtABoxThatNobodyExpects) {
    const std::string path = folder.write("river.AD31", "this is no document\n");
    leaveBoxes();

    const int result = kota::hub::takeTour(shell.frame, *shell.window, QString::fromStdString(path),
                                           QString::fromStdString(folder.file("pictures")));

    EXPECT_EQ(result, 1);
    EXPECT_EQ(QApplication::activeModalWidget(), nullptr) << "it is closed";
}

TEST_F(TheShell, TypesNothingIntoAWindowThatIsReducedToAnIcon) {
    open(copyExample());
    clickTab("Components");
    clickCell(1, 1);
    const auto lines = document().compList.GetCount();
    front().showMinimized();
    settle();
    type("ZZZ");
    press(Qt::Key_Return);
    press(Qt::Key_Insert);
    front().showNormal();
    settle();
    EXPECT_EQ(document().compList.GetCount(), lines);
    EXPECT_NE(displayed(1, 1), "ZZZ");
}

TEST_F(TheShell, SelectsALineByShiftAndTheSpaceBarAndDeletesIt) {
    open(copyExample());
    clickTab("Decay");
    clickCell(2, 2);
    const int lines = lineCount();
    press(Qt::Key_Space, Qt::ShiftModifier);
    press(Qt::Key_Delete);
    EXPECT_EQ(lineCount(), lines - 1);
}

TEST_F(TheShell, OpensNoCellForAnEmptyComposition) {
    open(copyExample());
    clickTab("Decay");
    clickCell(1, 2);
    QInputMethodEvent empty;
    QCoreApplication::sendEvent(&grid(), &empty);
    settle();
    EXPECT_EQ(grid().viewport()->findChild<QLineEdit*>(), nullptr);
}

// The fields of the dispersion tab.
class AField : public ShownShell {
protected:
    AField() { open(copyExample()); }

    QLineEdit& field(const char* name) const {
        for (QLineEdit* const line : front().findChildren<QLineEdit*>())
            if (line->isVisible() && line->accessibleName() == name)
                return *line;
        throw std::runtime_error("there is no such field in front");
    }
    // Clicks behind the text.
    void clickInto(QLineEdit& line) { click(line, line.rect().center()); }
};

TEST_F(AField, IsScrolledIntoViewWhereThereIsLittleRoom) {
    shell.window->resize(640, 300);
    clickTab("Dispersion");
    settle();
    const QRect seen(0, 0, grid().width(), grid().height());
    EXPECT_GT(seen.height(), 80) << "a few lines have room";
    QLineEdit& first = field("Dispersion factor");

    first.setFocus();
    settle();
    EXPECT_EQ(first.visibleRegion().boundingRect(), first.rect());
    grid().setFocus();
    settle();

    EXPECT_FALSE(grid().visibleRegion().isEmpty());
}

TEST_F(AField, KeepsAValueThatIsLongerThanWhatCanBeTyped) {
    document().globalVar.G_max_disp_coef = 1e20;
    clickTab("Dispersion");
    QLineEdit& maximum = field("Maximum disp. coefficient");
    clickInto(maximum);
    press(Qt::Key_Left);
    clickInto(field("Exponent"));
    EXPECT_EQ(document().globalVar.G_max_disp_coef, 1e20);
    EXPECT_EQ(maximum.text(), "100000000000000000000.000");
}

TEST_F(AField, HasItsTextSelectedWhenAKeyLeadsToIt) {
    clickTab("Dispersion");
    clickInto(field("Exponent"));
    EXPECT_FALSE(field("Exponent").hasSelectedText());
    press(Qt::Key_Tab);
    auto* const entered = qobject_cast<QLineEdit*>(QApplication::focusWidget());
    ASSERT_TRUE(entered);
    EXPECT_EQ(entered->selectedText(), entered->text());
}

TEST_F(AField, LosesTheFocusToACellThatStoodOpen) {
    clickTab("Dispersion");
    clickCell(1, 2);
    press(Qt::Key_F2);
    auto* const cell = grid().viewport()->findChild<QLineEdit*>();
    ASSERT_TRUE(cell);
    const QString before = field("Exponent").text();
    clickInto(field("Exponent"));
    click(*cell, cell->rect().center());
    type("5");
    EXPECT_EQ(field("Exponent").text(), before);
}

// The Edit menu, over a grid and over a field.
class TheEditMenu : public ShownShell {
protected:
    TheEditMenu() {
        open(copyExample());
        clickTab("Decay");
        clickCell(1, 2);
    }
    QLineEdit& field() const {
        for (QLineEdit* const line : front().findChildren<QLineEdit*>())
            if (line->isVisible())
                return *line;
        throw std::runtime_error("there is no field in front");
    }
};

TEST_F(TheEditMenu, UndoesAnEditInTheGrid) {
    const double before = storedDecay();
    EXPECT_FALSE(canChoose("Edit", "Undo"));
    changeDecay("0.75");
    ASSERT_EQ(storedDecay(), 0.75);
    choose("Edit", "Undo");
    EXPECT_NEAR(storedDecay(), before, 1e-6);
    press(Qt::Key_Y, Qt::ControlModifier);
    EXPECT_EQ(storedDecay(), 0.75);
}

TEST_F(TheEditMenu, CopiesAndPastesByWayOfTheClipboardOfTheDesktop) {
    QGuiApplication::clipboard()->setText("0.125");
    choose("Edit", "Paste");
    EXPECT_EQ(storedDecay(), 0.125);
    choose("Edit", "Copy");
    EXPECT_EQ(QGuiApplication::clipboard()->text(), "0.125");
    press(Qt::Key_X, Qt::ControlModifier);
    EXPECT_EQ(displayed(1, 2), "");
}

TEST_F(TheEditMenu, WorksInACellThatIsOpen) {
    press(Qt::Key_F2);
    press(Qt::Key_A, Qt::ControlModifier);
    EXPECT_TRUE(canChoose("Edit", "Copy"));
    QGuiApplication::clipboard()->setText("2.5");
    choose("Edit", "Paste");
    press(Qt::Key_Return);
    EXPECT_EQ(storedDecay(), 2.5);
}

TEST_F(TheEditMenu, WorksInAField) {
    clickTab("Dispersion");
    click(field(), field().rect().center());
    field().deselect();
    EXPECT_FALSE(canChoose("Edit", "Copy"));
    press(Qt::Key_A, Qt::ControlModifier);
    const QString before = field().text();
    choose("Edit", "Cut");
    EXPECT_EQ(QGuiApplication::clipboard()->text(), before);
    EXPECT_EQ(field().text(), "");
    choose("Edit", "Undo");
    EXPECT_EQ(field().text(), before);
    press(Qt::Key_A, Qt::ControlModifier);
    QGuiApplication::clipboard()->setText("7");
    press(Qt::Key_V, Qt::ControlModifier);
    EXPECT_EQ(field().text(), "7");
}

TEST_F(TheEditMenu, IsGreyWithoutADocument) {
    choose("File", "Close");
    for (const char* entry : {"Undo", "Cut", "Copy", "Paste"})
        EXPECT_FALSE(canChoose("Edit", entry)) << entry;
}

} // namespace
