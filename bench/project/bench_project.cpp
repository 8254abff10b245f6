#include "project/DocumentFile.h"
#include "project/PainterPathRenderer_Controller.h"

#include <QFile>
#include <QFileInfo>
#include <QImage>
#include <QTemporaryDir>
#include <QtGlobal>

#include <benchmark/benchmark.h>

#include <cmath>

namespace {

constexpr int trackPoints = 200000;

// A 200,000-point recording of a winding ride with elevations, written once.
QString writeTrack(const QTemporaryDir &dir)
{
    const QString file = dir.filePath(QStringLiteral("ride.gpx"));
    if (QFileInfo::exists(file))
        return file;
    QByteArray text = "<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n<gpx version=\"1.1\" creator=\"logger\">\n"
                      "<trk><name>ride</name><trkseg>\n";
    text.reserve(trackPoints * 80);
    for (int i = 0; i < trackPoints; ++i) {
        const double t = double(i) / trackPoints;
        text += "<trkpt lat=\"" + QByteArray::number(46.0 + 2.5 * std::sin(t * 9.0), 'f', 7) + "\" lon=\"" +
                QByteArray::number(7.0 + 6.0 * t + 0.01 * std::sin(i * 0.001), 'f', 7) + "\"><ele>" +
                QByteArray::number(400.0 + 1500.0 * std::sin(t * 31.0), 'f', 1) + "</ele></trkpt>\n";
    }
    text += "</trkseg></trk></gpx>\n";
    QFile out(file);
    if (out.open(QIODevice::WriteOnly))
        out.write(text);
    return file;
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

// The track opened the way the program opens it, at the given aliasing, with 100 photos.
bool makeProject(PainterPathRenderer_Controller &doc, const QTemporaryDir &dir, uint32_t aliasing)
{
    doc.setGpxAliasing(aliasing);
    if (!openDocumentFile(doc, writeTrack(dir)).ok())
        return false;
    addPhotos(doc, dir);
    return true;
}

void quiet()
{
    qInstallMessageHandler([](QtMsgType, const QMessageLogContext &, const QString &) {});
}

// range(0) is the aliasing: 2 "default", 3 "max".
void saveProject(benchmark::State &state)
{
    quiet();
    QTemporaryDir dir;
    PainterPathRenderer_Controller doc;
    if (!makeProject(doc, dir, uint32_t(state.range(0)))) {
        state.SkipWithError("track not opened");
        return;
    }
    const QString file = dir.filePath(QStringLiteral("bench.zkgeo"));
    for (auto _ : state) {
        if (!saveDocumentFile(doc, file))
            state.SkipWithError("save failed");
    }
    state.counters["curvePoints"] = double(doc.pathManager().activeChecked().curvePoints.size());
    state.counters["MB"] = double(QFileInfo(file).size()) / 1e6;
}
BENCHMARK(saveProject)->Arg(2)->Arg(3)->Unit(benchmark::kMillisecond)->Iterations(3);

void loadProject(benchmark::State &state)
{
    quiet();
    QTemporaryDir dir;
    const QString file = dir.filePath(QStringLiteral("bench.zkgeo"));
    {
        PainterPathRenderer_Controller doc;
        if (!makeProject(doc, dir, uint32_t(state.range(0))) || !saveDocumentFile(doc, file)) {
            state.SkipWithError("project not made");
            return;
        }
    }
    PainterPathRenderer_Controller doc;
    for (auto _ : state) {
        if (openDocumentFile(doc, file).status != DocumentOpenResult::Status::Project)
            state.SkipWithError("load failed");
    }
    state.counters["curvePoints"] = double(doc.pathManager().activeChecked().curvePoints.size());
    state.counters["photos"] = double(doc.photoPool().photos.size());
}
BENCHMARK(loadProject)->Arg(2)->Arg(3)->Unit(benchmark::kMillisecond)->Iterations(3);

// An ordinary route of 1000 key points (about 200,000 samples) with range(0) media
// points, saved once and loaded: the media points find their samples again.
void loadRouteWithPhotos(benchmark::State &state)
{
    quiet();
    QTemporaryDir dir;
    const QString file = dir.filePath(QStringLiteral("route.zkgeo"));
    {
        PainterPathRenderer_Controller doc;
        Path &path = doc.pathManager().activeChecked();
        for (int i = 0; i < 1000; ++i) {
            const double t = i / 1000.0;
            path.addKeyPoint(-10 + 40 * t + std::sin(i * 0.7) * 0.4, 40 + 15 * std::sin(t * 6.28), 0.0, QString(), i == 999);
        }
        const size_t mediaCount = size_t(state.range(0));
        for (size_t i = 0; i < mediaCount; ++i) {
            const CurvePoint &sample = path.curvePoints[(i * 2 + 1) * path.curvePoints.size() / (2 * mediaCount)];
            path.addMediaPoint(MediaPoint(sample.x, sample.y, 0), 0, false);
        }
        if (!saveDocumentFile(doc, file)) {
            state.SkipWithError("project not made");
            return;
        }
    }
    PainterPathRenderer_Controller doc;
    for (auto _ : state) {
        if (openDocumentFile(doc, file).status != DocumentOpenResult::Status::Project)
            state.SkipWithError("load failed");
    }
    state.counters["curvePoints"] = double(doc.pathManager().activeChecked().curvePoints.size());
    state.counters["mediaPoints"] = double(doc.pathManager().activeChecked().mediaPoints.size());
}
BENCHMARK(loadRouteWithPhotos)->Arg(0)->Arg(400)->Unit(benchmark::kMillisecond)->Iterations(3);

// Reading and converting the track itself, for comparison.
void openTrack(benchmark::State &state)
{
    quiet();
    QTemporaryDir dir;
    const QString track = writeTrack(dir);
    PainterPathRenderer_Controller doc;
    doc.setGpxAliasing(uint32_t(state.range(0)));
    for (auto _ : state) {
        if (!openDocumentFile(doc, track).ok())
            state.SkipWithError("track not opened");
    }
    state.counters["curvePoints"] = double(doc.pathManager().activeChecked().curvePoints.size());
}
BENCHMARK(openTrack)->Arg(2)->Arg(3)->Unit(benchmark::kMillisecond)->Iterations(2);

} // namespace

BENCHMARK_MAIN();
