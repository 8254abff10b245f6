#include "path/CurveGenerator.h"
#include "path/GeoDistance.h"
#include "path/NearestSample.h"
#include "path/PointerSearch.h"
#include "path/Path.h"

#include <QGeoCoordinate>
#include <QRandomGenerator>
#include <QTest>

#include <algorithm>
#include <cmath>
#include <limits>

namespace {

Path makePath(int32_t curveMode, const std::vector<QPointF> &points)
{
    Path path;
    path.curveMode = curveMode;
    for (size_t i = 0; i < points.size(); ++i)
        path.addKeyPoint(points[i].x(), points[i].y(), 0.0, QString(), i + 1 == points.size());
    return path;
}

int namingCount(const Path &path, uint32_t keyPointId)
{
    int n = 0;
    for (const CurvePoint &c : path.curvePoints)
        n += c.correspondingKeyPoint == keyPointId;
    return n;
}

// The rules every edit must leave standing; `ordinary` adds that leg i starts at key point i.
void checkInvariants(const Path &path, bool ordinary)
{
    QCOMPARE(path.pathSegments.size(), path.keyPoints.size());
    for (size_t i = 0; i < path.keyPoints.size(); ++i) {
        const KeyPoint &k = path.keyPoints[i];
        QCOMPARE(k.correspondingPathSegmentId, path.pathSegments[i].id);
        QCOMPARE(path.pathSegments[i].keyPointId, k.id);
        if (path.keyPoints.size() > 1)
            QCOMPARE(namingCount(path, k.id), 1);
        if (ordinary && i + 1 < path.keyPoints.size()) {
            const auto &leg = path.pathSegments[i].curvePoints;
            QVERIFY(!leg.empty());
            QCOMPARE(leg.front().correspondingKeyPoint, k.id);
        }
    }
    for (size_t i = 0; i + 1 < path.pathSegments.size(); ++i) {
        const auto &a = path.pathSegments[i].curvePoints;
        const auto &b = path.pathSegments[i + 1].curvePoints;
        if (ordinary && !b.empty()) {
            QVERIFY(!a.empty());
            QCOMPARE(a.back().x, b.front().x);
            QCOMPARE(a.back().y, b.front().y);
        }
    }
    for (const CurvePoint &c : path.curvePoints) {
        QVERIFY(c.x >= -180.0 && c.x <= 180.0);
        QVERIFY(c.y >= -90.0 && c.y <= 90.0);
    }
}

// A track-like path: one sample per 0.01 degree along the equator, key points
// on the first and last sample.
Path makeTrackPath(int samples)
{
    Path path;
    path.curveMode = CurveMode::Straight;
    path.pathType = PathType::GPX;
    path.fixedCurve = true;
    for (int i = 0; i < samples; ++i)
        path.addCurvePoint(i * 0.01, 0.0, 0.0);
    KeyPoint first(0.0, 0.0, 0.0), last((samples - 1) * 0.01, 0.0, 0.0);
    path.addKeyPoint(first, false);
    path.addKeyPoint(last, false);
    path.curvePoints.front().correspondingKeyPoint = first.id;
    path.curvePoints.back().correspondingKeyPoint = last.id;
    path.pathSegments.front().setCurvePoints(std::vector<CurvePoint>(path.curvePoints));
    return path;
}

} // namespace

