// The river map: a large network read from its file, and one step of panning painted, against Qt's own
// reading of JSON and its graphics view of the same lines. Each run in a process of its own, on Qt's
// offscreen platform.

#include "bench/cold_run.h"
#include "bench/ratio_reporter.h"
#include "hub/project/geojson.h"
#include "hub/project/river_map.h"

#include <QApplication>
#include <QDir>
#include <QGraphicsPathItem>
#include <QGraphicsView>
#include <QJsonDocument>
#include <QMouseEvent>
#include <QWheelEvent>
#include <cmath>
#include <cstdlib>
#include <random>
#include <stdexcept>

namespace {

constexpr int rivers = 10'000;
constexpr int vertices = 12; // of each river
constexpr QSize windowSize(1280, 800);
constexpr int steps = 50;

// How far the map lies from its place at a step of a drag to and fro.
QPoint moved(int number) {
    return QPoint(9, 5) * (number % 10);
}

// Rivers side by side, a hundred in a line and a hundred lines of them, each winding to the south.
QByteArray largeNetwork() {
    std::mt19937 random(20'24);
    std::uniform_real_distribution<double> bend(-2'000, 2'000);
    QByteArray json =
        R"({"type": "FeatureCollection", "crs": {"type": "name", "properties": {"name": "EPSG:32615"}},)"
        "\n\"features\": [\n";
    for (int river = 0; river < rivers; ++river) {
        const QByteArray number = QByteArray::number(river);
        json +=
            (river ? ",\n" : "") + QByteArray(R"({"type": "Feature", "properties": {"river": "RIVER )") +
            number +
            R"(", "chainage_start": 0, "chainage_end": 12000}, "geometry": {"type": "LineString", "coordinates": [)";
        for (int vertex = 0; vertex < vertices; ++vertex)
            json += (vertex ? ", [" : "[") +
                    QByteArray::number(400'000 + river % 100 * 12'000 + bend(random), 'f', 2) + ", " +
                    QByteArray::number(4'000'000 - river / 100 * 10'000 - vertex * 750 + bend(random) / 4,
                                       'f', 2) +
                    "]";
        json += "]}}";
    }
    return json + "\n]}\n";
}

// Made once; the process that measures removes nothing.
QString largeFile() {
    const QString path = QDir::temp().filePath("kota_map_bench.geojson");
    if (!QFile::exists(path)) {
        QFile file(path);
        if (!file.open(QIODevice::WriteOnly) || file.write(largeNetwork()) < 0)
            throw std::runtime_error("the network cannot be written");
    }
    return path;
}

std::shared_ptr<const kota::hub::Network> readLargeFile() {
    const auto reading = kota::hub::readNetwork(largeFile());
    if (!reading.network || reading.network->rivers().size() != rivers)
        throw std::runtime_error(reading.error.toStdString());
    return reading.network;
}

void startQt() {
    static int argc = 1;
    static char name[] = "map_bench";
    static char* argv[] = {name, nullptr};
    new QApplication(argc, argv);
}

std::function<void()> readNetwork() {
    largeFile();
    return [] { new auto(readLargeFile()); };
}

std::function<void()> parseJson() {
    const QString path = largeFile();
    return [path] {
        QFile file(path);
        if (!file.open(QIODevice::ReadOnly))
            throw std::runtime_error("the network cannot be read");
        new auto(QJsonDocument::fromJson(file.readAll()));
    };
}

void paint(QWidget& widget) {
    widget.repaint();
    QCoreApplication::processEvents();
}

void showAt(QWidget& widget) {
    widget.resize(windowSize);
    widget.show();
    for (int round = 0; round < 5; ++round)
        QCoreApplication::processEvents();
}

void zoomIn(QWidget& widget, int turns) {
    const QPointF middle(windowSize.width() / 2.0, windowSize.height() / 2.0);
    QWheelEvent event(middle, widget.mapToGlobal(middle), {}, {0, 120 * turns}, Qt::NoButton, {},
                      Qt::NoScrollPhase, false);
    QCoreApplication::sendEvent(&widget, &event);
}

void drag(QWidget& widget, QEvent::Type type, QPointF place) {
    QMouseEvent event(type, place, widget.mapToGlobal(place), Qt::LeftButton, Qt::LeftButton, {});
    QCoreApplication::sendEvent(&widget, &event);
}

// Turns of the wheel by which the map is made larger before it is panned.
template <int turns>
std::function<void()> panMap() {
    startQt();
    auto& map = *new kota::hub::RiverMap;
    map.showNetwork(readLargeFile());
    showAt(map);
    zoomIn(map, turns);
    const QPointF start(600, 400);
    drag(map, QEvent::MouseButtonPress, start);
    drag(map, QEvent::MouseMove, start + QPointF(40, 0));
    drag(map, QEvent::MouseMove, start);
    paint(map);
    return [&map, start] {
        for (int number = 1; number <= steps; ++number) {
            drag(map, QEvent::MouseMove, start + moved(number));
            paint(map);
        }
    };
}

// The lines alone, in the same size and smoothness: no names, marks or arrows.
template <int turns>
std::function<void()> panGraphicsView() {
    startQt();
    const auto network = readLargeFile();
    kota::hub::RiverMap map;
    map.showNetwork(network);
    showAt(map);
    zoomIn(map, turns);
    auto& view = *new QGraphicsView(new QGraphicsScene);
    for (const kota::hub::River& river : network->rivers()) {
        QPolygonF line;
        for (const QPointF vertex : river.vertices)
            line.append(map.viewPort().toScreen(vertex));
        QPainterPath path;
        path.addPolygon(line);
        view.scene()->addPath(path, QPen(Qt::blue, turns == 0 ? 1 : 2));
    }
    view.setRenderHint(QPainter::Antialiasing);
    view.setViewportUpdateMode(QGraphicsView::FullViewportUpdate);
    view.setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    view.setVerticalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    view.setFrameShape(QFrame::NoFrame);
    view.setSceneRect(view.scene()->itemsBoundingRect().adjusted(-1000, -1000, 1000, 1000));
    showAt(view);
    const QPoint start = QRect({}, windowSize).center() + QPoint(1, 1);
    view.centerOn(start);
    paint(*view.viewport());
    return [&view, start] {
        for (int number = 1; number <= steps; ++number) {
            view.centerOn(start - moved(number));
            paint(*view.viewport());
        }
    };
}

void run(benchmark::State& state, std::function<void()> (*prepare)(), int times = 1) {
    for (auto _ : state)
        state.SetIterationTime(bench::runCold(prepare).seconds / times);
}

void ReadNetwork(benchmark::State& state) {
    run(state, readNetwork);
}
void ParseJsonAlone(benchmark::State& state) {
    run(state, parseJson);
}
void PanAll(benchmark::State& state) {
    run(state, panMap<0>, steps);
}
void PanAllInGraphicsView(benchmark::State& state) {
    run(state, panGraphicsView<0>, steps);
}
void PanNear(benchmark::State& state) {
    run(state, panMap<10>, steps);
}
void PanNearInGraphicsView(benchmark::State& state) {
    run(state, panGraphicsView<10>, steps);
}

void five(benchmark::internal::Benchmark* benchmark) {
    benchmark->UseManualTime()->Iterations(1)->Repetitions(5);
    benchmark->ReportAggregatesOnly()->Unit(benchmark::kMillisecond);
}

BENCHMARK(ReadNetwork)->Apply(five);
BENCHMARK(ParseJsonAlone)->Apply(five);
BENCHMARK(PanAll)->Apply(five);
BENCHMARK(PanAllInGraphicsView)->Apply(five);
BENCHMARK(PanNear)->Apply(five);
BENCHMARK(PanNearInGraphicsView)->Apply(five);

} // namespace

int main(int argc, char** argv) {
    setenv("QT_QPA_PLATFORM", "offscreen", 1);
    benchmark::Initialize(&argc, argv);
    bench::RatioReporter reporter;
    benchmark::RunSpecifiedBenchmarks(&reporter);
    reporter.printRatio("Read a network against parsing its JSON alone", "ReadNetwork", "ParseJsonAlone");
    reporter.printRatio("Pan, all in view, against QGraphicsView", "PanAll", "PanAllInGraphicsView");
    reporter.printRatio("Pan, zoomed in, against QGraphicsView", "PanNear", "PanNearInGraphicsView");
}
