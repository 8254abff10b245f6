#include "path/PathManager.h"
#include "path/PathSegment.h"
#include "project/QProjectController.h"

#include <QTemporaryDir>
#include <QTest>

#include <limits>

class TestSegments : public QObject
{
    Q_OBJECT

private slots:
    void changeDetection()
    {
        PathSegment segment(5);
        std::vector<CurvePoint> samples{CurvePoint(1, 2, 0), CurvePoint(3, 4, 0)};
        segment.setCurvePoints(std::vector<CurvePoint>(samples));
        QVERIFY(segment.changed);
        segment.changed = false;
        segment.setCurvePoints({CurvePoint(1, 2, 9), CurvePoint(3, 4, 9)}); // z doesn't count
        QVERIFY(!segment.changed);
        QCOMPARE(segment.curvePoints[0].z, 0.0); // nothing was stored
        samples.emplace_back(5, 6, 0);
        segment.setCurvePoints(std::vector<CurvePoint>(samples));
        QVERIFY(segment.changed);
        QCOMPARE(segment.curvePoints.size(), size_t(3));

        // NaN is never equal to itself: the same samples again still count as a change.
        samples[2].x = std::numeric_limits<double>::quiet_NaN();
        segment.setCurvePoints(std::vector<CurvePoint>(samples));
        segment.changed = false;
        segment.setCurvePoints(std::move(samples));
        QVERIFY(segment.changed);

        PathSegment copy(9);
        copy.assign(segment, false);
        QVERIFY(copy.id != segment.id);
        QCOMPARE(copy.keyPointId, 5u);
        QVERIFY(!copy.changed);
        copy.assign(segment, true);
        QCOMPARE(copy.id, segment.id);
    }

    void pilotWidthOnlyWhenAskedFor()
    {
        PilotProperties custom;
        custom.source = QStringLiteral("avatars/car.png");
        custom.width = 80.0;
        PathSegment segment(2);
        segment.setPilot(custom, false);
        QCOMPARE(segment.pilot.source, custom.source);
        QCOMPARE(segment.pilot.width, defaultPilot().width);
        segment.setPilot(custom, true);
        QCOMPARE(segment.pilot.width, 80.0);
    }

    void saveAndLoad()
    {
        QTemporaryDir dir;
        const QString file = dir.filePath(QStringLiteral("segments.zkgeo"));
        PathSegment segment(3);
        segment.pilot.source = QStringLiteral("file:///x/imgsrc/avatars/plane, \"big\".png");
        segment.pilot.width = 99.1234567;
        CurvePoint a(1.0 / 3.0, -2.0 / 7.0, 0), b(5, 6, 0);
        a.correspondingKeyPoint = 1000;
        b.correspondingMediaPoint = 2000;
        segment.curvePoints = {a, b};
        QProjectController store;
        QVERIFY(store.createProjectFile(file));
        // Point ids are stored as the indices that the two lookups give.
        segment.Save(store, QStringLiteral("pathsegment0"), [](uint32_t id) { return id == 1000 ? 0u : 99u; },
                     [](uint32_t id) { return id == 2000 ? 1u : 99u; });
        store.closeProjectFile();

        QVERIFY(store.openProjectFile(file, true));
        PathSegment loaded(3);
        QVERIFY(loaded.Load(store, QStringLiteral("pathsegment0")));
        QCOMPARE(loaded.pilot.source, segment.pilot.source);
        QCOMPARE(loaded.pilot.width, 99.123457);
        QCOMPARE(loaded.curvePoints.size(), size_t(2));
        QVERIFY(loaded.curvePoints[0].x == a.x && loaded.curvePoints[0].y == a.y);
        QCOMPARE(loaded.curvePoints[0].correspondingKeyPoint, 0u);
        QCOMPARE(loaded.curvePoints[1].correspondingKeyPoint, 99u);
        QCOMPARE(loaded.curvePoints[1].correspondingMediaPoint, 1u);

        // The indices become the ids of the loaded points; one out of range is no reference.
        std::vector<KeyPoint> keys{KeyPoint(0, 0, 0)};
        std::vector<MediaPoint> media{MediaPoint(0, 0, 0), MediaPoint(1, 1, 0)};
        loaded.remapCorrespondingIds(keys, media);
        QCOMPARE(loaded.curvePoints[0].correspondingKeyPoint, keys[0].id);
        QCOMPARE(loaded.curvePoints[1].correspondingKeyPoint, 0u);
        QCOMPARE(loaded.curvePoints[1].correspondingMediaPoint, media[1].id);
    }

    void managerKeepsOnePath()
    {
        PathManager manager;
        QVERIFY(!manager.setActivePath(QStringLiteral("other")));
        QCOMPARE(manager.activePath, 0);

        // A new path fills the one there is, which keeps its name and identifier.
        Path track;
        track.pathType = PathType::GPX;
        track.addKeyPoint(KeyPoint(1, 2, 0), false);
        const uint32_t identifier = manager.active()->identifier;
        QCOMPARE(manager.addPath(track, QStringLiteral("gpxFile")), identifier);
        QCOMPARE(manager.paths.size(), size_t(1));
        QCOMPARE(manager.active()->name, QStringLiteral("numberOne"));
        QCOMPARE(manager.active()->pathType, PathType::GPX);
        QCOMPARE(manager.active()->keyPoints.size(), size_t(1));
    }
};

QTEST_GUILESS_MAIN(TestSegments)
#include "tst_segments.moc"
