#include "path/CurveGenerator.h"
#include "path/GeoDistance.h"
#include "path/Path.h"
#include "path/TrackThinning.h"

#include <QRandomGenerator>
#include <QTest>

namespace {

constexpr int32_t fixedDuration = 3600;

// A track as the reader hands it over, its altitudes counting up from 0, converted.
Path converted(const std::vector<QPointF> &points, uint32_t aliasing, bool ownFile, const QVector<QString> &titles = {})
{
    TrackPoints track;
    for (size_t i = 0; i < points.size(); ++i)
        track.push_back({points[i].x(), points[i].y(), double(i), true, titles.value(int(i))});
    Path path;
    path.curveMode = CurveMode::Straight;
    path.pathType = PathType::GPX;
    path.convertFromGPX(track, aliasing, ownFile, fixedDuration);
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
QVector<QPointF> thinPlainly(const std::vector<QPointF> &keys, double threshold)
{
    QVector<QPointF> curve;
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
        const Path path = converted(line(101, 50), 0, false, {QStringLiteral("start"), QString(), QStringLiteral("titled")});
        QCOMPARE(path.curvePoints.size(), size_t(101));
        QCOMPARE(path.keyPoints.size(), size_t(2));
        QCOMPARE(path.keyPoints.front().title(), QStringLiteral("start"));
        QCOMPARE(path.pathSegments.front().curvePoints.size(), size_t(101));
        QCOMPARE(path.curvePoints.back().correspondingKeyPoint, path.keyPoints.back().id);
        QCOMPARE(path.curvePoints[50].z, 50.0);
        QCOMPARE(path.keyPoints.front().correspondingPathSegmentId, path.pathSegments.front().id);
    }

    // Over 200 samples the first leg lasts 3 ms a sample, up to them the default.
    void durationFollowsTheSampleCount()
    {
        QCOMPARE(converted(line(200, 50), 0, false).keyPoints.front().properties.durationToNextKP, 3000);
        QCOMPARE(converted(line(201, 50), 0, false).keyPoints.front().properties.durationToNextKP, 603);
    }

    void ownFileKeepsTitledPoints()
    {
        QVector<QString> titles(60);
        titles[10] = QStringLiteral("Bridge");
        titles[25] = QStringLiteral("Summit");
        titles[40] = QStringLiteral("Hut");
        const Path own = converted(line(60, 100), 2, true, titles);
        QStringList kept;
        for (const KeyPoint &k : own.keyPoints) {
            kept << k.title();
            const CurvePoint &c = own.curvePoints[size_t(own.curvePointIndexNaming(k.id))];
            QCOMPARE(QPointF(c.x, c.y), QPointF(k.x, k.y));
        }
        QCOMPARE(kept, (QStringList{QString(), QStringLiteral("Bridge"), QStringLiteral("Summit"), QStringLiteral("Hut"), QString()}));

        const Path foreign = converted(line(60, 100), 2, false, titles);
        QCOMPARE(foreign.keyPoints.size(), size_t(2));
        QVERIFY(foreign.keyPoints.front().title().isEmpty());
    }

    void repeatedPointsGo()
    {
        std::vector<QPointF> points = line(10, 100);
        points.insert(points.begin() + 4, points[4]);
        const Path path = converted(points, 3, true, {QString(), QString(), QString(), QString(), QString(), QStringLiteral("twice")});
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
        auto curveSize = [&](int count, uint32_t aliasing) { return converted(alternating(count), aliasing, false).curvePoints.size(); };
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
        TrackPoints track;
        for (const QPointF &p : wander)
            track.push_back({p.x(), p.y()});
        for (double threshold : {0.0, 1.0, 37.5, 180.0, 1000.0, 50000.0}) {
            std::vector<CurvePoint> curve;
            const std::vector<FixedPlace> fixed = thinTrack(track, threshold, curve);
            QVector<QPointF> thinned;
            for (const CurvePoint &c : curve)
                thinned << QPointF(c.x, c.y);
            QCOMPARE(thinned, thinPlainly(wander, threshold));
            QCOMPARE(fixed.size(), size_t(2));
            QCOMPARE(fixed.front().index, size_t(0));
            QCOMPARE(fixed.back().index, curve.size() - 1);
        }
    }

    void emptyAndTinyTracks()
    {
        const Path empty = converted({}, 1, false);
        QVERIFY(empty.keyPoints.empty() && empty.curvePoints.empty());
        const Path single = converted({{5, 5}}, 1, false);
        QCOMPARE(single.keyPoints.size(), size_t(1));
        QCOMPARE(single.curvePoints.size(), size_t(1));
        QCOMPARE(converted({{5, 5}, {5, 5}, {5, 5}}, 2, false).keyPoints.size(), size_t(1));
    }
};

QTEST_GUILESS_MAIN(TestTrackConversion)
#include "tst_trackconversion.moc"
