// Reading and writing a document of decay records, against RapidJSON with the same values. Both sides from a
// file, or to a file, each run in a process of its own.

#include "bench/cold_run.h"
#include "bench/decay_data.h"
#include "bench/ratio_reporter.h"
#include "document/kota0_ad_doc.h"

#include <filesystem>
#include <memory>

namespace {

namespace fs = std::filesystem;
using bench::JsonForm;

constexpr int smallCount = 100'000;
constexpr int largeCount = 1'000'000;

std::string pathOf(int count, const char* ending) {
    return (fs::temp_directory_path() / ("kota0_ad_bench_" + std::to_string(count) + ending)).string();
}

std::string jsonPath(int count, JsonForm form) {
    return pathOf(count, form == JsonForm::Objects ? "_objects.json" : "_arrays.json");
}

// A document that is never freed: it goes with the measured process.
CKota0_adDoc& newDocument() {
    return *new CKota0_adDoc;
}

std::function<void()> readingDocument(int count) {
    return [path = pathOf(count, ".AD31")] { newDocument().ReadData(path.c_str()); };
}

template <JsonForm form>
std::function<void()> readingJson(int count) {
    return [path = jsonPath(count, form)] { new std::vector(bench::readJson(path, form)); };
}

std::function<void()> writingDocument(int count) {
    CKota0_adDoc& document = newDocument();
    bench::addDecay(document, bench::makeDecay(count));
    return [&document, path = pathOf(count, ".AD31")] { document.WriteData(path.c_str()); };
}

template <JsonForm form>
std::function<void()> writingJson(int count) {
    return [records = bench::makeDecay(count), path = jsonPath(count, form)] {
        bench::writeJson(path, records, form);
    };
}

void run(benchmark::State& state, std::function<void()> (*prepare)(int)) {
    const int count = static_cast<int>(state.range(0));
    for (auto _ : state) {
        const bench::Measured measured = bench::runCold([=] { return prepare(count); });
        state.SetIterationTime(measured.seconds);
        state.counters["peak_MB"] = measured.peakMegabytes;
    }
    state.SetItemsProcessed(state.iterations() * count);
}

void ReadData(benchmark::State& state) {
    run(state, readingDocument);
}
void ReadJsonObjects(benchmark::State& state) {
    run(state, readingJson<JsonForm::Objects>);
}
void ReadJsonArrays(benchmark::State& state) {
    run(state, readingJson<JsonForm::Arrays>);
}
void WriteData(benchmark::State& state) {
    run(state, writingDocument);
}
void WriteJsonObjects(benchmark::State& state) {
    run(state, writingJson<JsonForm::Objects>);
}
void WriteJsonArrays(benchmark::State& state) {
    run(state, writingJson<JsonForm::Arrays>);
}

void bothSizes(benchmark::internal::Benchmark* benchmark) {
    benchmark->Arg(smallCount)->Arg(largeCount)->UseManualTime()->Iterations(1)->Repetitions(5);
    benchmark->ReportAggregatesOnly()->Unit(benchmark::kMillisecond);
}

BENCHMARK(WriteData)->Apply(bothSizes);
BENCHMARK(WriteJsonObjects)->Apply(bothSizes);
BENCHMARK(WriteJsonArrays)->Apply(bothSizes);
BENCHMARK(ReadData)->Apply(bothSizes);
BENCHMARK(ReadJsonObjects)->Apply(bothSizes);
BENCHMARK(ReadJsonArrays)->Apply(bothSizes);

} // namespace

int main(int argc, char** argv) {
    benchmark::Initialize(&argc, argv);
    // The files to be read, made in processes of their own so that this one stays small.
    for (const int count : {smallCount, largeCount}) {
        bench::runCold([=] { return writingDocument(count); });
        bench::runCold([=] { return writingJson<JsonForm::Objects>(count); });
        bench::runCold([=] { return writingJson<JsonForm::Arrays>(count); });
    }
    bench::RatioReporter reporter;
    benchmark::RunSpecifiedBenchmarks(&reporter);

    for (const int count : {smallCount, largeCount}) {
        const std::string arg = "/" + std::to_string(count);
        for (const std::string form : {"Objects", "Arrays"}) {
            reporter.printRatio("ReadData against RapidJSON, " + form + arg, "ReadData" + arg,
                                "ReadJson" + form + arg);
            reporter.printRatio("WriteData against RapidJSON, " + form + arg, "WriteData" + arg,
                                "WriteJson" + form + arg);
        }
    }
    const std::string small = "/" + std::to_string(smallCount);
    const std::string large = "/" + std::to_string(largeCount);
    const double sizes = static_cast<double>(largeCount) / smallCount;
    reporter.printGrowth("ReadData, a record of 1000000 against one of 100000", "ReadData" + large,
                         "ReadData" + small, sizes);
    reporter.printGrowth("WriteData, a record of 1000000 against one of 100000", "WriteData" + large,
                         "WriteData" + small, sizes);

    for (const int count : {smallCount, largeCount})
        for (const std::string& path :
             {pathOf(count, ".AD31"), jsonPath(count, JsonForm::Objects), jsonPath(count, JsonForm::Arrays)})
            fs::remove(path);
}
