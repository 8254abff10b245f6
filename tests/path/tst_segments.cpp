#include "path/PathManager.h"
#include "path/PathSegment.h"
#include "project/QProjectController.h"

#include <QTemporaryDir>
#include <QTest>

#include <cmath>
#include <limits>

class TestSegments : public QObject
{
    Q_OBJECT

private slots:
    void changeDetection()
    {
        PathSegment segment(5);
        QCOMPARE(segment.pilot.width, 120.0);
        QCOMPARE(segment.pilot.flags, 2u);
        QCOMPARE(segment.keyPointId, 5u);
        PathSegment other(5);
        QVERIFY(other.id != segment.id);

        std::vector<CurvePoint> samples{CurvePoint(1, 2, 0), CurvePoint(3, 4, 0)};
        segment.setCurvePoints(std::vector<CurvePoint>(samples));
        QVERIFY(segment.changed);
        segment.changed = false;
        std::vector<CurvePoint> same{CurvePoint(1, 2, 9), CurvePoint(3, 4, 9)}; // z doesn't count
        segment.setCurvePoints(std::move(same));
        QVERIFY(!segment.changed);
        QCOMPARE(segment.curvePoints[0].z, 0.0); // nothing was stored
        samples.emplace_back(5, 6, 0);
        segment.setCurvePoints(std::vector<CurvePoint>(samples));
        QVERIFY(segment.changed);
        QCOMPARE(segment.curvePoints.size(), size_t(3));

        segment.changed = false;
        std::vector<CurvePoint> withNan = samples;
        withNan[2].x = std::numeric_limits<double>::quiet_NaN();
        segment.setCurvePoints(std::vector<CurvePoint>(withNan));
        QVERIFY(segment.changed);
        segment.changed = false;
        segment.setCurvePoints(std::move(withNan)); // NaN is never equal to itself
        QVERIFY(segment.changed);

        PathSegment copy(9);
        copy.assign(segment, false);
        QVERIFY(copy.id != segment.id);
        QCOMPARE(copy.keyPointId, 5u);
        QVERIFY(!copy.changed);
        copy.assign(segment, true);
        QCOMPARE(copy.id, segment.id);
    }

    void pilotRecords()
    {
        PilotProperties custom;
        custom.source = QStringLiteral("avatars/car.png");
        custom.width = 80.0;
        custom.flags = PilotProperties::isAnimated | PilotProperties::symmetric;
        const PilotProperties before = defaultPilot();
        setDefaultPilot(custom);
        PathSegment fromDefault(1);
        setDefaultPilot(before);
        QCOMPARE(fromDefault.pilot.source, custom.source);
        QCOMPARE(fromDefault.pilot.flags, custom.flags);

        PathSegment segment(2);
        segment.setPilot(custom, false);
        QCOMPARE(segment.pilot.width, 120.0);
        QCOMPARE(segment.pilot.source, custom.source);
        segment.setPilot(custom, true);
        QCOMPARE(segment.pilot.width, 80.0);
        segment.setPilotRotation(true);
        QCOMPARE(segment.pilot.flags, 7u);
        segment.setPilotRotation(false);
        QCOMPARE(segment.pilot.flags, 5u);
    }

