#include "models/QKeyPointItemsModel.h"
#include "project/PainterPathRenderer_Controller.h"

#include <QGuiApplication>

#include <benchmark/benchmark.h>

#include <cmath>

namespace {

// A point of a route that wanders over a continent-sized box; about 200 samples per leg.
QPointF routePoint(size_t i, size_t count)
{
    const double t = double(i) / double(count);
    return {-10 + 40 * t + std::sin(i * 0.7) * 0.4, 40 + 15 * std::sin(t * 6.28) + std::cos(i * 1.3) * 0.3};
}

// The 500th waypoint added at the end of a smooth ("curve") route, as a click on the map
// does it: curve regeneration, the row, the markers and the segments sent to the map.
void addLastWaypoint(benchmark::State &state)
{
    qInstallMessageHandler([](QtMsgType, const QMessageLogContext &, const QString &) {});
    const size_t count = size_t(state.range(0));
    PainterPathRenderer_Controller document;
    document.pathManager().activeChecked().curveMode = CurveMode::Smooth;
    KeyPointItemsData data(&document);
    QKeyPointItemsModel model;
    model.setData(&data);
    size_t samplesSent = 0;
    QObject::connect(&model, &QKeyPointItemsModel::pathSegmentChanged,
                     [&](int, const QGeoPath &path) { samplesSent += size_t(path.size()); });
    for (size_t i = 0; i + 1 < count; ++i) {
        const QPointF p = routePoint(i, count);
        model.addKeyPoint(p.x(), p.y(), 0.0, QString());
    }
    const QPointF last = routePoint(count - 1, count);
    for (auto _ : state) {
        model.addKeyPoint(last.x(), last.y(), 0.0, QString());
        state.PauseTiming();
        model.deleteKeyPoint(model.activeKeyPointId());
        state.ResumeTiming();
    }
    state.counters["samples"] = double(document.pathManager().activeChecked().curvePoints.size());
    state.counters["sent"] = double(samplesSent);
}
BENCHMARK(addLastWaypoint)->Arg(500)->Unit(benchmark::kMillisecond);

} // namespace

int main(int argc, char **argv)
{
    QGuiApplication app(argc, argv);
    benchmark::Initialize(&argc, argv);
    benchmark::RunSpecifiedBenchmarks();
    return 0;
}