class TestPath : public QObject
{
    Q_OBJECT

private slots:
    void degenerateInputs()
    {
        Path one = makePath(CurveMode::Smooth, {{5, 5}});
        QVERIFY(one.curvePoints.empty());
        QCOMPARE(one.pathSegments.size(), size_t(1));
        QVERIFY(one.pathSegments.front().curvePoints.empty());

        for (int32_t mode : {CurveMode::Straight, CurveMode::Smooth}) {
            Path same = makePath(mode, {{7, 8}, {7, 8}});
            QCOMPARE(same.curvePoints.size(), size_t(1));
            QCOMPARE(same.curvePoints.front().correspondingKeyPoint, same.keyPoints.front().id);
            // A doubled key point beside a leg leaves that leg's samples numbers.
            for (const Path &doubled : {makePath(mode, {{7, 8}, {7, 8}, {9, 9}}), makePath(mode, {{5, 5}, {7, 8}, {7, 8}})}) {
                QVERIFY(doubled.curvePoints.size() > 200);
                for (const CurvePoint &c : doubled.curvePoints)
                    QVERIFY(std::isfinite(c.x) && std::isfinite(c.y));
            }
        }

        Path airplane = makePath(CurveMode::Arc, {{0, 0}, {10, 10}, {20, 0}});
        QVERIFY(airplane.curvePoints.empty());
        Path vertical = makePath(CurveMode::Arc, {{3, 0}, {3, 10}});
        for (const CurvePoint &c : vertical.curvePoints)
            QVERIFY(std::isfinite(c.y));
    }

    void antimeridianLegs()
    {
        for (const auto &ends : std::vector<std::pair<double, double>>{{170, -170}, {-170, 170}}) {
            Path path = makePath(CurveMode::Straight, {{ends.first, 10}, {ends.second, 10}});
            QCOMPARE(path.curvePoints.size(), size_t(220));
            double nearest180 = 180;
            for (const CurvePoint &c : path.curvePoints) {
                QVERIFY2(c.x >= -180 && c.x <= 180, qPrintable(QString::number(c.x)));
                QVERIFY(std::fabs(c.x) >= 170 - 1e-9);
                nearest180 = std::min(nearest180, 180 - std::fabs(c.x));
            }
            QVERIFY(nearest180 < 0.2); // it crosses, it does not turn back
        }
        Path direct = makePath(CurveMode::Straight, {{10, 0}, {-10, 0}});
        QCOMPARE(direct.curvePoints.size(), size_t(220));
        for (const CurvePoint &c : direct.curvePoints)
            QVERIFY(c.x <= 10 && c.x >= -10);

        // There and back across the line, smooth: every sample stays on the map.
        Path round = makePath(CurveMode::Smooth, {{170, 0}, {-170, 5}, {175, 10}, {-175, -5}});
        checkInvariants(round, true);
    }

    void arcShape()
    {
        Path arc = makePath(CurveMode::Arc, {{0, 0}, {10, 5}});
        QCOMPARE(arc.curvePoints.size(), size_t(11));
        QCOMPARE(arc.curvePoints.front().correspondingKeyPoint, arc.keyPoints[0].id);
        QCOMPARE(arc.curvePoints.back().correspondingKeyPoint, arc.keyPoints[1].id);
        // The apex stands half the span east of the start.
        double top = -1e9;
        double topX = 0;
        for (const CurvePoint &c : arc.curvePoints) {
            if (c.y > top) {
                top = c.y;
                topX = c.x;
            }
        }
        QCOMPARE(topX, 5.0);
        QCOMPARE(top, 15.0);
        QVERIFY(std::fabs(arc.curvePoints.front().y) < 1e-5); // single-precision steps
    }

