#include "TestFiles.h"
#include "project/DocumentFile.h"
#include "project/PainterPathRenderer_Controller.h"

#include <QTemporaryDir>
#include <QTest>

#include <algorithm>
#include <cmath>

namespace {

// A winding recording of `count` points, as a track or as a route of named stops, with
// its extent as the file states the positions; the extremes lie inside, not at the ends.
struct GeneratedTrack
{
    QByteArray text;
    double west = 1e9, south = 1e9, east = -1e9, north = -1e9;

    GeneratedTrack(int count, bool route = false)
    {
        text = route ? "<?xml version=\"1.0\"?>\n<gpx creator=\"planner\"><rte>\n"
                     : "<?xml version=\"1.0\"?>\n<gpx creator=\"recorder\"><trk><name>ride</name><trkseg>\n";
        for (int i = 0; i < count; ++i) {
            const double t = double(i) / count;
            const QByteArray lat = QByteArray::number(46.2 + 0.4 * std::sin(t * 7.0), 'f', 7);
            const QByteArray lon = QByteArray::number(7.1 + 1.3 * t + 0.2 * std::sin(t * 13.0), 'f', 7);
            const QByteArray ele = QByteArray::number(500.0 + 300.0 * std::sin(t * 5.0), 'f', 1);
            west = std::min(west, lon.toDouble());
            east = std::max(east, lon.toDouble());
            south = std::min(south, lat.toDouble());
            north = std::max(north, lat.toDouble());
            if (route)
                text += "<rtept lat=\"" + lat + "\" lon=\"" + lon + "\"><name>Stop " + QByteArray::number(i) + "</name></rtept>\n";
            else
                text += "<trkpt lat=\"" + lat + "\" lon=\"" + lon + "\"><ele>" + ele + "</ele></trkpt>\n";
        }
        text += route ? "</rte></gpx>\n" : "</trkseg></trk></gpx>\n";
    }
};

} // namespace

class TestTrackOpening : public QObject
{
    Q_OBJECT

private:
    QTemporaryDir m_dir;

    QString write(const QString &name, const QByteArray &bytes) { return writeTestFile(m_dir, name, bytes); }

    // The view covers the track from its north-west to its south-east corner,
    // with the centre between them.
    static void checkView(const PainterPathRenderer_Controller &doc, const GeneratedTrack &g)
    {
        const ProjectFields &f = doc.fields();
        QCOMPARE(QPointF(f.visibleBoundariesTL.longitude, f.visibleBoundariesTL.latitude), QPointF(g.west, g.north));
        QCOMPARE(QPointF(f.visibleBoundariesBR.longitude, f.visibleBoundariesBR.latitude), QPointF(g.east, g.south));
        QCOMPARE(QPointF(f.centerPosition.longitude, f.centerPosition.latitude), QPointF(g.west + g.east, g.south + g.north) / 2);
        QCOMPARE(f.centerPosition.x, f.centerPosition.longitude);
    }

private slots:
    void initTestCase()
    {
        qInstallMessageHandler([](QtMsgType, const QMessageLogContext &, const QString &) {});
    }

