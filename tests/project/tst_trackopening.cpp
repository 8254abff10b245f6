#include "project/DocumentFile.h"
#include "project/PainterPathRenderer_Controller.h"

#include <QFile>
#include <QTemporaryDir>
#include <QTest>

#include <algorithm>
#include <cmath>

namespace {

struct GeneratedTrack
{
    QByteArray text;
    double west = 1e9, south = 1e9, east = -1e9, north = -1e9;
    int points = 0;

    // Remembers the position as the file states it, so bounds compare exactly.
    void include(const QByteArray &lat, const QByteArray &lon)
    {
        const double y = lat.toDouble(), x = lon.toDouble();
        west = std::min(west, x);
        east = std::max(east, x);
        south = std::min(south, y);
        north = std::max(north, y);
        ++points;
    }
};

// A winding recording of `count` points; its extremes lie inside, not at the ends.
void position(int i, int count, QByteArray &lat, QByteArray &lon, QByteArray &ele)
{
    const double t = double(i) / count;
    lat = QByteArray::number(46.2 + 0.4 * std::sin(t * 7.0), 'f', 7);
    lon = QByteArray::number(7.1 + 1.3 * t + 0.2 * std::sin(t * 13.0), 'f', 7);
    ele = QByteArray::number(500.0 + 300.0 * std::sin(t * 5.0), 'f', 1);
}

GeneratedTrack gpxTrack(int count, const QByteArray &creator = "recorder")
{
    GeneratedTrack g;
    g.text = "<?xml version=\"1.0\"?>\n<gpx creator=\"" + creator + "\"><trk><name>ride</name><trkseg>\n";
    QByteArray lat, lon, ele;
    for (int i = 0; i < count; ++i) {
        position(i, count, lat, lon, ele);
        g.include(lat, lon);
        g.text += "<trkpt lat=\"" + lat + "\" lon=\"" + lon + "\"><ele>" + ele + "</ele></trkpt>\n";
    }
    g.text += "</trkseg></trk></gpx>\n";
    return g;
}

GeneratedTrack gpxRoute(int count)
{
    GeneratedTrack g;
    g.text = "<?xml version=\"1.0\"?>\n<gpx creator=\"planner\"><rte>\n";
    QByteArray lat, lon, ele;
    for (int i = 0; i < count; ++i) {
        position(i, count, lat, lon, ele);
        g.include(lat, lon);
        g.text += "<rtept lat=\"" + lat + "\" lon=\"" + lon + "\"><name>Stop " + QByteArray::number(i) + "</name></rtept>\n";
    }
    g.text += "</rte></gpx>\n";
    return g;
}

GeneratedTrack kmlTrack(int count)
{
    GeneratedTrack g;
    g.text = "<?xml version=\"1.0\"?>\n<kml xmlns=\"http://www.opengis.net/kml/2.2\"><Document><Placemark>"
             "<LineString><coordinates>\n";
    QByteArray lat, lon, ele;
    for (int i = 0; i < count; ++i) {
        position(i, count, lat, lon, ele);
        g.include(lat, lon);
        g.text += lon + ',' + lat + ',' + ele + '\n';
    }
    g.text += "</coordinates></LineString></Placemark></Document></kml>\n";
    return g;
}

GeneratedTrack trkTrack(int count)
{
    GeneratedTrack g;
    g.text = "G  WGS 84\r\nU  1\r\n";
    QByteArray lat, lon, ele;
    for (int i = 0; i < count; ++i) {
        position(i, count, lat, lon, ele);
        g.include(lat, lon);
        g.text += "T  A " + lat + "\xBAN " + lon + "\xBA" "E 17-Jul-13 10:36:52.000 s " + ele + " 0.0 0.0 0.0 0 -1000.0\r\n";
    }
    return g;
}

} // namespace

class TestTrackOpening : public QObject
{
    Q_OBJECT

private:
    QTemporaryDir m_dir;

    QString write(const QString &name, const QByteArray &bytes)
    {
        const QString file = m_dir.filePath(name);
        QFile f(file);
        if (!f.open(QIODevice::WriteOnly) || f.write(bytes) != bytes.size())
            qFatal("cannot write %s", qPrintable(file));
        return file;
    }