    void invariantsAfterEdits()
    {
        for (int32_t mode : {CurveMode::Straight, CurveMode::Smooth}) {
            Path path = makePath(mode, {{0, 0}, {5, 5}, {10, 0}, {15, 5}});
            checkInvariants(path, true);
            const uint32_t second = path.keyPoints[1].id;

            KeyPoint inserted(7, 9, 0);
            path.insertKeyPoint(second, inserted, true);
            QCOMPARE(path.keyPoints[2].id, inserted.id);
            checkInvariants(path, true);

            double x = 6, y = 6;
            QVERIFY(path.changeKeyPointPosition(second, x, y));
            QCOMPARE(path.keyPoints[1].longitude, 6.0);
            QVERIFY(!path.changeKeyPointPosition(second, x, y)); // unchanged position
            double ux = 1, uy = 1;
            QVERIFY(!path.changeKeyPointPosition(999999, ux, uy));
            checkInvariants(path, true);

            QVERIFY(path.deleteKeyPoint(path.keyPoints.front().id));
            checkInvariants(path, true);
            QVERIFY(path.deleteKeyPoint(path.keyPoints.back().id));
            checkInvariants(path, true);
            QVERIFY(!path.deleteKeyPoint(123456789));
            QCOMPARE(path.keyPoints.size(), size_t(3));

            path.reduceToEnds();
            QCOMPARE(path.keyPoints.size(), size_t(2));
            checkInvariants(path, true);

            // Several deletions and one regeneration make the curve of deleting one by one.
            Path oneByOne = makePath(mode, {{0, 0}, {5, 5}, {10, 0}, {15, 5}, {20, 0}});
            Path atOnce = oneByOne;
            for (size_t i = 3; i >= 1; --i) {
                QVERIFY(oneByOne.deleteKeyPoint(oneByOne.keyPoints[i].id));
                QVERIFY(atOnce.deleteKeyPoint(atOnce.keyPoints[i].id, false));
            }
            atOnce.update();
            checkInvariants(atOnce, true);
            QCOMPARE(atOnce.curvePoints.size(), oneByOne.curvePoints.size());
            for (size_t i = 0; i < atOnce.curvePoints.size(); ++i)
                QCOMPARE(QPointF(atOnce.curvePoints[i].x, atOnce.curvePoints[i].y),
                         QPointF(oneByOne.curvePoints[i].x, oneByOne.curvePoints[i].y));
        }
    }

    void mediaPointsKeepTheirPlaces()
    {
        auto build = [](Path &path, MediaPoint &onKey, MediaPoint &onLeg) {
            path = makePath(CurveMode::Smooth, {{0, 0}, {5, 5}, {10, 0}});
            path.addMediaPoint(onKey, path.keyPoints[1].id, false);
            const CurvePoint &inLeg = path.curvePoints[50];
            onLeg = MediaPoint(inLeg.x, inLeg.y, 0);
            path.addMediaPoint(onLeg, 0, false);
        };
        auto sampleOf = [](const Path &path, uint32_t mediaId) {
            for (size_t i = 0; i < path.curvePoints.size(); ++i)
                if (path.curvePoints[i].correspondingMediaPoint == mediaId)
                    return int(i);
            return -1;
        };

        Path path;
        MediaPoint onKey(0, 0, 0), onLeg;
        build(path, onKey, onLeg);
        QCOMPARE(sampleOf(path, onLeg.id), 50);

        // Moving the last key point leaves both where they are on the route.
        double x = 12, y = -2;
        QVERIFY(path.changeKeyPointPosition(path.keyPoints[2].id, x, y));
        QCOMPARE(path.curvePoints[size_t(sampleOf(path, onKey.id))].correspondingKeyPoint, path.keyPoints[1].id);
        QCOMPARE(sampleOf(path, onLeg.id), 50);
        QCOMPARE(path.mediaPoints[1].x, path.curvePoints[50].x);

        // Deleting the key point takes its media point with it.
        QVERIFY(path.deleteKeyPoint(path.keyPoints[1].id));
        QCOMPARE(path.mediaPointIndex(onKey.id), -1);
        QCOMPARE(sampleOf(path, onKey.id), -1);
        QCOMPARE(sampleOf(path, onLeg.id), 50);

        // An insertion keeps positions as near as the new curve allows.
        build(path, onKey, onLeg);
        const CurvePoint before = path.curvePoints[50];
        const QPointF keyPlace(path.keyPoints[1].x, path.keyPoints[1].y);
        KeyPoint inserted(2, 4, 0);
        path.insertKeyPoint(path.keyPoints[0].id, inserted, true);
        const int after = sampleOf(path, onLeg.id);
        QVERIFY(after >= 0);
        const CurvePoint &now = path.curvePoints[size_t(after)];
        QVERIFY(geoDistance(now.y, now.x, before.y, before.x) < 100000);
        QCOMPARE(path.mediaPoints[1].longitude, now.x);
        const CurvePoint &keySample = path.curvePoints[size_t(sampleOf(path, onKey.id))];
        QCOMPARE(QPointF(keySample.x, keySample.y), keyPlace);

        QVERIFY(path.changeMediaPointPosition(now.x, now.y, onLeg.id));
        QVERIFY(!path.changeMediaPointPosition(0, 0, 424242));
        QVERIFY(path.deleteMediaPointAndSample(onLeg.id));
        QVERIFY(!path.deleteMediaPointAndSample(onLeg.id));
    }