    void saveAndLoad()
    {
        QTemporaryDir dir;
        const QString file = dir.filePath(QStringLiteral("segments.zkgeo"));
        PathSegment segment(3);
        segment.pilot.source = QStringLiteral("file:///x/imgsrc/avatars/plane, \"big\".png");
        segment.pilot.displayFormat = QStringLiteral("3d");
        segment.pilot.width = 99.1234567;
        segment.pilot.flags = PilotProperties::isAnimated;
        CurvePoint a(1.0 / 3.0, -2.0 / 7.0, 0), b(5, 6, 0);
        a.correspondingKeyPoint = 1000;
        b.correspondingMediaPoint = 2000;
        segment.curvePoints = {a, b};
        {
            QProjectController store;
            QVERIFY(store.createProjectFile(file));
            segment.Save(store, QStringLiteral("pathsegment0"),
                         [](uint32_t id) { return id == 1000 ? 0u : 99u; },
                         [](uint32_t id) { return id == 2000 ? 1u : 99u; });
            store.closeProjectFile();
        }
        QProjectController store;
        QVERIFY(store.openProjectFile(file, true));
        PathSegment loaded(3);
        QVERIFY(loaded.Load(store, QStringLiteral("pathsegment0")));
        QCOMPARE(loaded.pilot.source, segment.pilot.source);
        QCOMPARE(loaded.pilot.displayFormat, segment.pilot.displayFormat);
        QCOMPARE(loaded.pilot.width, 99.123457);
        QCOMPARE(loaded.pilot.flags, uint32_t(PilotProperties::isAnimated));
        QCOMPARE(loaded.curvePoints.size(), size_t(2));
        QVERIFY(loaded.curvePoints[0].x == a.x && loaded.curvePoints[0].y == a.y);
        QCOMPARE(loaded.curvePoints[0].correspondingKeyPoint, 0u);
        QCOMPARE(loaded.curvePoints[1].correspondingKeyPoint, 99u);
        QCOMPARE(loaded.curvePoints[1].correspondingMediaPoint, 1u);

        std::vector<KeyPoint> keys{KeyPoint(0, 0, 0)};
        std::vector<MediaPoint> media{MediaPoint(0, 0, 0), MediaPoint(1, 1, 0)};
        loaded.remapCorrespondingIds(keys, media);
        QCOMPARE(loaded.curvePoints[0].correspondingKeyPoint, keys[0].id);
        QCOMPARE(loaded.curvePoints[1].correspondingKeyPoint, 0u);
        QCOMPARE(loaded.curvePoints[1].correspondingMediaPoint, media[1].id);
    }

    void managerLookupsAndScale()
    {
        PathManager manager;
        QCOMPARE(manager.paths.size(), size_t(1));
        QCOMPARE(manager.activePath, 0);
        QCOMPARE(manager.active()->name, QStringLiteral("numberOne"));

        QVERIFY(!manager.setActivePath(QStringLiteral("other")));
        QCOMPARE(manager.activePath, 0);
        QVERIFY(manager.setActivePath(QStringLiteral("numberOne")));
        QCOMPARE(manager.getPathIndexByIdentifier(QStringLiteral("none")), 1);

        Path track;
        track.name = QStringLiteral("gpxFile");
        track.pathType = PathType::GPX;
        track.addKeyPoint(KeyPoint(1, 2, 0), false);
        const uint32_t identifier = manager.active()->identifier;
        QCOMPARE(manager.addPath(track, QStringLiteral("gpxFile")), identifier);
        QCOMPARE(manager.paths.size(), size_t(1));
        QCOMPARE(manager.active()->name, QStringLiteral("numberOne"));
        QCOMPARE(manager.active()->pathType, PathType::GPX);
        QCOMPARE(manager.active()->keyPoints.size(), size_t(1));

        manager.setScale(2.0);
        QCOMPARE(manager.scale(), 2.0);
        QCOMPARE(manager.scale(QStringLiteral("other")), 1.0);
        manager.setScale(5.0, QStringLiteral("other"));
        QCOMPARE(manager.scale(), 2.0);
        const std::vector<KeyPoint> scaled = manager.keyPoints();
        QCOMPARE(scaled[0].x, 2.0);
        QCOMPARE(scaled[0].y, 4.0);
        QCOMPARE(manager.active()->keyPoints[0].x, 1.0);
        QCOMPARE(manager.removeScale(scaled[0]).x, 1.0);

        const uint32_t keyId = manager.active()->keyPoints[0].id;
        QVERIFY(manager.keyPointById(keyId));
        QVERIFY(!manager.mediaPointById(keyId)); // a key point is no media point
        QVERIFY(!manager.curvePointById(keyId));

        manager.setScale(0.0);
        KeyPoint point(3, 4, 0);
        point.properties.title = QStringLiteral("Top");
        QTest::ignoreMessage(QtDebugMsg, qPrintable(QStringLiteral(
            "PathManager::removeScale: scale = 0 - have to prevent divby0 for kp %1 (Top)").arg(point.id)));
        const KeyPoint same = manager.removeScale(point);
        QCOMPARE(same.x, 3.0);
        QCOMPARE(same.y, 4.0);
    }
};

QTEST_GUILESS_MAIN(TestSegments)
#include "tst_segments.moc"
