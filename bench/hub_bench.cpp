// The desktop shell from its start and from a key to the painted window, against a bare window of Qt and a
// QTableWidget of the same lines. Each run in a process of its own, on Qt's offscreen platform.

#include "bench/cold_run.h"
#include "bench/decay_data.h"
#include "bench/ratio_reporter.h"
#include "document/kota0_ad_doc.h"
#include "hub/shell/hub_frame.h"
#include "hub/shell/robot.h"

#include <QApplication>
#include <QDir>
#include <QProcess>
#include <QTableWidget>
#include <cstdlib>
#include <string_view>

namespace {

constexpr int lines = 100'000;
constexpr int columns = 5;
constexpr int decayTab = 4; // its place, from 0
constexpr QSize windowSize(1280, 800);

using kota::hub::Robot;

void startQt() {
    static int argc = 1;
    static char name[] = "hub_bench";
    static char* argv[] = {name, nullptr};
    QApplication::setStyle("Fusion");
    new QApplication(argc, argv);
}

void paint(QWidget& window) {
    window.show();
    for (int round = 0; round < 5; ++round)
        QCoreApplication::processEvents();
    window.repaint();
}

// The shell as its program starts it. It goes with the measured process.
struct Shell {
    Shell() {
        kota::attachScreen(&screen);
        window = screen.makeMainWindow(frame);
        window->resize(windowSize);
        frame.load(kota::hub::loadPlugIns(KOTA_PLUG_INS));
    }
    void open(const QString& path) {
        screen.perform([this, path] { frame.openFiles({path}); });
        paint(*window);
    }

    CWinApp application;
    kota::hub::QtScreen screen;
    kota::hub::HubFrame frame{application, screen};
    QMainWindow* window = nullptr;
};

// A file of decay records. The process that measures removes nothing: the file serves all runs.
QString largeFile() {
    const QString path = QDir::temp().filePath("kota_hub_bench.AD31");
    if (!QFile::exists(path)) {
        CKota0_adDoc document;
        bench::addDecay(document, bench::makeDecay(lines));
        document.WriteData(QFile::encodeName(path).constData());
    }
    return path;
}

// What the program is started anew for, to be measured from its start to its end.
constexpr const char* bareWindow = "--bare-window";
constexpr const char* document = "--document";

int showBareWindow() {
    startQt();
    QMainWindow window;
    window.resize(windowSize);
    paint(window);
    return 0;
}

int showDocument() {
    startQt();
    Shell shell;
    shell.open(KOTA_EXAMPLE);
    return 0;
}

std::function<void()> tableWidget() {
    startQt();
    return [records = bench::makeDecay(lines)] {
        auto& table = *new QTableWidget(lines, columns);
        for (int line = 0; line < lines; ++line) {
            const bench::PlainDecay& decay = records[static_cast<std::size_t>(line)];
            const QString texts[columns] = {
                QString::number(decay.componentNum), QString::number(decay.decayConst, 'f'),
                QString::number(decay.isGlobal ? 1 : 0), QString::fromStdString(decay.riverName),
                QString::number(decay.chainage, 'f')};
            for (int column = 0; column < columns; ++column)
                table.setItem(line, column, new QTableWidgetItem(texts[column]));
        }
        table.resize(windowSize);
        paint(table);
    };
}

Shell& shellWithLargeDocument() {
    const QString path = largeFile();
    startQt();
    auto& shell = *new Shell;
    shell.open(path);
    Robot robot(*shell.window);
    robot.clickTab(decayTab);
    robot.clickCell(1, 2);
    return shell;
}

std::function<void()> openLarge() {
    const QString path = largeFile();
    startQt();
    auto& shell = *new Shell;
    paint(*shell.window);
    return [&shell, path] {
        shell.open(path);
        Robot(*shell.window).clickTab(decayTab);
        paint(*shell.window);
    };
}

std::function<void()> editLarge() {
    Shell& shell = shellWithLargeDocument();
    Robot(*shell.window).type("0.5");
    return [&shell] {
        Robot(*shell.window).press(Qt::Key_Tab);
        paint(*shell.window);
    };
}

constexpr int pages = 50;

std::function<void()> pageThrough() {
    Shell& shell = shellWithLargeDocument();
    return [&shell] {
        for (int page = 0; page < pages; ++page) {
            Robot(*shell.window).press(Qt::Key_PageDown);
            paint(*shell.window);
        }
    };
}

void run(benchmark::State& state, std::function<void()> (*prepare)(), int times = 1) {
    for (auto _ : state)
        state.SetIterationTime(bench::runCold(prepare).seconds / times);
}

void start(benchmark::State& state, const char* what) {
    for (auto _ : state)
        QProcess::execute("/proc/self/exe", {what});
}

void BareWindow(benchmark::State& state) {
    start(state, bareWindow);
}
void StartToDocument(benchmark::State& state) {
    start(state, document);
}
void FillAndShowTableWidget(benchmark::State& state) {
    run(state, tableWidget);
}
void OpenToPainted(benchmark::State& state) {
    run(state, openLarge);
}
void EditToPainted(benchmark::State& state) {
    run(state, editLarge);
}
void PageDownToPainted(benchmark::State& state) {
    run(state, pageThrough, pages);
}

void five(benchmark::internal::Benchmark* benchmark) {
    benchmark->UseManualTime()->Iterations(1)->Repetitions(5);
    benchmark->ReportAggregatesOnly()->Unit(benchmark::kMillisecond);
}

void fiveStarts(benchmark::internal::Benchmark* benchmark) {
    benchmark->UseRealTime()->Iterations(1)->Repetitions(5);
    benchmark->ReportAggregatesOnly()->Unit(benchmark::kMillisecond);
}

BENCHMARK(BareWindow)->Apply(fiveStarts);
BENCHMARK(StartToDocument)->Apply(fiveStarts);
BENCHMARK(FillAndShowTableWidget)->Apply(five);
BENCHMARK(OpenToPainted)->Apply(five);
BENCHMARK(EditToPainted)->Apply(five);
BENCHMARK(PageDownToPainted)->Apply(five);

} // namespace

int main(int argc, char** argv) {
    setenv("QT_QPA_PLATFORM", "offscreen", 1);
    setenv("XDG_CONFIG_HOME", QDir::temp().filePath("kota_hub_bench").toLocal8Bit().constData(), 1);
    if (argc == 2 && argv[1] == std::string_view(bareWindow))
        return showBareWindow();
    if (argc == 2 && argv[1] == std::string_view(document))
        return showDocument();
    benchmark::Initialize(&argc, argv);
    bench::RatioReporter reporter;
    benchmark::RunSpecifiedBenchmarks(&reporter);
    reporter.printRatio("A bare window against start to painted document", "BareWindow", "StartToDocument");
    reporter.printRatio("Open to painted against QTableWidget", "OpenToPainted", "FillAndShowTableWidget");
}
