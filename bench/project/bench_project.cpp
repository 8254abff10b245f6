#include "project/DocumentFile.h"
#include "project/PainterPathRenderer_Controller.h"

#include <QFileInfo>
#include <QImage>
#include <QTemporaryDir>
#include <QtGlobal>

#include <benchmark/benchmark.h>

#include <cmath>

namespace {

constexpr size_t trackPoints = 200000;

// A fixed track path as a 200,000-point recording becomes: every `keep`-th point on
// the curve, two key points at its ends, the first segment holding the whole curve.
void fillTrack(PainterPathRenderer_Controller &doc, size_t keep)
{
    doc.newProject();
    Path &path = doc.pathManager().activeChecked();
    path.pathType = PathType::GPX;
    path.curveMode = CurveMode::Straight;
    for (size_t i = 0; i < trackPoints; i += keep) {
        const double t = double(i) / trackPoints;
        path.addCurvePoint(7.0 + 6.0 * t + 0.01 * std::sin(i * 0.001), 46.0 + 2.5 * std::sin(t * 9.0),
                           400.0 + 1500.0 * std::sin(t * 31.0));
    }
    KeyPoint first(path.curvePoints.front().x, path.curvePoints.front().y, path.curvePoints.front().z);
    KeyPoint last(path.curvePoints.back().x, path.curvePoints.back().y, path.curvePoints.back().z);
    first.properties.durationToNextKP = int32_t(3 * path.curvePoints.size());
    path.addKeyPoint(first, false);
    path.addKeyPoint(last, false);
    path.curvePoints.front().correspondingKeyPoint = path.keyPoints.front().id;
    path.curvePoints.back().correspondingKeyPoint = path.keyPoints.back().id;
    path.pathSegments.front().curvePoints = path.curvePoints;
}

void addPhotos(PainterPathRenderer_Controller &doc, const QTemporaryDir &dir)
{
    QImage image(64, 48, QImage::Format_RGB32);
    image.fill(Qt::gray);
    for (int i = 0; i < 100; ++i) {
        const QString file = dir.filePath(QStringLiteral("photo%1.jpg").arg(i));
        if (!QFileInfo::exists(file))
            image.save(file, "JPG");
        doc.photoPool().add(file, 64, 48);
    }
}

void quiet()
{
    qInstallMessageHandler([](QtMsgType, const QMessageLogContext &, const QString &) {});
}

// range(0): keep every n-th point; 56 gives about 3600 samples (aliasing default), 1 all (max).
void saveProject(benchmark::State &state)
{
    quiet();
    QTemporaryDir dir;
    PainterPathRenderer_Controller doc;
    fillTrack(doc, size_t(state.range(0)));
    addPhotos(doc, dir);
    const QString file = dir.filePath(QStringLiteral("bench.zkgeo"));
    for (auto _ : state) {
        if (!saveDocumentFile(doc, file))
            state.SkipWithError("save failed");
    }
    state.counters["curvePoints"] = double(doc.pathManager().activeChecked().curvePoints.size());
    state.counters["MB"] = double(QFileInfo(file).size()) / 1e6;
}
BENCHMARK(saveProject)->Arg(56)->Arg(1)->Unit(benchmark::kMillisecond)->Iterations(2);

// The project part alone, without the altitude theme and the backup copy.
void saveProjectFileOnly(benchmark::State &state)
{
    quiet();
    QTemporaryDir dir;
    PainterPathRenderer_Controller doc;
    fillTrack(doc, size_t(state.range(0)));
    addPhotos(doc, dir);
    const QString file = dir.filePath(QStringLiteral("bench.zkgeo"));
    for (auto _ : state)
        doc.SaveProject(file);
}
BENCHMARK(saveProjectFileOnly)->Arg(56)->Arg(1)->Unit(benchmark::kMillisecond)->Iterations(2);

void loadProject(benchmark::State &state)
{
    quiet();
    QTemporaryDir dir;
    const QString file = dir.filePath(QStringLiteral("bench.zkgeo"));
    {
        PainterPathRenderer_Controller doc;
        fillTrack(doc, size_t(state.range(0)));
        addPhotos(doc, dir);
        saveDocumentFile(doc, file);
    }
    PainterPathRenderer_Controller doc;
    for (auto _ : state) {
        if (!openDocumentFile(doc, file).ok())
            state.SkipWithError("load failed");
    }
    state.counters["curvePoints"] = double(doc.pathManager().activeChecked().curvePoints.size());
    state.counters["photos"] = double(doc.photoPool().photos.size());
}
BENCHMARK(loadProject)->Arg(56)->Arg(1)->Unit(benchmark::kMillisecond)->Iterations(2);

} // namespace

BENCHMARK_MAIN();
