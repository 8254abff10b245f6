#include "path/CurveGenerator.h"
#include "path/GeoDistance.h"
#include "path/Path.h"
#include "path/TrackThinning.h"

#include <QRandomGenerator>
#include <QTest>

namespace {

constexpr int32_t fixedDuration = 3600;

// A track as the reader hands it over: every track point a key point.
Path trackPath(const std::vector<QPointF> &points, const QStringList &titles = {})
{
    Path path;
    path.curveMode = CurveMode::Straight;
    path.pathType = PathType::GPX;
    for (size_t i = 0; i < points.size(); ++i) {
        KeyPoint k(points[i].x(), points[i].y(), double(i));
        if (int(i) < titles.size())
            k.properties.title = titles[int(i)];
        path.addKeyPoint(k, false);
    }
    return path;
}

// Eastward along a parallel, `metres` apart (the same everywhere at the equator).
std::vector<QPointF> line(int count, double metres, double lat = 0.0)
{
    const double step = metres / 111194.9266; // degrees of longitude per metre on the equator
    std::vector<QPointF> points;
    for (int i = 0; i < count; ++i)
        points.emplace_back(10.0 + i * step, lat);
    return points;
}

// The thinning done the plain way: every sample of every leg, measured in turn.
std::vector<QPointF> thinPlainly(const std::vector<QPointF> &keys, double threshold)
{
    std::vector<QPointF> curve;
    for (size_t l = 0; l + 1 < keys.size(); ++l) {
        CurveGenerator::Leg samples = CurveGenerator::StraightLeg(keys[l], keys[l + 1]).samples();
        if (l + 2 == keys.size())
            samples.back() = keys.back();
        for (size_t j = 0; j < samples.size(); ++j) {
            const bool lastOfAll = l + 2 == keys.size() && j + 1 == samples.size();
            if (curve.empty() || lastOfAll
                || geoDistance(curve.back().y(), curve.back().x(), samples[j].y(), samples[j].x()) >= threshold)
                curve.push_back(samples[j]);
        }
    }
    return curve;
}

} // namespace

class TestTrackConversion : public QObject
{
    Q_OBJECT

private slots:
    void withoutThinning()
    {
        Path path = trackPath(line(101, 50), {QStringLiteral("start"), QString(), QStringLiteral("titled")});
        QVERIFY(path.convertFromGPX(0, false, fixedDuration));
        QCOMPARE(path.curvePoints.size(), size_t(101));
        QCOMPARE(path.keyPoints.size(), size_t(2));
        QCOMPARE(path.keyPoints.front().title(), QStringLiteral("start"));
        QCOMPARE(path.pathSegments.size(), size_t(2));
        QCOMPARE(path.pathSegments.front().curvePoints.size(), size_t(101));
        QVERIFY(path.pathSegments.back().curvePoints.empty());
        QCOMPARE(path.curvePoints.front().correspondingKeyPoint, path.keyPoints.front().id);
        QCOMPARE(path.curvePoints.back().correspondingKeyPoint, path.keyPoints.back().id);
        QCOMPARE(path.curvePoints[50].z, 50.0);
        QCOMPARE(path.keyPoints.front().correspondingPathSegmentId, path.pathSegments.front().id);
    }

    void durationFollowsTheSampleCount()
    {
        Path short200 = trackPath(line(200, 50));
        short200.convertFromGPX(0, false, fixedDuration);
        QCOMPARE(short200.keyPoints.front().properties.durationToNextKP, 3000);
        Path long201 = trackPath(line(201, 50));
        long201.convertFromGPX(0, false, fixedDuration);
        QCOMPARE(long201.keyPoints.front().properties.durationToNextKP, 603);
        QCOMPARE(long201.keyPoints.back().properties.durationToNextKP, 3000);
    }

