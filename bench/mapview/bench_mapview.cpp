#include "mapview/MapView.h"
#include "project/PainterPathRenderer_Controller.h"

#include <QGuiApplication>
#include <QSettings>
#include <QTemporaryDir>

#include <benchmark/benchmark.h>

#include <cmath>

namespace {

// A recorded track of 100,000 samples, some 120 km of winding road, fixed as an
// opened track is.
void makeTrack(Path &path)
{
    path.pathType = PathType::GPX;
    path.fixedCurve = true;
    path.curvePoints.reserve(100000);
    for (int i = 0; i < 100000; ++i) {
        const double t = i / 100000.0;
        path.curvePoints.emplace_back(13.0 + 1.2 * t + 0.05 * std::sin(t * 90), 51.0 + 0.3 * std::sin(t * 7), 0.0);
    }
    KeyPoint first(path.curvePoints.front().x, path.curvePoints.front().y, 0.0);
    KeyPoint last(path.curvePoints.back().x, path.curvePoints.back().y, 0.0);
    path.curvePoints.front().correspondingKeyPoint = first.id;
    path.curvePoints.back().correspondingKeyPoint = last.id;
    path.keyPoints = {first, last};
}

// The pointer over the middle of the track, with the hit radius of a close view
// (60 m), of a view of the region (3 km) or of a view in which the whole track is
// largely within reach (30 km), and over open country far off.
void mouseMoved(benchmark::State &state)
{
    qInstallMessageHandler([](QtMsgType, const QMessageLogContext &, const QString &) {});
    QTemporaryDir dir;
    QSettings store(dir.filePath(QStringLiteral("settings.ini")), QSettings::IniFormat);
    PainterPathRenderer_Controller document;
    MapView view(&document, nullptr, AppSettings(store));
    makeTrack(document.pathManager().activeChecked());
    const CurvePoint middle = document.pathManager().active()->curvePoints[50000];
    const double radius = double(state.range(0));
    const double lat = state.range(1) ? 40.0 : middle.y + 0.0003;
    const double lon = state.range(1) ? 5.0 : middle.x;
    view.setMoveDistance(radius);
    for (auto _ : state)
        benchmark::DoNotOptimize(view.mouseMoved(lon, lat));
}
BENCHMARK(mouseMoved)->Args({60, 0})->Args({3000, 0})->Args({3000, 1})->Args({30000, 0})->Unit(benchmark::kMillisecond);

} // namespace

int main(int argc, char **argv)
{
    qputenv("QT_QPA_PLATFORM", "offscreen");
    QGuiApplication app(argc, argv);
    benchmark::Initialize(&argc, argv);
    benchmark::RunSpecifiedBenchmarks();
    return 0;
}