    // The view covers the track from its north-west to its south-east corner,
    // with the centre between them.
    static void checkView(const PainterPathRenderer_Controller &doc, const GeneratedTrack &g)
    {
        const ProjectFields &f = doc.fields();
        QCOMPARE(f.visibleBoundariesTL.longitude, g.west);
        QCOMPARE(f.visibleBoundariesTL.latitude, g.north);
        QCOMPARE(f.visibleBoundariesBR.longitude, g.east);
        QCOMPARE(f.visibleBoundariesBR.latitude, g.south);
        QCOMPARE(f.centerPosition.longitude, (g.west + g.east) / 2);
        QCOMPARE(f.centerPosition.latitude, (g.south + g.north) / 2);
        QCOMPARE(f.centerPosition.x, f.centerPosition.longitude);
    }

private slots:
    void initTestCase()
    {
        qInstallMessageHandler([](QtMsgType, const QMessageLogContext &, const QString &) {});
        QVERIFY(m_dir.isValid());
    }

    void longTrackBecomesFixedPath()
    {
        const GeneratedTrack g = gpxTrack(20000);
        const QString file = write(QStringLiteral("ride.gpx"), g.text);

        PainterPathRenderer_Controller doc;
        doc.fields().projectTitle = QStringLiteral("previous work");
        doc.setGpxAliasing(2);
        const DocumentOpenResult result = openDocumentFile(doc, file);
        QCOMPARE(int(result.status), int(DocumentOpenResult::Status::Track));
        QVERIFY(result.ok());
        QVERIFY(doc.fields().projectTitle.isEmpty());
        QVERIFY(doc.keyPointsFixed());

        const PathManager &paths = doc.pathManager();
        QCOMPARE(paths.paths.size(), size_t(1));
        const Path &path = *paths.active();
        QVERIFY(path.isFixedTrack());
        QCOMPARE(path.curveMode, CurveMode::Straight);
        // A foreign recording keeps only its ends as key points.
        QCOMPARE(path.keyPoints.size(), size_t(2));
        QCOMPARE(path.keyPoints.front().longitude, 7.1);
        QCOMPARE(path.keyPoints.front().altitude, 500.0);
        // Above two minutes of frames, "default" thins to the average spacing: at
        // most one sample per recorded point.
        const size_t thinned = path.curvePoints.size();
        QVERIFY2(thinned > 1000 && thinned <= size_t(g.points), QByteArray::number(qulonglong(thinned)));
        QCOMPARE(path.curvePoints.front().correspondingKeyPoint, path.keyPoints.front().id);
        QCOMPARE(path.curvePoints.back().correspondingKeyPoint, path.keyPoints.back().id);
        QCOMPARE(path.pathSegments.front().curvePoints.size(), thinned);
        QCOMPARE(path.keyPoints.front().properties.durationToNextKP, int32_t(3 * thinned));
        checkView(doc, g);

        // The document's aliasing decides the thinning: "max" keeps more samples,
        // "off" exactly the recorded points.
        doc.setGpxAliasing(3);
        QVERIFY(openDocumentFile(doc, file).ok());
        QVERIFY(doc.pathManager().active()->curvePoints.size() > thinned);
        doc.setGpxAliasing(0);
        QVERIFY(openDocumentFile(doc, file).ok());
        QCOMPARE(doc.pathManager().active()->curvePoints.size(), size_t(g.points));
        checkView(doc, g);

        // Saved as a project, the track comes back with the same curve and view.
        doc.setGpxAliasing(2);
        QVERIFY(openDocumentFile(doc, file).ok());
        const std::vector<CurvePoint> curve = doc.pathManager().active()->curvePoints;
        const QString project = m_dir.filePath(QStringLiteral("ride.zkgeo"));
        QVERIFY(saveDocumentFile(doc, project));
        PainterPathRenderer_Controller back;
        QCOMPARE(int(openDocumentFile(back, project).status), int(DocumentOpenResult::Status::Project));
        const Path &q = *back.pathManager().active();
        QVERIFY(q.isFixedTrack());
        QVERIFY(!back.keyPointsFixed());
        QCOMPARE(q.curvePoints.size(), curve.size());
        for (size_t i = 0; i < curve.size(); i += 97) {
            QCOMPARE(q.curvePoints[i].x, curve[i].x);
            QCOMPARE(q.curvePoints[i].y, curve[i].y);
        }
        QCOMPARE(q.curvePoints.back().correspondingKeyPoint, q.keyPoints.back().id);
        checkView(back, g);
    }

