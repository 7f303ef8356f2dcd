// Filling and storing the decay page's grid, and one edit in it, against filling a QTableWidget and a
// QStandardItemModel with the same cells. Each run in a process of its own.

#include "bench/cold_run.h"
#include "bench/decay_data.h"
#include "bench/ratio_reporter.h"
#include "document/kota0_ad_doc.h"
#include "platform/headless/session.h"
#include "platform/headless/user.h"

#include <QApplication>
#include <QStandardItemModel>
#include <QTableWidget>
#include <cstdio>
#include <cstdlib>
#include <memory>

namespace {

constexpr int smallCount = 10'000;
constexpr int largeCount = 100'000;
constexpr int columns = 5;

// A shell with a document whose decay tab stands open. It goes with the measured process.
struct OpenDecayTab {
    OpenDecayTab() {
        session.load(KOTA_PLUG_IN);
        document = static_cast<CKota0_adDoc*>(session.create());
        user = std::make_unique<kota::headless::User>(session);
        user->selectTab("Decay");
        document->decayList.DeleteAll();
    }

    void addRecords(int count) const { bench::addDecay(*document, bench::makeDecay(count)); }
    void fill() const { user->view().OnUpdate(nullptr, UpdateHint::Fill, nullptr); }
    void store() const { user->view().OnUpdate(nullptr, UpdateHint::Store, nullptr); }

    kota::headless::Session session;
    CKota0_adDoc* document = nullptr;
    std::unique_ptr<kota::headless::User> user;
};

OpenDecayTab& openDecayTab(int count) {
    auto& tab = *new OpenDecayTab;
    tab.addRecords(count);
    return tab;
}

std::function<void()> filling(int count) {
    OpenDecayTab& tab = openDecayTab(count);
    return [&tab] { tab.fill(); };
}

std::function<void()> storing(int count) {
    OpenDecayTab& tab = openDecayTab(count);
    tab.fill();
    return [&tab] { tab.store(); };
}

// Types into a cell and goes on to the next: commit, store, notify.
std::function<void()> editing(int count) {
    OpenDecayTab& tab = openDecayTab(count);
    tab.session.mainWindow().openProject(1);
    tab.document->projectHandle = 1;
    tab.fill();
    tab.user->putCursor(1, 2);
    return [&tab] {
        tab.user->type("0.5");
        tab.user->key(VK_TAB);
    };
}

// What the cells of the grid hold, made before the time runs.
std::vector<QString> cellTexts(int count) {
    std::vector<QString> texts;
    for (const bench::PlainDecay& decay : bench::makeDecay(count)) {
        texts.push_back(QString::number(decay.componentNum));
        texts.push_back(QString::number(decay.decayConst, 'f'));
        texts.push_back(QString::number(decay.isGlobal ? 1 : 0));
        texts.push_back(QString::fromStdString(decay.riverName));
        texts.push_back(QString::number(decay.chainage, 'f'));
    }
    return texts;
}

void startQt() {
    static int argc = 1;
    static char name[] = "grid_bench";
    static char* argv[] = {name, nullptr};
    new QApplication(argc, argv);
}

std::function<void()> fillingTableWidget(int count) {
    startQt();
    return [count, texts = cellTexts(count)] {
        auto& table = *new QTableWidget(count, columns);
        for (int cell = 0; cell < count * columns; ++cell)
            table.setItem(cell / columns, cell % columns,
                          new QTableWidgetItem(texts[static_cast<std::size_t>(cell)]));
    };
}

std::function<void()> fillingItemModel(int count) {
    startQt();
    return [count, texts = cellTexts(count)] {
        auto& model = *new QStandardItemModel(count, columns);
        for (int cell = 0; cell < count * columns; ++cell)
            model.setItem(cell / columns, cell % columns,
                          new QStandardItem(texts[static_cast<std::size_t>(cell)]));
    };
}

void run(benchmark::State& state, std::function<void()> (*prepare)(int)) {
    const int count = static_cast<int>(state.range(0));
    for (auto _ : state)
        state.SetIterationTime(bench::runCold([=] { return prepare(count); }).seconds);
}

void Fill(benchmark::State& state) {
    run(state, filling);
}
void Store(benchmark::State& state) {
    run(state, storing);
}
void Edit(benchmark::State& state) {
    run(state, editing);
}
void FillTableWidget(benchmark::State& state) {
    run(state, fillingTableWidget);
}
void FillItemModel(benchmark::State& state) {
    run(state, fillingItemModel);
}

void bothSizes(benchmark::internal::Benchmark* benchmark) {
    benchmark->Arg(smallCount)->Arg(largeCount)->UseManualTime()->Iterations(1)->Repetitions(5);
    benchmark->ReportAggregatesOnly()->Unit(benchmark::kMillisecond);
}

BENCHMARK(Fill)->Apply(bothSizes);
BENCHMARK(Store)->Apply(bothSizes);
BENCHMARK(Edit)->Apply(bothSizes);
BENCHMARK(FillTableWidget)->Apply(bothSizes);
BENCHMARK(FillItemModel)->Apply(bothSizes);

// By how much the process grows when the grid is filled, in bytes a cell.
double growthPerCell(int count) {
    const bench::Measured filled = bench::runCold([=] { return filling(count); });
    return filled.grownMegabytes * 1e6 / (static_cast<double>(count) * columns);
}

} // namespace

int main(int argc, char** argv) {
    setenv("QT_QPA_PLATFORM", "offscreen", 1);
    benchmark::Initialize(&argc, argv);
    bench::RatioReporter reporter;
    benchmark::RunSpecifiedBenchmarks(&reporter);
    for (const int count : {smallCount, largeCount}) {
        const std::string arg = "/" + std::to_string(count);
        for (const std::string work : {"Fill", "Store"})
            for (const std::string peer : {"FillTableWidget", "FillItemModel"})
                reporter.printRatio(work + arg + " against " + peer, work + arg, peer + arg);
        std::printf("%-58s %.0f bytes\n", ("Growth of memory by a filled cell" + arg).c_str(),
                    growthPerCell(count));
    }
    reporter.printGrowth("Edit, a line of 100000 against one of 10000", "Edit/100000", "Edit/10000",
                         static_cast<double>(largeCount) / smallCount);
}