    void fixedTrackEdits()
    {
        Path track = makeTrackPath(101);
        const uint32_t firstId = track.keyPoints.front().id;
        const uint32_t lastId = track.keyPoints.back().id;
        QVERIFY(!track.deleteKeyPoint(firstId));
        QVERIFY(!track.deleteKeyPoint(lastId));
        QCOMPARE(track.keyPoints.size(), size_t(2));
        QCOMPARE(track.curvePoints.size(), size_t(101));

        // A key point placed on sample 40 splits the track there.
        KeyPoint middle(track.curvePoints[40].x, 0.0, 0.0);
        track.insertKeyPoint(firstId, middle, true);
        QCOMPARE(track.curvePoints.size(), size_t(102));
        QCOMPARE(track.curvePoints[41].correspondingKeyPoint, middle.id);
        QVERIFY(track.curvePoints[41].id != track.curvePoints[40].id);
        QCOMPARE(track.pathSegments[0].curvePoints.size(), size_t(41));
        QCOMPARE(track.pathSegments[1].curvePoints.front().correspondingKeyPoint, middle.id);
        checkInvariants(track, false);

        // Moved beyond its neighbour it snaps to the nearest sample inside the range.
        double x = 5.0, y = 0.3;
        QVERIFY(track.changeKeyPointPosition(middle.id, x, y));
        const int at = track.curvePointIndexNaming(middle.id);
        QCOMPARE(at, 100);
        QCOMPARE(x, track.curvePoints[size_t(at)].x);
        QCOMPARE(y, 0.0);
        QVERIFY(x < 1.0);
        QCOMPARE(track.keyPoints[1].longitude, x);
        checkInvariants(track, false);
        QCOMPARE(track.pathSegments[1].curvePoints.front().correspondingKeyPoint, middle.id);
        QCOMPARE(track.pathSegments[0].curvePoints.back().correspondingKeyPoint, middle.id);

        // ...and back before its old place.
        x = 0.104;
        y = 0.0;
        QVERIFY(track.changeKeyPointPosition(middle.id, x, y));
        QCOMPARE(track.curvePointIndexNaming(middle.id), 11);
        checkInvariants(track, false);

        const size_t samples = track.curvePoints.size();
        QVERIFY(track.deleteKeyPoint(middle.id));
        QCOMPARE(track.curvePoints.size(), samples); // the track itself stays
        QCOMPARE(namingCount(track, middle.id), 0);
        QCOMPARE(track.pathSegments.size(), size_t(2));
        track.update();
        QCOMPARE(track.curvePoints.size(), samples); // never regenerated
    }

    void positionsAndLookups()
    {
        Path empty;
        QCOMPARE(empty.percentToCurveIndex(0.5), -1);
        Path path = makePath(CurveMode::Straight, {{0, 0}, {1, 1}});
        const int n = int(path.curvePoints.size());
        QCOMPARE(path.percentToCurveIndex(0.0), 0);
        QCOMPARE(path.percentToCurveIndex(1.0), n - 1);
        QCOMPARE(path.percentToCurveIndex(1.5), -1);
        QCOMPARE(path.curvePointCountBetween(0.0, 1.0), n);
        QCOMPARE(path.curvePointCountBetween(0.6, 0.5), -1);
        QCOMPARE(path.curvePointCountBetween(0.5, 2.0), -1);


        double smallest = 0;
        QVERIFY(!path.hitTest(0.0, 0.0, 0.0, smallest, true)); // a tolerance of 0 never matches
        QCOMPARE(smallest, 0.0);
        const double toSecond = QGeoCoordinate(1, 1).distanceTo(QGeoCoordinate(1, 1.001));
        QCOMPARE(path.hitTest(1.001, 1, toSecond * 1.01, smallest, false), static_cast<const BasePoint *>(&path.keyPoints[1]));
        QVERIFY(std::fabs(smallest - toSecond) < 1e-6);
        QVERIFY(!path.hitTest(1.001, 1, toSecond * 0.99, smallest, false));
        const BasePoint *onCurve = path.hitTest(0.5, 0.5, 2000, smallest, true);
        QVERIFY(onCurve && dynamic_cast<const CurvePoint *>(onCurve));
        QVERIFY(!path.hitTest(0.5, 0.5, 2000, smallest, false));
    }