    void everyTrackFormatOpens()
    {
        PainterPathRenderer_Controller doc;

        const GeneratedTrack kml = kmlTrack(300);
        QCOMPARE(int(openDocumentFile(doc, write(QStringLiteral("line.kml"), kml.text)).status),
                 int(DocumentOpenResult::Status::Track));
        QVERIFY(doc.pathManager().active()->isFixedTrack());
        QCOMPARE(doc.pathManager().active()->keyPoints.size(), size_t(2));
        checkView(doc, kml);

        const GeneratedTrack trk = trkTrack(300);
        QCOMPARE(int(openDocumentFile(doc, write(QStringLiteral("log.trk"), trk.text)).status),
                 int(DocumentOpenResult::Status::Track));
        QVERIFY(doc.pathManager().active()->isFixedTrack());
        QByteArray lat, lon, ele;
        position(299, 300, lat, lon, ele);
        QCOMPARE(doc.pathManager().active()->keyPoints.back().altitude, ele.toDouble());
        checkView(doc, trk);

        // A short track is still a track; a short route becomes an ordinary path whose
        // points are all key points, with their names as titles.
        const GeneratedTrack shortTrack = gpxTrack(5);
        QVERIFY(openDocumentFile(doc, write(QStringLiteral("short.gpx"), shortTrack.text)).ok());
        QVERIFY(doc.pathManager().active()->isFixedTrack());
        checkView(doc, shortTrack);

        const GeneratedTrack route = gpxRoute(12);
        QVERIFY(openDocumentFile(doc, write(QStringLiteral("plan.gpx"), route.text)).ok());
        const Path &planned = *doc.pathManager().active();
        QCOMPARE(planned.pathType, PathType::Ordinary);
        QCOMPARE(planned.keyPoints.size(), size_t(12));
        QCOMPARE(planned.keyPoints[3].properties.title, QStringLiteral("Stop 3"));
        QCOMPARE(planned.pathSegments.size(), size_t(12));
        QVERIFY(planned.curvePoints.size() > 12);
        checkView(doc, route);

        // A route long enough is converted like a track.
        QVERIFY(openDocumentFile(doc, write(QStringLiteral("long plan.gpx"), gpxRoute(101).text)).ok());
        QVERIFY(doc.pathManager().active()->isFixedTrack());
    }

    void neitherProjectNorTrack()
    {
        PainterPathRenderer_Controller doc;
        QVERIFY(openDocumentFile(doc, write(QStringLiteral("good.gpx"), gpxTrack(50).text)).ok());
        QVERIFY(doc.keyPointsFixed());

        const QStringList bad = {
            write(QStringLiteral("notes.txt"), "shopping list\nmilk\n"),
            write(QStringLiteral("page.gpx"), "<?xml version=\"1.0\"?><html><body/></html>"),
            write(QStringLiteral("cut.gpx"), gpxTrack(50).text.left(40)),
            write(QStringLiteral("empty.kml"), "<kml><Document/></kml>"),
            write(QStringLiteral("noise.trk"), "G  WGS 84\nT A\n"),
            write(QStringLiteral("future.zkgeo"), "[Header]\nprojecttype=ZKGEO\nprojectversion=9\n"),
            m_dir.filePath(QStringLiteral("absent.gpx")),
        };
        for (const QString &file : bad) {
            doc.fields().projectTitle = QStringLiteral("previous work");
            const DocumentOpenResult result = openDocumentFile(doc, file);
            QVERIFY2(!result.ok(), qPrintable(file));
            QCOMPARE(int(result.status), int(DocumentOpenResult::Status::Unreadable));
            QVERIFY(!result.reason.isEmpty());
            // Left as a new project.
            QVERIFY(doc.fields().projectTitle.isEmpty());
            QVERIFY(!doc.keyPointsFixed());
            QVERIFY(doc.pathManager().active()->keyPoints.empty());
            QVERIFY(doc.pathManager().active()->curvePoints.empty());
            QCOMPARE(doc.fields().centerPosition.latitude, 51.0541733);
            QVERIFY(doc.projectController().isIdle());
        }
    }
};

QTEST_GUILESS_MAIN(TestTrackOpening)
#include "tst_trackopening.moc"
