#include "TestFiles.h"
#include "CliRun.h"
#include "gpx/GpxWriter.h"
#include "gpx/TrackFile.h"
#include "gpx/TrackImport.h"
#include "path/GeoDistance.h"
#include "path/Path.h"

#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>
#include <QTemporaryDir>
#include <QTest>

namespace {

QPointF recorded(int i)
{
    return QPointF(11.0 + i * 0.0004, 48.0 + i * 0.0003);
}

QByteArray gpxTrack(int points)
{
    QByteArray body = "<?xml version=\"1.0\"?>\n<gpx creator=\"device\"><trk><trkseg>\n";
    for (int i = 0; i < points; ++i) {
        body += "<trkpt lat=\"" + QByteArray::number(recorded(i).y(), 'f', 7) + "\" lon=\"" +
                QByteArray::number(recorded(i).x(), 'f', 7) + "\"><ele>" + QByteArray::number(500 + i % 50) + "</ele></trkpt>\n";
    }
    return body + "</trkseg></trk></gpx>\n";
}

QStringList titles(const Path &path)
{
    QStringList result;
    for (const KeyPoint &k : path.keyPoints)
        result << k.title();
    return result;
}

// A straight route of four key points: the second untitled, the third disabled.
Path ordinaryRoute()
{
    Path path;
    path.curveMode = CurveMode::Straight;
    const QStringList names{QStringLiteral("Munich"), QString(), QStringLiteral("hidden"), QStringLiteral("Salzburg")};
    const QPointF places[] = {{11.5, 48.1}, {11.9, 47.8}, {12.3, 47.5}, {13.0, 47.8}};
    for (int i = 0; i < 4; ++i) {
        path.addKeyPoint(places[i].x(), places[i].y(), 0, names[i], false);
        path.keyPoints[size_t(i)].properties.title = names[i];
    }
    path.keyPoints[2].properties.enabled = false;
    path.update();
    return path;
}

} // namespace

class TestTrackImport : public QObject
{
    Q_OBJECT

private:
    QTemporaryDir m_dir;

    QString write(const QString &name, const QByteArray &bytes) const { return writeTestFile(m_dir, name, bytes); }

private slots:
    void writerOutputReadsBack()
    {
        Path path = ordinaryRoute();
        std::vector<CurvePoint> samples = path.curvePoints;
        samples[1].z = 812.25;
        const QString file = m_dir.filePath(QStringLiteral("route.gpx"));
        QVERIFY(GpxWriter::write(file, samples, path));

        TrackFile track;
        QVERIFY(track.load(file));
        QVERIFY(track.isOwnFile());
        QCOMPARE(int(track.items().size()), 1);
        const QVector<TrackPoint> &points = track.items().front().points;
        // The legs' seams repeat the sample before them; without a name they are not read back.
        QCOMPARE(points.size(), int(samples.size()) - 2);
        QCOMPARE(points.back().longitude, samples.back().x);
        QCOMPARE(points[1].altitude, 812.25);
        QVERIFY(!points[2].hasAltitude);
        QCOMPARE(points.back().name, QStringLiteral("Salzburg"));
        // Without a stored extent the bounds are those of the samples.
        QCOMPARE(QRectF(track.boundsTopLeft(), track.boundsBottomRight()), track.items().front().bounds.toRect());

        path.setBoundaries(KeyPoint(-5.5, 60.25, 0), KeyPoint(20.0, 35.0, 0));
        QVERIFY(GpxWriter::write(file, samples, path));
        QVERIFY(track.load(file));
        QCOMPARE(track.boundsTopLeft(), QPointF(-5.5, 35.0));
        QCOMPARE(track.boundsBottomRight(), QPointF(20.0, 60.25));
    }

    // A long route of the program's own is a fixed track whose named samples keep their key points.
    void importOfAnOwnRoute()
    {
        const Path route = ordinaryRoute();
        const QString longFile = m_dir.filePath(QStringLiteral("long.gpx"));
        QVERIFY(GpxWriter::write(longFile, route.curvePoints, route));
        Path fixed;
        QVERIFY(TrackImport::read(longFile, fixed, 0));
        QVERIFY(fixed.isFixedTrack());
        QCOMPARE(fixed.curvePoints.size(), route.curvePoints.size() - 2);
        QCOMPARE(titles(fixed), (QStringList{QStringLiteral("Munich"), QStringLiteral("Salzburg")}));
        QCOMPARE(fixed.curvePointIndexNaming(fixed.keyPoints.back().id), int(fixed.curvePoints.size()) - 1);
    }

    void importOfForeignTracks()
    {
        const QString file = write(QStringLiteral("device.gpx"), gpxTrack(5000));
        Path path;
        QVERIFY(TrackImport::read(file, path, 1));
        QVERIFY(path.isFixedTrack());
        // Auto aliasing resamples at the shorter of the target spacing and the closest leg.
        double complete = 0.0, closest = 1e300;
        for (int i = 1; i < 5000; ++i) {
            const double d = geoDistance(recorded(i).y(), recorded(i).x(), recorded(i - 1).y(), recorded(i - 1).x());
            complete += d;
            closest = std::min(closest, d);
        }
        const double expectedSamples = complete / std::min(complete / TrackImport::fixedDuration, closest);
        QVERIFY2(std::abs(double(path.curvePoints.size()) - expectedSamples) < expectedSamples * 0.02,
                 qPrintable(QString::number(path.curvePoints.size())));
        QCOMPARE(QPointF(path.curvePoints.back().x, path.curvePoints.back().y), recorded(4999));

        // Coordinates far outside the globe make short work, not millions of samples (the
        // second file was found by fuzzing).
        const QString wild = write(QStringLiteral("wild.gpx"),
                                   "<gpx><trk><trkseg><trkpt lat=\"10\" lon=\"0.5\"/><trkpt lat=\"11\" lon=\"1e7\"/>"
                                   "<trkpt lat=\"1e200\" lon=\"-1e300\"/><trkpt lat=\"12\" lon=\"3\"/></trkseg></trk></gpx>");
        for (const QString &far : {wild, QStringLiteral(TOURLET_TEST_DATA "/far-off-globe.trk")}) {
            for (uint32_t aliasing : {0u, 1u, 2u, 3u}) {
                Path farOff;
                QVERIFY(TrackImport::read(far, farOff, aliasing));
                QVERIFY(!farOff.curvePoints.empty());
                QVERIFY2(farOff.curvePoints.size() < 10000, qPrintable(QString::number(farOff.curvePoints.size())));
            }
        }

        // A file that can't be read leaves the path as it was.
        Path untouched = ordinaryRoute();
        QVERIFY(!TrackImport::read(write(QStringLiteral("broken.gpx"), "<gpx><trk><trkseg><trkpt lat="), untouched, 1));
        QCOMPARE(untouched.keyPoints.size(), size_t(4));
    }