    void distanceMatchesQt()
    {
        const double cases[][4] = {{0, 0, 0, 1}, {51.5, -0.12, 48.85, 2.35}, {-33.9, 151.2, 40.7, -74.0}, {10, 179.9, 10, -179.9}};
        for (const auto &c : cases)
            QCOMPARE(geoDistance(c[0], c[1], c[2], c[3]), QGeoCoordinate(c[0], c[1]).distanceTo(QGeoCoordinate(c[2], c[3])));
        QCOMPARE(geoDistance(95, 0, 0, 0), 0.0);
    }

    void nearestSampleMatchesAFullScan()
    {
        // Random routes of wandering runs, with jumps over the antimeridian and to
        // the poles, repeated places (ties) and now and then a sample that is no
        // valid coordinate; places near samples, on them, far off and invalid. Both
        // searches, the tree's and the path's over a range, find what a walk over
        // every sample finds: the first of equally near ones.
        QRandomGenerator random(31337);
        auto uniform = [&](double low, double high) { return low + (high - low) * random.generateDouble(); };
        int found = 0;
        for (int route = 0; route < 40; ++route) {
            std::vector<CurvePoint> samples;
            double lon = uniform(-180, 180), lat = uniform(-90, 90);
            const int count = int(random.bounded(1, 3000));
            const double step = std::pow(10.0, uniform(-5, 0));
            for (int i = 0; i < count; ++i) {
                switch (random.bounded(200)) {
                case 0: lon = -lon; break;
                case 1: lat = lat < 0 ? -90 : 90; break;
                case 2: lon = lon < 0 ? -180 : 180; break;
                default: break;
                }
                lon = std::clamp(lon + uniform(-step, step), -180.0, 180.0);
                lat = std::clamp(lat + uniform(-step, step), -90.0, 90.0);
                if (random.bounded(500) == 0)
                    samples.emplace_back(random.bounded(2) ? std::nan("") : 200.0, lat, 0.0);
                else if (i > 0 && random.bounded(20) == 0)
                    samples.push_back(samples[size_t(random.bounded(i))]);
                else
                    samples.emplace_back(lon, lat, 0.0);
            }
            const NearestSample nearest(samples);
            Path path;
            path.curvePoints = samples;
            auto walk = [&](const GeoDistanceFrom &from, double best, size_t first, size_t last) {
                int index = -1;
                for (size_t i = first; i < last; ++i) {
                    const double d = from.term(samples[i].y, samples[i].x);
                    if (d < best) {
                        best = d;
                        index = int(i);
                    }
                }
                return index;
            };
            for (int query = 0; query < 200; ++query) {
                const CurvePoint &near = samples[size_t(random.bounded(count))];
                double qlat = near.y, qlon = near.x;
                switch (query % 4) {
                case 0: break;
                case 1: qlat += uniform(-1, 1) * step * 10; qlon += uniform(-1, 1) * step * 10; break;
                case 2: qlat = uniform(-90, 90); qlon = uniform(-180, 180); break;
                default: qlat = query % 8 == 3 ? 91.0 : uniform(-90, 90); break;
                }
                const double limit = query % 5 == 0 ? GeoDistanceFrom::metresToTerm(uniform(1, 1e5))
                                                    : GeoDistanceFrom::metresToTerm(1e7);
                const GeoDistanceFrom from(qlat, qlon);
                const int expected = walk(from, limit, 0, samples.size());
                QCOMPARE(nearest.find(qlat, qlon, limit), expected);
                found += expected >= 0;
                const size_t first = random.bounded(count), last = first + random.bounded(count - int(first) + 1);
                QCOMPARE(path.nearestCurvePoint(qlon, qlat, first, last),
                         walk(from, std::numeric_limits<double>::infinity(), first, last));

                // The pointer's search in metres with a strict radius, which at times is
                // exactly the distance to the sample the place was made near.
                const double radius = query % 3 == 0 ? geoDistance(qlat, qlon, near.y, near.x) : uniform(0, 1e5);
                int pointed = -1;
                for (size_t i = 0, best = 0; i < samples.size(); ++i) {
                    const double d = geoDistance(qlat, qlon, samples[i].y, samples[i].x);
                    if ((pointed < 0 ? radius : geoDistance(qlat, qlon, samples[best].y, samples[best].x)) > d) {
                        pointed = int(i);
                        best = i;
                    }
                }
                QCOMPARE(PointerSearch::sampleAt(samples, 1.0, qlat, qlon, radius).index, pointed);
            }
        }
        QVERIFY(found > 4000);
    }

