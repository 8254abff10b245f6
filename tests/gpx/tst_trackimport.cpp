#include "TestFiles.h"
#include "CliRun.h"
#include "gpx/GpxWriter.h"
#include "gpx/TrackFile.h"
#include "gpx/TrackImport.h"
#include "path/GeoDistance.h"
#include "path/Path.h"

#include <QFile>
#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>
#include <QTemporaryDir>
#include <QTest>
#include <QXmlStreamReader>

namespace {

bool wellFormed(const QString &fileName)
{
    QFile file(fileName);
    if (!file.open(QIODevice::ReadOnly))
        return false;
    QXmlStreamReader xml(&file);
    while (!xml.atEnd())
        xml.readNext();
    return !xml.hasError();
}

QByteArray gpxTrack(int points, const QByteArray &creator = "device")
{
    QByteArray body = "<?xml version=\"1.0\"?>\n<gpx creator=\"" + creator + "\"><trk><trkseg>\n";
    for (int i = 0; i < points; ++i) {
        body += "<trkpt lat=\"" + QByteArray::number(48.0 + i * 0.0003, 'f', 7) + "\" lon=\"" +
                QByteArray::number(11.0 + i * 0.0004, 'f', 7) + "\"><ele>" + QByteArray::number(500 + i % 50) +
                "</ele></trkpt>\n";
    }
    return body + "</trkseg></trk></gpx>\n";
}

} // namespace

class TestTrackImport : public QObject
{
    Q_OBJECT

private:
    QTemporaryDir m_dir;

    QString write(const QString &name, const QByteArray &bytes) const { return writeTestFile(m_dir, name, bytes); }

    static Path ordinaryRoute()
    {
        Path path;
        path.curveMode = CurveMode::Straight;
        path.addKeyPoint(11.5, 48.1, 0, QStringLiteral("Munich"), false);
        path.addKeyPoint(11.9, 47.8, 0, QString(), false);
        path.addKeyPoint(12.3, 47.5, 0, QStringLiteral("hidden"), false);
        path.addKeyPoint(13.0, 47.8, 0, QStringLiteral("Salzburg"), false);
        path.keyPoints[0].properties.title = QStringLiteral("Munich");
        path.keyPoints[2].properties.title = QStringLiteral("hidden");
        path.keyPoints[2].properties.enabled = false;
        path.keyPoints[3].properties.title = QStringLiteral("Salzburg");
        path.update();
        return path;
    }

private slots:
    void writerOutputReadsBack()
    {
        Path path = ordinaryRoute();
        std::vector<CurvePoint> samples = path.curvePoints;
        samples[1].z = 812.25;
        samples[2].z = 0.0;
        const QString file = m_dir.filePath(QStringLiteral("route.gpx"));
        QVERIFY(GpxWriter::write(file, samples, path));

        TrackFile track;
        QVERIFY(track.load(file));
        QVERIFY(track.isOwnFile());
        QCOMPARE(int(track.items().size()), 1);
        const TrackItem &item = track.items().front();
        QCOMPARE(item.type, int32_t(2));
        // The seam samples repeat the position before them; unnamed repeats are not read back.
        std::vector<CurvePoint> expected;
        for (const CurvePoint &c : samples) {
            const int k = path.keyPointIndex(c.correspondingKeyPoint);
            const bool named = k >= 0 && path.keyPoints[size_t(k)].properties.enabled
                               && !path.keyPoints[size_t(k)].title().isEmpty();
            if (!expected.empty() && expected.back().x == c.x && expected.back().y == c.y && !named && c.z <= 0)
                continue;
            expected.push_back(c);
        }
        QCOMPARE(expected.size(), samples.size() - 2);
        QCOMPARE(item.points.size(), int(expected.size()));
        for (int i = 0; i < item.points.size(); ++i) {
            QCOMPARE(item.points[i].longitude, expected[size_t(i)].x);
            QCOMPARE(item.points[i].latitude, expected[size_t(i)].y);
        }
        QVERIFY(item.points[1].hasAltitude);
        QCOMPARE(item.points[1].altitude, 812.25);
        QVERIFY(!item.points[2].hasAltitude);

        // Titles of enabled key points come back on the samples that name them.
        QStringList names;
        for (const TrackPoint &p : item.points)
            if (!p.name.isEmpty())
                names << p.name;
        QCOMPARE(names, (QStringList{QStringLiteral("Munich"), QStringLiteral("Salzburg")}));
        QCOMPARE(item.points.front().name, QStringLiteral("Munich"));
        QCOMPARE(item.points.back().name, QStringLiteral("Salzburg"));

        // Without a stored extent the bounds are those of the samples.
        QPointF low(180, 90), high(-180, -90);
        for (const CurvePoint &c : samples) {
            low = QPointF(std::min(low.x(), c.x), std::min(low.y(), c.y));
            high = QPointF(std::max(high.x(), c.x), std::max(high.y(), c.y));
        }
        QCOMPARE(track.boundsTopLeft(), low);
        QCOMPARE(track.boundsBottomRight(), high);

        KeyPoint min, max;
        min.setLongitude(-5.5, false);
        min.setLatitude(60.25, false);
        max.setLongitude(20.0, false);
        max.setLatitude(35.0, false);
        path.setBoundaries(min, max);
        QVERIFY(GpxWriter::write(file, samples, path));
        TrackFile again;
        QVERIFY(again.load(file));
        QCOMPARE(again.boundsTopLeft(), QPointF(-5.5, 35.0));
        QCOMPARE(again.boundsBottomRight(), QPointF(20.0, 60.25));
    }

