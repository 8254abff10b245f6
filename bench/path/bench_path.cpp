#include "path/Path.h"

#include <QtGlobal>

#include <benchmark/benchmark.h>

#include <cmath>

namespace {

// 1000 key points wandering over a continent-sized box, about 200 samples per leg.
Path continentPath(size_t keyCount)
{
    Path path;
    path.curveMode = CurveMode::Smooth;
    for (size_t i = 0; i < keyCount; ++i) {
        const double t = double(i) / double(keyCount);
        path.addKeyPoint(-10 + 40 * t + std::sin(i * 0.7) * 0.4, 40 + 15 * std::sin(t * 6.28) + std::cos(i * 1.3) * 0.3,
                         0.0, QString(), false);
    }
    return path;
}

void regenerateSmooth(benchmark::State &state)
{
    qSetMessagePattern(QString());
    qInstallMessageHandler([](QtMsgType, const QMessageLogContext &, const QString &) {});
    Path path = continentPath(1000);
    for (auto _ : state) {
        path.update(true);
        benchmark::DoNotOptimize(path.curvePoints.data());
    }
    state.counters["samples"] = double(path.curvePoints.size());
}
BENCHMARK(regenerateSmooth)->Unit(benchmark::kMillisecond);

void hitTestCurve(benchmark::State &state)
{
    qInstallMessageHandler([](QtMsgType, const QMessageLogContext &, const QString &) {});
    Path path = continentPath(500);
    path.update(true);
    path.curvePoints.resize(100000);
    double smallest = 0;
    for (auto _ : state) {
        // A place away from the key points, so the whole curve is searched.
        benchmark::DoNotOptimize(path.hitTest(5.01, 45.02, 1000.0, smallest, true));
    }
    state.counters["samples"] = double(path.curvePoints.size());
}
BENCHMARK(hitTestCurve)->Unit(benchmark::kMillisecond);

// range(0) media points spread over the route, which keep their places.
void insertKeyPoint(benchmark::State &state)
{
    qInstallMessageHandler([](QtMsgType, const QMessageLogContext &, const QString &) {});
    Path path = continentPath(1000);
    path.update(true);
    const size_t mediaCount = size_t(state.range(0));
    for (size_t i = 0; i < mediaCount; ++i) {
        const CurvePoint &sample = path.curvePoints[(i * 2 + 1) * path.curvePoints.size() / (2 * mediaCount)];
        path.addMediaPoint(MediaPoint(sample.x, sample.y, 0), 0, false);
    }
    for (auto _ : state) {
        state.PauseTiming();
        const uint32_t after = path.keyPoints[500].id;
        const KeyPoint point((path.keyPoints[500].x + path.keyPoints[501].x) / 2, path.keyPoints[500].y + 0.1, 0);
        state.ResumeTiming();
        path.insertKeyPoint(after, point, true);
        benchmark::DoNotOptimize(path.curvePoints.data());
        state.PauseTiming();
        path.deleteKeyPoint(point.id);
        state.ResumeTiming();
    }
}
BENCHMARK(insertKeyPoint)->Arg(0)->Arg(100)->Arg(400)->Unit(benchmark::kMillisecond);

} // namespace

BENCHMARK_MAIN();