    void correspondingIdsFromIndices()
    {
        Path path;
        path.addKeyPoint(KeyPoint(0, 0, 0), false);
        path.addKeyPoint(KeyPoint(1, 1, 0), false);
        path.mediaPoints.emplace_back(0.5, 0.5, 0);
        for (uint32_t i = 0; i < 4; ++i) {
            CurvePoint c(i, i, 0);
            c.correspondingKeyPoint = i;
            c.correspondingMediaPoint = i == 0 ? 0u : 7u;
            path.curvePoints.push_back(c);
        }
        path.pathSegments[0].curvePoints = {path.curvePoints[0], path.curvePoints[1]};
        path.initCorrespondingObjectIds();
        QCOMPARE(path.curvePoints[0].correspondingKeyPoint, path.keyPoints[0].id);
        QCOMPARE(path.curvePoints[1].correspondingKeyPoint, path.keyPoints[1].id);
        QCOMPARE(path.curvePoints[2].correspondingKeyPoint, 0u);
        QCOMPARE(path.curvePoints[0].correspondingMediaPoint, path.mediaPoints[0].id);
        QCOMPARE(path.curvePoints[1].correspondingMediaPoint, 0u);
        QCOMPARE(path.pathSegments[0].curvePoints[1].correspondingKeyPoint, path.keyPoints[1].id);

        path.pathSegments.pop_back();
        QTest::ignoreMessage(QtDebugMsg, "initCorrespondingObjectIds: number of pathsegments not equal to number ob keypoints");
        path.initCorrespondingObjectIds();
    }

    void gapFillingOnLargeNumbers()
    {
        using CurveGenerator::fillGaps;
        const auto filled = fillGaps({{0, 0}, {4, 2}}, {0, 0}, {4, 2});
        // Three steps in x are added, each one unit along.
        QCOMPARE(filled.size(), size_t(5));
        QCOMPARE(filled[1], QPointF(1, 1));
        QCOMPARE(filled.back(), QPointF(4, 2));
        QCOMPARE(CurveGenerator::roundHalfAway(2.5), 3.0);
        QCOMPARE(CurveGenerator::roundHalfAway(-2.5), -2.0);
        QCOMPARE(CurveGenerator::roundHalfAway(-2.6), -3.0);
        QVERIFY(fillGaps({}, {0, 0}, {1, 1}).empty());

        // Off the globe, as in damaged files, steps are rounding noise of huge
        // numbers and nothing is filled in, however wide they are.
        const QPointF farA(51, -9.5e15), farB(0, -9.5e15);
        QCOMPARE(fillGaps({farA, {25, -9.5e15 + 1e6}, farB}, farA, farB).size(), size_t(3));
        QCOMPARE(fillGaps({{0, 0}, {0, 1e12}}, {0, 0}, {0, 1e12}).size(), size_t(2));
        // A leg between valid coordinates keeps its filling.
        QCOMPARE(fillGaps({{-170, 80}, {170, -80}}, {-170, 80}, {170, -80}).size(), size_t(2 + 339));
    }
};

QTEST_GUILESS_MAIN(TestPath)
#include "tst_path.moc"