    void waypointsOfATrackBecomeKeyPoints_data()
    {
        QTest::addColumn<uint32_t>("aliasing");
        QTest::addColumn<double>("tolerance"); // metres between a waypoint and its key point
        QTest::newRow("every point a sample") << 0u << 0.0;
        QTest::newRow("thinned") << 2u << 5.0;
    }

    void waypointsOfATrackBecomeKeyPoints()
    {
        QFETCH(uint32_t, aliasing);
        QFETCH(double, tolerance);
        auto wpt = [](QPointF p, const QByteArray &inner) {
            return "<wpt lat=\"" + QByteArray::number(p.y(), 'f', 7) + "\" lon=\"" + QByteArray::number(p.x(), 'f', 7) +
                   "\">" + inner + "</wpt>\n";
        };
        // As a device writes them: waypoints after the track, one beside it, one on its end,
        // and a nameless one on a named one's place.
        QByteArray gpx = gpxTrack(300);
        gpx.insert(gpx.indexOf("</gpx>"), wpt(recorded(100) + QPointF(0.00001, 0), "<name>Bridge</name>") +
                                              wpt(recorded(299), "<name>Summit</name>") +
                                              wpt(recorded(200), "<name>Hut</name><ele>2</ele>") + wpt(recorded(200), QByteArray()));
        Path path;
        QVERIFY(TrackImport::read(write(QStringLiteral("waypoints.gpx"), gpx), path, aliasing));

        QCOMPARE(titles(path), (QStringList{QString(), QStringLiteral("Bridge"), QStringLiteral("Hut"), QStringLiteral("Summit")}));
        QCOMPARE(path.pathSegments.size(), path.keyPoints.size());
        const int places[] = {0, 100, 200, 299};
        int previous = -1;
        for (size_t k = 0; k < path.keyPoints.size(); ++k) {
            const KeyPoint &key = path.keyPoints[k];
            const int sample = path.curvePointIndexNaming(key.id);
            QVERIFY(sample > previous); // in the order of the curve
            previous = sample;
            const CurvePoint &c = path.curvePoints[size_t(sample)];
            QCOMPARE(QPointF(key.x, key.y), QPointF(c.x, c.y));
            const QPointF place = recorded(places[k]);
            QVERIFY2(geoDistance(c.y, c.x, place.y(), place.x()) <= tolerance, qPrintable(key.title()));
            if (k + 1 < path.keyPoints.size()) // the last key point's segment has no samples
                QCOMPARE(path.pathSegments[k].curvePoints.front().id, c.id);
        }
        QCOMPARE(previous, int(path.curvePoints.size()) - 1);

        // The ends of the track stay locked, the waypoints are ordinary key points of it.
        QVERIFY(!path.deleteKeyPoint(path.keyPoints.front().id));
        QVERIFY(path.deleteKeyPoint(path.keyPoints[1].id));
    }

    void trackCommand()
    {
        const QString file = write(QStringLiteral("cli.gpx"), gpxTrack(300));
        const QString out = m_dir.filePath(QStringLiteral("cli-out.gpx"));
        const CliRun run = runCli({QStringLiteral("track"), file, QStringLiteral("--aliasing"), QStringLiteral("0"),
                                   QStringLiteral("--write-gpx"), out});
        QCOMPARE(run.exitCode, 0);
        const QJsonObject json = QJsonDocument::fromJson(run.out).object();
        QCOMPARE(json.value(QStringLiteral("creator")).toString(), QStringLiteral("device"));
        const QJsonArray samples = json.value(QStringLiteral("curvePoints")).toArray();
        QCOMPARE(samples.size(), 300);
        QCOMPARE(samples.first().toObject().value(QStringLiteral("kp")).toInt(), 0);
        QCOMPARE(samples.last().toObject().value(QStringLiteral("kp")).toInt(), 1);
        QCOMPARE(json.value(QStringLiteral("items")).toArray().first().toObject().value(QStringLiteral("points")).toInt(), 300);
        TrackFile written;
        QVERIFY(written.load(out));
        QCOMPARE(written.items().front().points.size(), 300);

        const CliRun bad = runCli({QStringLiteral("track"), write(QStringLiteral("bad.gpx"), "not xml")});
        QCOMPARE(bad.exitCode, 1);
        QVERIFY(bad.out.isEmpty());
        QCOMPARE(bad.err.count('\n'), 1);
        QVERIFY(runCli({QStringLiteral("track"), file, QStringLiteral("--aliasing"), QStringLiteral("7")}).exitCode != 0);
    }
};

QTEST_GUILESS_MAIN(TestTrackImport)
#include "tst_trackimport.moc"