    void writerEdges()
    {
        const Path path = ordinaryRoute();
        const QString empty = m_dir.filePath(QStringLiteral("empty.gpx"));
        QVERIFY(GpxWriter::write(empty, {}, path));
        QVERIFY(wellFormed(empty));
        QFile text(empty);
        QVERIFY(text.open(QIODevice::ReadOnly));
        const QByteArray bytes = text.readAll();
        QVERIFY(bytes.contains("creator=\"Tourlet\""));
        QVERIFY(!bytes.contains("version=\"1.1\""));
        QVERIFY(!bytes.contains("<rtept"));

        const QString locked = write(QStringLiteral("locked.gpx"), "keep me");
        QVERIFY(QFile::setPermissions(locked, QFileDevice::ReadOwner | QFileDevice::ReadGroup));
        QVERIFY(!GpxWriter::write(locked, path.curvePoints, path));
        QFile kept(locked);
        QVERIFY(kept.open(QIODevice::ReadOnly));
        QCOMPARE(kept.readAll(), QByteArray("keep me"));

        QVERIFY(!GpxWriter::write(m_dir.filePath(QStringLiteral("no/such/folder/x.gpx")), path.curvePoints, path));
    }

    void importOfSmallAndLargeRoutes()
    {
        // Up to 100 points an own route becomes an ordinary path with a key point each.
        Path small = ordinaryRoute();
        std::vector<CurvePoint> sparse;
        for (size_t i = 0; i < small.curvePoints.size(); i += 6)
            sparse.push_back(small.curvePoints[i]);
        QCOMPARE(sparse.size(), size_t(100));
        const QString smallFile = m_dir.filePath(QStringLiteral("small.gpx"));
        QVERIFY(GpxWriter::write(smallFile, sparse, small));
        Path imported;
        QVERIFY(TrackImport::read(smallFile, imported, 1));
        QCOMPARE(imported.pathType, int32_t(PathType::Ordinary));
        QVERIFY(!imported.fixedCurve);
        QCOMPARE(imported.keyPoints.size(), sparse.size());
        QCOMPARE(imported.pathSegments.size(), imported.keyPoints.size());
        QCOMPARE(imported.keyPoints.front().title(), QStringLiteral("Munich"));

        // A long own route is a fixed track whose named samples keep their key points.
        Path longRoute;
        longRoute.curveMode = CurveMode::Smooth;
        longRoute.addKeyPoint(2.35, 48.85, 0, QStringLiteral("Paris"), false);
        longRoute.addKeyPoint(4.83, 45.76, 0, QStringLiteral("Lyon"), false);
        longRoute.addKeyPoint(5.37, 43.30, 0, QStringLiteral("Marseille"), false);
        for (KeyPoint &k : longRoute.keyPoints)
            k.properties.title = k.name;
        longRoute.update();
        QVERIFY(longRoute.curvePoints.size() > 100);
        const QString longFile = m_dir.filePath(QStringLiteral("long.gpx"));
        QVERIFY(GpxWriter::write(longFile, longRoute.curvePoints, longRoute));

        Path fixed;
        QVERIFY(TrackImport::read(longFile, fixed, 0));
        QVERIFY(fixed.isFixedTrack());
        QCOMPARE(fixed.curvePoints.size(), longRoute.curvePoints.size());
        QStringList titles;
        for (const KeyPoint &k : fixed.keyPoints)
            titles << k.title();
        QCOMPARE(titles, (QStringList{QStringLiteral("Paris"), QStringLiteral("Lyon"), QStringLiteral("Marseille")}));
        for (const KeyPoint &k : fixed.keyPoints) {
            int named = 0;
            for (const CurvePoint &c : fixed.curvePoints)
                named += c.correspondingKeyPoint == k.id;
            QCOMPARE(named, 1);
        }
        // The extent is that of the route's samples.
        double west = 180, east = -180;
        for (const CurvePoint &c : longRoute.curvePoints) {
            west = std::min(west, c.x);
            east = std::max(east, c.x);
        }
        QCOMPARE(fixed.boundaryMin.longitude, west);
        QCOMPARE(fixed.boundaryMax.longitude, east);
    }