    void ownFileKeepsTitledPoints()
    {
        QStringList titles;
        for (int i = 0; i < 60; ++i)
            titles << QString();
        titles[10] = QStringLiteral("Bridge");
        titles[25] = QStringLiteral("Summit");
        titles[40] = QStringLiteral("Hut");
        Path own = trackPath(line(60, 100), titles);
        own.convertFromGPX(2, true, fixedDuration);
        QCOMPARE(own.keyPoints.size(), size_t(5));
        QCOMPARE(own.keyPoints[1].title(), QStringLiteral("Bridge"));
        QCOMPARE(own.keyPoints[3].title(), QStringLiteral("Hut"));
        for (const KeyPoint &k : own.keyPoints) {
            int named = 0;
            for (const CurvePoint &c : own.curvePoints) {
                if (c.correspondingKeyPoint == k.id) {
                    ++named;
                    QCOMPARE(c.x, k.x);
                    QCOMPARE(c.y, k.y);
                }
            }
            QCOMPARE(named, 1);
        }

        Path foreign = trackPath(line(60, 100), titles);
        foreign.convertFromGPX(2, false, fixedDuration);
        QCOMPARE(foreign.keyPoints.size(), size_t(2));
        for (const KeyPoint &k : foreign.keyPoints)
            QVERIFY(k.title().isEmpty());
    }

    void repeatedPointsGo()
    {
        std::vector<QPointF> points = line(10, 100);
        points.insert(points.begin() + 4, points[4]);
        Path path = trackPath(points, {QString(), QString(), QString(), QString(), QString(), QStringLiteral("twice")});
        path.convertFromGPX(3, true, fixedDuration);
        QCOMPARE(path.keyPoints.size(), size_t(3));
        QCOMPARE(path.keyPoints[1].title(), QStringLiteral("twice"));
        QCOMPARE(path.keyPoints[1].x, points[4].x());
    }

    void autoAliasingSwitchesAtTenThousand()
    {
        // Alternating steps of 10 m and 30 m: "max" follows the smallest step,
        // "default" the average one.
        auto alternating = [](int count) {
            std::vector<QPointF> points;
            double x = 0;
            for (int i = 0; i < count; ++i) {
                points.emplace_back(x, 45.0);
                x += (i % 2 ? 30.0 : 10.0) / 78846.8;
            }
            return points;
        };
        auto curveSize = [&](int count, uint32_t aliasing) {
            Path path = trackPath(alternating(count));
            path.convertFromGPX(aliasing, false, fixedDuration);
            return path.curvePoints.size();
        };
        QCOMPARE(curveSize(10000, 1), curveSize(10000, 3));
        QVERIFY(curveSize(10000, 1) != curveSize(10000, 2));
        QCOMPARE(curveSize(10001, 1), curveSize(10001, 2));
        QVERIFY(curveSize(10001, 1) < curveSize(10001, 3));
    }

    void thinningMatchesThePlainWalk()
    {
        QRandomGenerator random(17);
        std::vector<QPointF> wander{{179.99, -20.0}};
        for (int i = 0; i < 400; ++i) {
            QPointF next = wander.back() + QPointF(random.bounded(0.004) - 0.0015, random.bounded(0.004) - 0.002);
            if (next.x() > 180)
                next.setX(next.x() - 360);
            if (i % 97 == 0)
                next += QPointF(0.5, 1.5); // a few long legs
            wander.push_back(next);
        }
        const Path path = trackPath(wander);
        for (double threshold : {0.0, 1.0, 37.5, 180.0, 1000.0, 50000.0}) {
            const std::vector<QPointF> expected = thinPlainly(wander, threshold);
            std::vector<CurvePoint> curve;
            const std::vector<FixedKeyPoint> fixed = thinTrack(path.keyPoints, threshold, curve);
            QCOMPARE(curve.size(), expected.size());
            for (size_t i = 0; i < expected.size(); ++i) {
                QCOMPARE(curve[i].x, expected[i].x());
                QCOMPARE(curve[i].y, expected[i].y());
            }
            QCOMPARE(fixed.size(), size_t(2));
            QCOMPARE(fixed.front().index, size_t(0));
            QCOMPARE(fixed.back().index, curve.size() - 1);
        }
    }

    void emptyAndTinyTracks()
    {
        Path empty = trackPath({});
        QVERIFY(empty.convertFromGPX(1, false, fixedDuration));
        QVERIFY(empty.keyPoints.empty());
        QVERIFY(empty.curvePoints.empty());

        Path single = trackPath({{5, 5}});
        single.convertFromGPX(1, false, fixedDuration);
        QCOMPARE(single.keyPoints.size(), size_t(1));
        QCOMPARE(single.curvePoints.size(), size_t(1));

        Path same = trackPath({{5, 5}, {5, 5}, {5, 5}});
        same.convertFromGPX(2, false, fixedDuration);
        QCOMPARE(same.keyPoints.size(), size_t(1));
    }
};

QTEST_GUILESS_MAIN(TestTrackConversion)
#include "tst_trackconversion.moc"