    void longTrackBecomesFixedPath()
    {
        const GeneratedTrack g(20000);
        const QString file = write(QStringLiteral("ride.gpx"), g.text);

        PainterPathRenderer_Controller doc;
        doc.fields().projectTitle = QStringLiteral("previous work");
        doc.setGpxAliasing(2);
        QCOMPARE(int(openDocumentFile(doc, file).status), int(DocumentOpenResult::Status::Track));
        QVERIFY(doc.fields().projectTitle.isEmpty());
        QVERIFY(doc.keyPointsFixed());
        const Path &path = *doc.pathManager().active();
        QVERIFY(path.isFixedTrack());
        // A foreign recording keeps only its ends as key points.
        QCOMPARE(path.keyPoints.size(), size_t(2));
        QCOMPARE(path.keyPoints.front().altitude, 500.0);
        // Above two minutes of frames, "default" thins to the average spacing: at
        // most one sample per recorded point.
        const size_t thinned = path.curvePoints.size();
        QVERIFY2(thinned > 1000 && thinned <= 20000, QByteArray::number(qulonglong(thinned)));
        QCOMPARE(path.curvePoints.back().correspondingKeyPoint, path.keyPoints.back().id);
        QCOMPARE(path.keyPoints.front().properties.durationToNextKP, int32_t(3 * thinned));
        checkView(doc, g);

        // The document's aliasing decides the thinning: "off" keeps exactly the recorded points.
        doc.setGpxAliasing(0);
        QVERIFY(openDocumentFile(doc, file).ok());
        QCOMPARE(doc.pathManager().active()->curvePoints.size(), size_t(20000));

        // Saved as a project, the track comes back with the same curve and view.
        const std::vector<CurvePoint> curve = doc.pathManager().active()->curvePoints;
        const QString project = m_dir.filePath(QStringLiteral("ride.zkgeo"));
        QVERIFY(saveDocumentFile(doc, project));
        PainterPathRenderer_Controller back;
        QCOMPARE(int(openDocumentFile(back, project).status), int(DocumentOpenResult::Status::Project));
        const Path &q = *back.pathManager().active();
        QVERIFY(q.isFixedTrack());
        QVERIFY(!back.keyPointsFixed());
        QCOMPARE(q.curvePoints.size(), curve.size());
        QCOMPARE(q.curvePoints.back().correspondingKeyPoint, q.keyPoints.back().id);
        checkView(back, g);
    }

    // A short route becomes an ordinary path whose points are all key points, with
    // their names as titles; a long one is converted like a track.
    void routes_data()
    {
        QTest::addColumn<int>("count");
        QTest::addColumn<bool>("fixed");
        QTest::newRow("short route") << 12 << false;
        QTest::newRow("long route") << 101 << true;
    }

    void routes()
    {
        QFETCH(int, count);
        QFETCH(bool, fixed);
        const GeneratedTrack g(count, true);
        PainterPathRenderer_Controller doc;
        QCOMPARE(int(openDocumentFile(doc, write(QStringLiteral("plan.gpx"), g.text)).status), int(DocumentOpenResult::Status::Track));
        const Path &path = *doc.pathManager().active();
        QCOMPARE(path.isFixedTrack(), fixed);
        QCOMPARE(path.keyPoints.size(), size_t(fixed ? 2 : count));
        QCOMPARE(path.pathSegments.size(), path.keyPoints.size());
        if (!fixed) {
            QCOMPARE(path.pathType, PathType::Ordinary);
            QCOMPARE(path.keyPoints[3].properties.title, QStringLiteral("Stop 3"));
            QVERIFY(path.curvePoints.size() > size_t(count));
        }
        checkView(doc, g);
    }

    void neitherProjectNorTrack()
    {
        PainterPathRenderer_Controller doc;
        const GeneratedTrack good(50);
        const QStringList bad = {
            write(QStringLiteral("notes.txt"), "shopping list\nmilk\n"),
            write(QStringLiteral("cut.gpx"), good.text.left(40)),
            write(QStringLiteral("future.zkgeo"), "[Header]\nprojecttype=ZKGEO\nprojectversion=9\n"),
            m_dir.filePath(QStringLiteral("absent.gpx")),
        };
        for (const QString &file : bad) {
            QVERIFY(openDocumentFile(doc, write(QStringLiteral("good.gpx"), good.text)).ok());
            doc.fields().projectTitle = QStringLiteral("previous work");
            const DocumentOpenResult result = openDocumentFile(doc, file);
            QCOMPARE(int(result.status), int(DocumentOpenResult::Status::Unreadable));
            QVERIFY(!result.reason.isEmpty());
            // Left as a new project.
            QVERIFY(doc.fields().projectTitle.isEmpty());
            QVERIFY(!doc.keyPointsFixed());
            QVERIFY(doc.pathManager().active()->keyPoints.empty() && doc.pathManager().active()->curvePoints.empty());
            QCOMPARE(doc.fields().centerPosition.latitude, 51.0541733);
            QVERIFY(doc.projectController().isIdle());
        }
    }
};

QTEST_GUILESS_MAIN(TestTrackOpening)
#include "tst_trackopening.moc"
