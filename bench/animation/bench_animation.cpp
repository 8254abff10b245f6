#include "animation/AnimationEventList.h"
#include "animation/PlainAnimationSource.h"

#include <QtGlobal>

#include <benchmark/benchmark.h>

#include <malloc.h>

#include <cmath>

namespace {

void silence()
{
    qInstallMessageHandler([](QtMsgType, const QMessageLogContext &, const QString &) {});
}

size_t heapInUse()
{
    return mallinfo2().uordblks;
}

// A 10-minute film: 200 key points over a country-sized box, limit index 2
// (600 s) and the duration factor at 1, so the legs fill the whole timeline;
// 20 media points of 3 photographs each on the route.
void tenMinuteFilm(PlainAnimationSource &source)
{
    Path &path = source.paths.activeChecked();
    const size_t keyCount = 200;
    for (size_t i = 0; i < keyCount; ++i) {
        const double t = double(i) / double(keyCount);
        path.addKeyPoint(6 + 8 * t + std::sin(i * 0.7) * 0.3, 47 + 5 * std::sin(t * 6.28) + std::cos(i * 1.3) * 0.2, 0.0,
                         QString(), i + 1 == keyCount);
    }
    for (int m = 0; m < 20; ++m) {
        const CurvePoint &sample = path.curvePoints[size_t(path.curvePoints.size() * (m + 0.5) / 20)];
        MediaPoint media(sample.x, sample.y, 0.0);
        for (int j = 0; j < 3; ++j) {
            const QString file = QStringLiteral("/home/user/Pictures/trip/IMG_%1.jpg").arg(m * 3 + j, 4, 10, QLatin1Char('0'));
            media.properties.imageSources.push_back({file, j == 1 ? 90 : 0});
            source.photoPool.insert(file, QSize(4000, 3000));
        }
        path.addMediaPoint(media, 0, false);
    }
    source.animationTiming.maxDurationIndex = 2;
    source.animationTiming.setDurationFactor(1.0);
}

void buildEvents(benchmark::State &state, bool linear, bool flyIn)
{
    silence();
    PlainAnimationSource source;
    tenMinuteFilm(source);
    AnimationEventList list(source);
    list.updateDuration();
    for (auto _ : state) {
        list.build(linear, flyIn, source.camera.zoom);
        benchmark::DoNotOptimize(list.events().data());
    }
    state.counters["events"] = list.count();
    state.counters["timelineFrames"] = list.totalFrames();
    state.counters["curvePoints"] = double(source.paths.activeChecked().curvePoints.size());
}

void buildTenMinutes(benchmark::State &state)
{
    buildEvents(state, false, false);
}
BENCHMARK(buildTenMinutes)->Unit(benchmark::kMillisecond);

void buildTenMinutesLinear(benchmark::State &state)
{
    buildEvents(state, true, false);
}
BENCHMARK(buildTenMinutesLinear)->Unit(benchmark::kMillisecond);

void buildTenMinutesLinearFlyIn(benchmark::State &state)
{
    buildEvents(state, true, true);
}
BENCHMARK(buildTenMinutesLinearFlyIn)->Unit(benchmark::kMillisecond);

// The first build of a list, into memory it has never held.
void buildTenMinutesFirstTime(benchmark::State &state)
{
    silence();
    PlainAnimationSource source;
    tenMinuteFilm(source);
    int events = 0;
    for (auto _ : state) {
        AnimationEventList list(source);
        list.build(true, false, source.camera.zoom);
        events = list.count();
        benchmark::DoNotOptimize(list.events().data());
    }
    state.counters["events"] = events;
}
BENCHMARK(buildTenMinutesFirstTime)->Unit(benchmark::kMillisecond);

// The heap the built list holds, against what one variant map per event would take.
void listMemory(benchmark::State &state)
{
    silence();
    PlainAnimationSource source;
    tenMinuteFilm(source);
    size_t listBytes = 0;
    size_t mapBytes = 0;
    int events = 0;
    for (auto _ : state) {
        AnimationEventList list(source);
        list.updateDuration();
        const size_t before = heapInUse();
        list.build(true, false, source.camera.zoom);
        listBytes = heapInUse() - before;
        events = list.count();

        const size_t beforeMaps = heapInUse();
        QVariantList maps;
        maps.reserve(list.count());
        for (const AnimationEvent &e : list.events())
            maps.append(list.toVariantMap(e));
        mapBytes = heapInUse() - beforeMaps;
        benchmark::DoNotOptimize(maps.size());
    }
    state.counters["events"] = events;
    state.counters["listMiB"] = double(listBytes) / (1024.0 * 1024.0);
    state.counters["bytesPerEvent"] = double(listBytes) / events;
    state.counters["asVariantMapsMiB"] = double(mapBytes) / (1024.0 * 1024.0);
}
BENCHMARK(listMemory)->Unit(benchmark::kMillisecond)->Iterations(3);

// What playback and export do per frame: fetch one event as a variant map.
void fetchEvent(benchmark::State &state)
{
    silence();
    PlainAnimationSource source;
    tenMinuteFilm(source);
    AnimationEventList list(source);
    list.build(true, false, source.camera.zoom);
    uint32_t index = 0;
    QVariantMap map;
    for (auto _ : state) {
        list.eventInRange(index, index + 3, map);
        benchmark::DoNotOptimize(map);
        index = (index + 3) % uint32_t(list.count() - 4);
    }
}
BENCHMARK(fetchEvent);

} // namespace

BENCHMARK_MAIN();