    void importOfForeignTracks()
    {
        const QString file = write(QStringLiteral("device.gpx"), gpxTrack(5000));
        Path path;
        QVERIFY(TrackImport::read(file, path, 1));
        QVERIFY(path.isFixedTrack());
        // A foreign file keeps only its ends as key points.
        QCOMPARE(path.keyPoints.size(), size_t(2));
        // Auto aliasing resamples at the shorter of the target spacing and the closest leg.
        double complete = 0.0, closest = 1e300;
        for (int i = 1; i < 5000; ++i) {
            const double d = geoDistance(48.0 + i * 0.0003, 11.0 + i * 0.0004, 48.0 + (i - 1) * 0.0003, 11.0 + (i - 1) * 0.0004);
            complete += d;
            closest = std::min(closest, d);
        }
        const double expectedSamples = complete / std::min(complete / TrackImport::fixedDuration, closest);
        QVERIFY2(std::abs(double(path.curvePoints.size()) - expectedSamples) < expectedSamples * 0.02,
                 qPrintable(QString::number(path.curvePoints.size())));
        QCOMPARE(path.curvePoints.front().correspondingKeyPoint, path.keyPoints.front().id);
        QCOMPARE(path.curvePoints.back().correspondingKeyPoint, path.keyPoints.back().id);
        QCOMPARE(path.curvePoints.front().x, 11.0);
        QCOMPARE(path.curvePoints.back().y, 48.0 + 4999 * 0.0003);
        QVERIFY(path.curvePoints.front().z >= 500);

        // With aliasing off every recorded point is a sample.
        Path all;
        QVERIFY(TrackImport::read(file, all, 0));
        QCOMPARE(all.curvePoints.size(), size_t(5000));

        // Coordinates far outside the globe make short work, not millions of samples.
        const QString wild = write(QStringLiteral("wild.gpx"),
                                   "<gpx><trk><trkseg><trkpt lat=\"10\" lon=\"0.5\"/><trkpt lat=\"11\" lon=\"1e7\"/>"
                                   "<trkpt lat=\"1e200\" lon=\"-1e300\"/><trkpt lat=\"12\" lon=\"3\"/></trkseg></trk></gpx>");
        for (uint32_t aliasing : {0u, 1u, 2u, 3u}) {
            Path wildPath;
            QVERIFY(TrackImport::read(wild, wildPath, aliasing));
            QVERIFY(!wildPath.curvePoints.empty());
            QVERIFY2(wildPath.curvePoints.size() < 10000, qPrintable(QString::number(wildPath.curvePoints.size())));
        }

        // Found by fuzzing: latitudes of -9.5e15 on a leg of its own once made millions of samples.
        for (uint32_t aliasing : {0u, 1u, 2u, 3u}) {
            Path farOff;
            QVERIFY(TrackImport::read(QStringLiteral(TOURLET_TEST_DATA "/far-off-globe.trk"), farOff, aliasing));
            QVERIFY2(farOff.curvePoints.size() < 10000, qPrintable(QString::number(farOff.curvePoints.size())));
        }

        Path untouched = ordinaryRoute();
        const size_t before = untouched.keyPoints.size();
        QVERIFY(!TrackImport::read(write(QStringLiteral("broken.gpx"), "<gpx><trk><trkseg><trkpt lat="), untouched, 1));
        QVERIFY(!TrackImport::read(m_dir.filePath(QStringLiteral("missing.gpx")), untouched, 1));
        QCOMPARE(untouched.keyPoints.size(), before);
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
        auto at = [](int i) { return QPointF(11.0 + i * 0.0004, 48.0 + i * 0.0003); };
        auto wpt = [](QPointF p, const QByteArray &inner) {
            return "<wpt lat=\"" + QByteArray::number(p.y(), 'f', 7) + "\" lon=\"" + QByteArray::number(p.x(), 'f', 7) +
                   "\">" + inner + "</wpt>\n";
        };
        // As a device writes them: waypoints after the track, one beside it, one on its end,
        // and a nameless one on a named one's place.
        QByteArray gpx = gpxTrack(300);
        gpx.insert(gpx.indexOf("</gpx>"), wpt(at(100) + QPointF(0.00001, 0), "<name>Bridge</name>") +
                                              wpt(at(299), "<name>Summit</name>") +
                                              wpt(at(200), "<name>Hut</name><ele>2</ele>") + wpt(at(200), QByteArray()));
        Path path;
        QVERIFY(TrackImport::read(write(QStringLiteral("waypoints.gpx"), gpx), path, aliasing));

        const QStringList expected{QString(), QStringLiteral("Bridge"), QStringLiteral("Hut"), QStringLiteral("Summit")};
        const QVector<QPointF> places{at(0), at(100), at(200), at(299)};
        QStringList titles;
        for (const KeyPoint &k : path.keyPoints)
            titles << k.title();
        QCOMPARE(titles, expected);
        QCOMPARE(path.pathSegments.size(), path.keyPoints.size());
        int previous = -1;
        for (int k = 0; k < path.keyPoints.size(); ++k) {
            const KeyPoint &key = path.keyPoints[size_t(k)];
            const int sample = path.curvePointIndexNaming(key.id);
            QVERIFY(sample > previous); // in the order of the curve
            previous = sample;
            const CurvePoint &c = path.curvePoints[size_t(sample)];
            QCOMPARE(QPointF(key.x, key.y), QPointF(c.x, c.y));
            QVERIFY2(geoDistance(c.y, c.x, places[k].y(), places[k].x()) <= tolerance,
                     qPrintable(key.title() + QString::number(geoDistance(c.y, c.x, places[k].y(), places[k].x()))));
            if (k + 1 < titles.size()) // the last key point's segment has no samples
                QCOMPARE(path.pathSegments[size_t(k)].curvePoints.front().id, c.id);
        }
        QCOMPARE(previous, int(path.curvePoints.size()) - 1);

        // The ends of the track stay locked, the waypoints are ordinary key points of it.
        QVERIFY(!path.deleteKeyPoint(path.keyPoints.front().id));
        QVERIFY(path.deleteKeyPoint(path.keyPoints[1].id));
        QCOMPARE(path.keyPoints.size(), size_t(3));
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
        QCOMPARE(json.value(QStringLiteral("fixedCurve")).toBool(), true);
        const QJsonArray samples = json.value(QStringLiteral("curvePoints")).toArray();
        QCOMPARE(samples.size(), 300);
        QCOMPARE(samples.first().toObject().value(QStringLiteral("kp")).toInt(), 0);
        QCOMPARE(samples.last().toObject().value(QStringLiteral("kp")).toInt(), 1);
        QCOMPARE(samples.at(1).toObject().value(QStringLiteral("kp")).toInt(), -1);
        const QJsonArray items = json.value(QStringLiteral("items")).toArray();
        QCOMPARE(items.size(), 1);
        QCOMPARE(items.first().toObject().value(QStringLiteral("points")).toInt(), 300);

        TrackFile written;
        QVERIFY(written.load(out));
        QVERIFY(written.isOwnFile());
        QCOMPARE(written.items().front().points.size(), 300);

        const CliRun bad = runCli({QStringLiteral("track"), write(QStringLiteral("bad.gpx"), "not xml")});
        QCOMPARE(bad.exitCode, 1);
        QVERIFY(bad.out.isEmpty());
        const QByteArray message = bad.err.trimmed();
        QVERIFY(!message.isEmpty());
        QVERIFY(!message.contains('\n'));

        QVERIFY(runCli({QStringLiteral("track"), file, QStringLiteral("--aliasing"), QStringLiteral("7")}).exitCode != 0);
    }
};

QTEST_GUILESS_MAIN(TestTrackImport)
#include "tst_trackimport.moc"
