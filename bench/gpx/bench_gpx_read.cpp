// Reading a 200,000-point GPX track of about 20 MB, the size of a long day's recording.
// Run with --write-gpx=FILE to only write the generated file (for comparisons).
#include "gpx/TrackFile.h"
#include "gpx/TrackImport.h"
#include "path/Path.h"

#include <QFile>
#include <QTemporaryDir>

#include <benchmark/benchmark.h>

#include <sys/resource.h>

#include <cstdio>
#include <cstring>

namespace {

constexpr int pointCount = 200000;

// `waypoints` named points follow the track, spread along it and a little beside it, as
// a device stores them.
bool writeTrack(const QString &fileName, int waypoints = 0)
{
    QFile file(fileName);
    if (!file.open(QIODevice::WriteOnly | QIODevice::Truncate))
        return false;
    QByteArray chunk;
    chunk += "<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n"
             "<gpx xmlns=\"http://example.org/GPX/1/1\" creator=\"bench\" version=\"1.1\"\n"
             " xmlns:xsi=\"http://www.w3.org/2001/XMLSchema-instance\">\n"
             " <metadata><time>2024-05-01T06:00:00Z</time></metadata>\n"
             " <trk><name>Long day</name><trkseg>\n";
    char line[160];
    for (int i = 0; i < pointCount; ++i) {
        const double latitude = 46.0 + i * 0.0000123;
        const double longitude = 7.0 + i * 0.0000171;
        const double elevation = 400.0 + (i % 3000) * 0.1;
        const int seconds = i;
        std::snprintf(line, sizeof line,
                      "  <trkpt lat=\"%.7f\" lon=\"%.7f\"><ele>%.1f</ele><time>2024-05-0%dT%02d:%02d:%02dZ</time></trkpt>\n",
                      latitude, longitude, elevation, 1 + seconds / 86400, seconds / 3600 % 24, seconds / 60 % 60,
                      seconds % 60);
        chunk += line;
        if (chunk.size() > (1 << 20)) {
            file.write(chunk);
            chunk.clear();
        }
    }
    chunk += " </trkseg></trk>\n";
    for (int w = 0; w < waypoints; ++w) {
        const int i = int((w + 0.5) * pointCount / waypoints);
        std::snprintf(line, sizeof line, " <wpt lat=\"%.7f\" lon=\"%.7f\"><name>Stop %d</name></wpt>\n",
                      46.0 + i * 0.0000123 + 0.00002, 7.0 + i * 0.0000171, w);
        chunk += line;
    }
    chunk += "</gpx>\n";
    return file.write(chunk) == chunk.size();
}

// The same track as one KML line string, the shape in which mapping tools export it.
bool writeKmlTrack(const QString &fileName)
{
    QFile file(fileName);
    if (!file.open(QIODevice::WriteOnly | QIODevice::Truncate))
        return false;
    QByteArray chunk = "<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n<kml xmlns=\"http://www.opengis.net/kml/2.2\">"
                       "<Document><Placemark><name>Long day</name><LineString><coordinates>\n";
    char tuple[80];
    for (int i = 0; i < pointCount; ++i) {
        std::snprintf(tuple, sizeof tuple, "%.7f,%.7f,%.1f\n", 7.0 + i * 0.0000171, 46.0 + i * 0.0000123,
                      400.0 + (i % 3000) * 0.1);
        chunk += tuple;
    }
    chunk += "</coordinates></LineString></Placemark></Document></kml>\n";
    return file.write(chunk) == chunk.size();
}

long peakRssKiB()
{
    rusage usage{};
    getrusage(RUSAGE_SELF, &usage);
    return usage.ru_maxrss;
}

void BM_ReadLargeGpx(benchmark::State &state)
{
    QTemporaryDir folder;
    const QString fileName = folder.filePath(QStringLiteral("long.gpx"));
    if (!writeTrack(fileName)) {
        state.SkipWithError("cannot write the track file");
        return;
    }
    const double fileMiB = QFile(fileName).size() / (1024.0 * 1024.0);
    const long rssBefore = peakRssKiB();

    int points = 0;
    for (auto _ : state) {
        TrackFile file;
        if (!file.load(fileName)) {
            state.SkipWithError("read failed");
            return;
        }
        const int selected = file.selectItem();
        points = file.items()[size_t(selected)].points.size();
        benchmark::DoNotOptimize(points);
    }
    state.counters["points"] = points;
    state.counters["file_MiB"] = fileMiB;
    // Growth of the process's peak resident size over its state before the first read.
    state.counters["peak_growth_MiB"] = (peakRssKiB() - rssBefore) / 1024.0;
    state.SetBytesProcessed(int64_t(state.iterations()) * QFile(fileName).size());
}
BENCHMARK(BM_ReadLargeGpx)->Unit(benchmark::kMillisecond)->Iterations(5);

void BM_ReadLargeKml(benchmark::State &state)
{
    QTemporaryDir folder;
    const QString fileName = folder.filePath(QStringLiteral("long.kml"));
    if (!writeKmlTrack(fileName)) {
        state.SkipWithError("cannot write the track file");
        return;
    }
    int points = 0;
    for (auto _ : state) {
        TrackFile file;
        if (!file.load(fileName)) {
            state.SkipWithError("read failed");
            return;
        }
        points = file.items()[size_t(file.selectItem())].points.size();
        benchmark::DoNotOptimize(points);
    }
    state.counters["points"] = points;
    state.SetBytesProcessed(int64_t(state.iterations()) * QFile(fileName).size());
}
BENCHMARK(BM_ReadLargeKml)->Unit(benchmark::kMillisecond)->Iterations(3);

// Opening such a track with 300 named waypoints: reading, conversion and the placing of
// each waypoint on its nearest sample, by the "GpxAliasing" setting given.
void BM_ImportTrackWithWaypoints(benchmark::State &state)
{
    QTemporaryDir folder;
    const QString fileName = folder.filePath(QStringLiteral("waypoints.gpx"));
    if (!writeTrack(fileName, 300)) {
        state.SkipWithError("cannot write the track file");
        return;
    }
    size_t keyPoints = 0, samples = 0;
    for (auto _ : state) {
        Path path;
        if (!TrackImport::read(fileName, path, uint32_t(state.range(0)))) {
            state.SkipWithError("read failed");
            return;
        }
        keyPoints = path.keyPoints.size();
        samples = path.curvePoints.size();
    }
    state.counters["key_points"] = double(keyPoints);
    state.counters["samples"] = double(samples);
}
BENCHMARK(BM_ImportTrackWithWaypoints)->Arg(1)->Arg(0)->Unit(benchmark::kMillisecond)->Iterations(3);

} // namespace

int main(int argc, char **argv)
{
    for (int i = 1; i < argc; ++i) {
        if (std::strncmp(argv[i], "--write-gpx=", 12) == 0)
            return writeTrack(QString::fromLocal8Bit(argv[i] + 12)) ? 0 : 1;
    }
    benchmark::Initialize(&argc, argv);
    benchmark::RunSpecifiedBenchmarks();
    benchmark::Shutdown();
    return 0;
}
