#include "path/Path.h"

#include "app/Trace.h"
#include "path/CurveGenerator.h"
#include "path/GeoDistance.h"
#include "path/IdCounter.h"
#include "path/NearestSample.h"
#include "project/ProjectController.h"
#include "project/ValueParsers.h"

#include <QElapsedTimer>

#include <cmath>
#include <limits>
#include <memory>
#include <unordered_map>
#include <unordered_set>

namespace {

uint32_t nextPathIdentifier()
{
    static IdCounter counter;
    return counter.draw();
}

template <typename Points>
int indexOfId(const Points &points, uint32_t id)
{
    for (size_t i = 0; i < points.size(); ++i) {
        if (points[i].id == id)
            return int(i);
    }
    return -1;
}

// The hit rule shared by key points and curve points: the first point inside the
// tolerance starts a match, a nearer one replaces it.
template <typename Points>
const BasePoint *nearestWithin(const Points &points, const GeoDistanceFrom &from, double toleranceTerm,
                               double &smallestTerm)
{
    const BasePoint *result = nullptr;
    double best = -1.0;
    for (const auto &p : points) {
        const double d = from.term(p.y, p.x);
        smallestTerm = std::min(smallestTerm, d);
        if ((best < 0 && d < toleranceTerm) || d < best) {
            best = d;
            result = &p;
        }
    }
    return result;
}

} // namespace

Path::Path() : identifier(nextPathIdentifier())
{
}

void Path::addCurvePoint(double x, double y, double z)
{
    curvePoints.emplace_back(x, y, z);
}

void Path::addKeyPoint(double x, double y, double z, const QString &pointName, bool update)
{
    addKeyPoint(KeyPoint(x, y, z, pointName), update);
}

void Path::addKeyPoint(const KeyPoint &point, bool doUpdate)
{
    PathSegment segment(point.id);
    KeyPoint added = point;
    added.correspondingPathSegmentId = segment.id;
    pathSegments.push_back(std::move(segment));
    keyPoints.push_back(std::move(added));
    if (doUpdate)
        update();
}

void Path::addMediaPoint(const MediaPoint &point, uint32_t keyPointId, bool useIndex)
{
    int sample = -1;
    if (keyPointId != 0) {
        sample = curvePointIndexNaming(keyPointId);
    } else {
        for (size_t i = 0; i < curvePoints.size(); ++i) {
            if (curvePoints[i].x == point.x && curvePoints[i].y == point.y) {
                sample = int(i);
                break;
            }
        }
    }
    if (sample < 0 && !curvePoints.empty())
        sample = int(curvePoints.size()) - 1;
    if (sample >= 0)
        curvePoints[size_t(sample)].correspondingMediaPoint = useIndex ? uint32_t(mediaPoints.size()) : point.id;
    mediaPoints.push_back(point);
}

void Path::insertKeyPoint(uint32_t afterId, const KeyPoint &point, bool doUpdate)
{
    const int afterIndex = keyPointIndex(afterId);
    if (afterIndex < 0)
        return;
    PathSegment segment(point.id);

    const int afterSample = curvePointIndexNaming(afterId);
    int atSample = -1;
    if (afterSample >= 0) {
        for (size_t i = size_t(afterSample) + 1; i < curvePoints.size(); ++i) {
            if (curvePoints[i].x == point.x && curvePoints[i].y == point.y) {
                atSample = int(i);
                break;
            }
        }
    }
    PathSegment *afterSegment = segmentForKeyPoint(afterId);
    if (atSample >= 0) {
        size_t first = size_t(atSample);
        if (pathType == PathType::GPX) {
            // The track sample stays as the end of the leg before; a copy of it
            // starts the new leg.
            if (afterSegment)
                afterSegment->resize(size_t(atSample - afterSample + 1));
            insertSampleCopy(size_t(atSample));
            renewIdsFrom(size_t(atSample) + 1);
            first = size_t(atSample) + 1;
        }
        curvePoints[first].correspondingKeyPoint = point.id;
        // The leg runs up to the next key point's sample, which ends it only when it would
        // hold a single sample without.
        size_t end = first + 1;
        while (end < curvePoints.size() && curvePoints[end].correspondingKeyPoint == 0)
            ++end;
        if (end < curvePoints.size() && end == first + 1)
            ++end;
        segment.setCurvePoints(std::vector<CurvePoint>(curvePoints.begin() + long(first), curvePoints.begin() + long(end)));
    }

    KeyPoint inserted = point;
    inserted.correspondingPathSegmentId = segment.id;
    int segmentIndex = afterSegment ? int(afterSegment - pathSegments.data()) + 1 : afterIndex + 1;
    segmentIndex = std::min(segmentIndex, int(pathSegments.size()));
    pathSegments.insert(pathSegments.begin() + segmentIndex, std::move(segment));
    keyPoints.insert(keyPoints.begin() + afterIndex + 1, std::move(inserted));
    if (doUpdate && !isFixedTrack())
        regenerate(true);
}

bool Path::deleteKeyPoint(uint32_t id, bool doUpdate)
{
    const int index = keyPointIndex(id);
    if (index < 0)
        return false;
    const bool fixedTrack = isFixedTrack();
    if (fixedTrack && (index == 0 || index == int(keyPoints.size()) - 1))
        return false;

    const int sample = curvePointIndexNaming(id);
    if (sample >= 0 && curvePoints[size_t(sample)].correspondingMediaPoint != 0)
        deleteMediaPointAndSample(curvePoints[size_t(sample)].correspondingMediaPoint);

    PathSegment *segment = segmentForKeyPoint(id);
    if (segment) {
        const size_t segmentIndex = size_t(segment - pathSegments.data());
        if (fixedTrack && segmentIndex > 0) {
            std::vector<CurvePoint> &previous = pathSegments[segmentIndex - 1].curvePoints;
            const size_t start = previous.size();
            previous.insert(previous.end(), segment->curvePoints.begin(), segment->curvePoints.end());
            if (previous.size() > start)
                previous[start].correspondingKeyPoint = 0;
            pathSegments[segmentIndex - 1].changed = true;
        }
        pathSegments.erase(pathSegments.begin() + long(segmentIndex));
    }
    if (fixedTrack) {
        for (CurvePoint &p : curvePoints) {
            if (p.correspondingKeyPoint == id)
                p.correspondingKeyPoint = 0;
        }
    }
    keyPoints.erase(keyPoints.begin() + index);
    if (doUpdate)
        update();
    return true;
}

bool Path::deleteMediaPoint(uint32_t id)
{
    const int index = mediaPointIndex(id);
    if (index < 0)
        return false;
    mediaPoints.erase(mediaPoints.begin() + index);
    return true;
}

bool Path::deleteMediaPointAndSample(uint32_t id)
{
    bool named = false;
    for (CurvePoint &p : curvePoints) {
        if (p.correspondingMediaPoint == id) {
            p.correspondingMediaPoint = 0;
            named = true;
        }
    }
    deleteMediaPoint(id);
    return named;
}

bool Path::changeKeyPointPosition(uint32_t id, double &x, double &y)
{
    const int index = keyPointIndex(id);
    if (index < 0)
        return false;
    KeyPoint &point = keyPoints[size_t(index)];
    if (point.x == x && point.y == y)
        return false;

    if (!isFixedTrack()) {
        point.setLongitude(x, true);
        point.setLatitude(y, true);
        update();
        return true;
    }

    // A track's key point slides along the track, between its neighbours.
    const int from = index > 0 ? std::max(curvePointIndexNaming(keyPoints[size_t(index) - 1].id), 0) : 0;
    int to = int(curvePoints.size()) - 1;
    if (size_t(index) + 1 < keyPoints.size()) {
        const int next = curvePointIndexNaming(keyPoints[size_t(index) + 1].id);
        if (next >= 0)
            to = std::min(to, next);
    }
    const int own = curvePointIndexNaming(id);
    const int nearest = nearestCurvePoint(x, y, size_t(from), size_t(std::max(to, 0)));
    if (nearest < 0 || own < from || own >= to) {
        logTrace(3, QStringLiteral("Path::changeKeyPointPosition -> PathType::GPX can't find old and new position in range"));
        return false;
    }
    int placed = own;
    if (nearest > own) {
        insertSampleCopy(size_t(nearest));
        renewIdsFrom(size_t(nearest) + 1);
        curvePoints[size_t(nearest) + 1].correspondingKeyPoint = id;
        curvePoints.erase(curvePoints.begin() + own);
        placed = nearest;
    } else if (nearest < own) {
        curvePoints.erase(curvePoints.begin() + own);
        insertSampleCopy(size_t(nearest));
        curvePoints[size_t(nearest) + 1].correspondingKeyPoint = id;
        renewIdsFrom(size_t(nearest));
        placed = nearest + 1;
    }
    if (index > 0)
        rebuildSegmentSamples(index - 1);
    rebuildSegmentSamples(index);

    x = curvePoints[size_t(placed)].x;
    y = curvePoints[size_t(placed)].y;
    point.setLongitude(x, true);
    point.setLatitude(y, true);
    update();
    return true;
}

bool Path::changeMediaPointPosition(double x, double y, uint32_t id)
{
    MediaPoint *media = mediaPointById(id);
    if (!media || curvePoints.empty())
        return false;
    const int nearest = nearestCurvePoint(x, y, 0, curvePoints.size());
    if (nearest < 0)
        return false;
    for (CurvePoint &p : curvePoints) {
        if (p.correspondingMediaPoint == id)
            p.correspondingMediaPoint = 0;
    }
    CurvePoint &sample = curvePoints[size_t(nearest)];
    sample.correspondingMediaPoint = id;
    media->setLongitude(sample.x, true);
    media->setLatitude(sample.y, true);
    return true;
}

void Path::setPathMode(int32_t mode)
{
    curveMode = mode;
    update();
}

void Path::setPathType(int32_t type)
{
    pathType = type;
    update();
}

void Path::update(bool force)
{
    if (isFixedTrack() && !force)
        return;
    regenerate(false);
}

void Path::regenerate(bool keepMediaPositions)
{
    const std::vector<MediaAnchor> anchors = collectMediaAnchors(keepMediaPositions);
    updateCurvePoints();
    restoreMediaAnchors(anchors);
}

void Path::updateCurvePoints()
{
    std::vector<QPointF> keys;
    keys.reserve(keyPoints.size());
    for (const KeyPoint &k : keyPoints)
        keys.emplace_back(k.x, k.y);
    const std::vector<CurveGenerator::Leg> legs = curveMode == CurveMode::Straight ? CurveGenerator::straight(keys)
                                                : curveMode == CurveMode::Arc      ? CurveGenerator::arc(keys)
                                                                                   : CurveGenerator::smooth(keys);
    QElapsedTimer timer;
    timer.start();

    size_t total = 0;
    for (const auto &leg : legs)
        total += leg.size();
    curvePoints.clear();
    // Headroom keeps the next edits from moving ten megabytes of samples again.
    if (curvePoints.capacity() < total)
        curvePoints.reserve(total + total / 4);
    for (size_t i = 0; i < legs.size(); ++i) {
        const CurveGenerator::Leg &leg = legs[i];
        const bool lastLeg = i + 1 == legs.size();
        std::vector<CurvePoint> legPoints;
        legPoints.reserve(leg.size());
        for (size_t j = 0; j < leg.size(); ++j) {
            const bool lastSample = j + 1 == leg.size();
            // The end of a leg lies on the start of the next, so no gap shows.
            const QPointF at = lastSample && !lastLeg ? legs[i + 1].front() : leg[j];
            CurvePoint point(at.x(), at.y(), 0.0);
            if (j == 0)
                point.correspondingKeyPoint = keyPoints[i].id;
            else if (lastSample && lastLeg)
                point.correspondingKeyPoint = keyPoints[i + 1].id;
            legPoints.push_back(point);
        }
        curvePoints.insert(curvePoints.end(), legPoints.begin(), legPoints.end());
        if (i < pathSegments.size())
            pathSegments[i].setCurvePoints(std::move(legPoints));
    }
    for (size_t i = legs.size(); i < pathSegments.size(); ++i)
        pathSegments[i].setCurvePoints({});
    logTrace(0, QStringLiteral("updateCurvePoints needs %d"), timer.elapsed());
}

std::vector<Path::MediaAnchor> Path::collectMediaAnchors(bool keepPosition) const
{
    std::vector<MediaAnchor> anchors;
    if (mediaPoints.empty())
        return anchors;
    uint32_t currentKeyPoint = 0;
    int currentIndex = 0;
    size_t waitingForNext = 0; // anchors before this index have their next key point
    for (size_t i = 0; i < curvePoints.size(); ++i) {
        const CurvePoint &p = curvePoints[i];
        if (p.correspondingKeyPoint != 0) {
            currentKeyPoint = p.correspondingKeyPoint;
            currentIndex = int(i);
            for (; waitingForNext < anchors.size(); ++waitingForNext)
                anchors[waitingForNext].nextKeyPoint = currentKeyPoint;
        }
        if (p.correspondingMediaPoint == 0)
            continue;
        MediaAnchor anchor;
        anchor.found = keyPointIndex(currentKeyPoint) >= 0;
        anchor.mediaPointId = p.correspondingMediaPoint;
        anchor.sameSampleKeyPoint = p.correspondingKeyPoint;
        anchor.offset = int(i) - currentIndex;
        anchor.keepPosition = keepPosition;
        if (anchor.found) {
            anchor.keyPointId = currentKeyPoint;
        } else {
            anchor.keyPointId = keyPoints.empty() ? 0 : keyPoints.back().id;
            anchor.offset = int(CurveGenerator::roundHalfAway((anchor.offset + 200) / 400.0 * 200.0));
        }
        if (keepPosition) {
            anchor.x = p.x;
            anchor.y = p.y;
        }
        anchors.push_back(anchor);
    }
    return anchors;
}

void Path::restoreMediaAnchors(const std::vector<MediaAnchor> &anchors)
{
    // Made when first needed: one search of the whole curve per media point would
    // not scale to long routes with many photos.
    std::unique_ptr<NearestSample> nearest;
    std::unordered_map<uint32_t, int> keyPointSamples;
    bool keyPointsIndexed = false;
    const auto sampleNaming = [&](uint32_t keyPointId) {
        if (!keyPointsIndexed) {
            keyPointsIndexed = true;
            for (size_t i = curvePoints.size(); i-- > 0;) {
                if (curvePoints[i].correspondingKeyPoint != 0)
                    keyPointSamples[curvePoints[i].correspondingKeyPoint] = int(i);
            }
        }
        const auto found = keyPointSamples.find(keyPointId);
        return keyPointId != 0 && found != keyPointSamples.end() ? found->second : -1;
    };
    const double farthest = GeoDistanceFrom::metresToTerm(1e7);
    for (const MediaAnchor &anchor : anchors) {
        MediaPoint *media = anchor.mediaPointId ? mediaPointById(anchor.mediaPointId) : nullptr;
        if (!media)
            continue;
        int sample = -1;
        if (anchor.keepPosition) {
            if (!nearest)
                nearest = std::make_unique<NearestSample>(curvePoints);
            sample = nearest->find(anchor.y, anchor.x, farthest);
        } else if (anchor.sameSampleKeyPoint != 0) {
            sample = sampleNaming(anchor.sameSampleKeyPoint);
        } else {
            const int start = sampleNaming(anchor.keyPointId);
            if (start >= 0 && start + anchor.offset >= 0 && size_t(start + anchor.offset) < curvePoints.size())
                sample = start + anchor.offset;
        }
        if (sample < 0)
            continue;
        CurvePoint &p = curvePoints[size_t(sample)];
        p.correspondingMediaPoint = anchor.mediaPointId;
        media->setLongitude(p.x, true);
        media->setLatitude(p.y, true);
    }
}

void Path::setBoundaries(const KeyPoint &min, const KeyPoint &max)
{
    boundaryMin = min;
    boundaryMax = max;
    logTrace(0, QStringLiteral("Path::setBoundaries() %f, %f"), min.longitude, min.latitude);
}

Path::Extent Path::extent() const
{
    const KeyPoint &a = boundaryMin, &b = boundaryMax;
    const bool unset = a.longitude == 0 && a.latitude == 0 && b.longitude == 0 && b.latitude == 0;
    if (!unset)
        return {std::min(a.longitude, b.longitude), std::min(a.latitude, b.latitude),
                std::max(a.longitude, b.longitude), std::max(a.latitude, b.latitude)};

    bool first = true;
    Extent e{0, 0, 0, 0};
    auto include = [&](double px, double py) {
        if (first) {
            e = {px, py, px, py};
            first = false;
            return;
        }
        e.west = std::min(e.west, px);
        e.east = std::max(e.east, px);
        e.south = std::min(e.south, py);
        e.north = std::max(e.north, py);
    };
    for (const CurvePoint &p : curvePoints)
        include(p.x, p.y);
    if (curvePoints.empty()) {
        for (const KeyPoint &p : keyPoints)
            include(p.x, p.y);
    }
    return e;
}

KeyPoint Path::centerPosition() const
{
    KeyPoint center;
    center.setLongitude((boundaryMax.longitude - boundaryMin.longitude) * 0.5 + boundaryMin.longitude, false);
    center.setLatitude((boundaryMax.latitude - boundaryMin.latitude) * 0.5 + boundaryMin.latitude, false);
    logTrace(0, QStringLiteral("Path::centerPosition() %f, %f"), center.longitude, center.latitude);
    return center;
}

void Path::setGeoMetry(double width, double height)
{
    if (keyPoints.empty())
        return;
    double minX = keyPoints.front().x, maxX = minX, minY = keyPoints.front().y, maxY = minY;
    for (const KeyPoint &k : keyPoints) {
        minX = std::min(minX, k.x);
        maxX = std::max(maxX, k.x);
        minY = std::min(minY, k.y);
        maxY = std::max(maxY, k.y);
    }
    const double extentX = maxX - minX, extentY = maxY - minY;
    for (KeyPoint &k : keyPoints) {
        const double oldX = k.x, oldY = k.y;
        k.x = height * (oldY - minY) / extentY;
        k.y = width * (oldX - minX) / extentX;
        logTrace(0, QStringLiteral("setGeoMetry: x = %f, y = %f"), k.x, k.y);
    }
    update();
}

int Path::percentToCurveIndex(double percent) const
{
    const size_t n = curvePoints.size();
    if (n == 0)
        return -1;
    const double i = std::trunc(double(n - 1) * percent);
    if (!(i >= 0) || i >= double(n))
        return -1;
    return int(i);
}

int Path::curvePointCountBetween(double percent1, double percent2) const
{
    if (percent1 > percent2)
        return -1;
    const int i1 = percentToCurveIndex(percent1);
    const int i2 = percentToCurveIndex(percent2);
    if (i1 < 0 || i2 < 0)
        return -1;
    return i2 - i1 + 1;
}

const BasePoint *Path::hitTest(double x, double y, double tolerance, double &smallest, bool alsoCurve) const
{
    const GeoDistanceFrom from(y, x);
    const double toleranceTerm = tolerance > 0 ? GeoDistanceFrom::metresToTerm(tolerance) : -1.0;
    double smallestTerm = std::numeric_limits<double>::infinity();
    const BasePoint *hit = nearestWithin(keyPoints, from, toleranceTerm, smallestTerm);
    if (!hit && alsoCurve)
        hit = nearestWithin(curvePoints, from, toleranceTerm, smallestTerm);
    smallest = std::isinf(smallestTerm) ? std::numeric_limits<double>::max() : GeoDistanceFrom::termToMetres(smallestTerm);
    return hit;
}

BasePoint *Path::findPoint(uint32_t id)
{
    return const_cast<BasePoint *>(static_cast<const Path *>(this)->findPoint(id));
}

const BasePoint *Path::findPoint(uint32_t id) const
{
    if (id == 0)
        return nullptr;
    int i = indexOfId(keyPoints, id);
    if (i >= 0)
        return &keyPoints[size_t(i)];
    i = indexOfId(curvePoints, id);
    if (i >= 0)
        return &curvePoints[size_t(i)];
    i = indexOfId(mediaPoints, id);
    if (i >= 0)
        return &mediaPoints[size_t(i)];
    return nullptr;
}

int Path::keyPointIndex(uint32_t id) const
{
    return id == 0 ? -1 : indexOfId(keyPoints, id);
}

int Path::mediaPointIndex(uint32_t id) const
{
    return id == 0 ? -1 : indexOfId(mediaPoints, id);
}

int Path::curvePointIndexNaming(uint32_t keyPointId) const
{
    if (keyPointId == 0)
        return -1;
    for (size_t i = 0; i < curvePoints.size(); ++i) {
        if (curvePoints[i].correspondingKeyPoint == keyPointId)
            return int(i);
    }
    return -1;
}

MediaPoint *Path::mediaPointById(uint32_t id)
{
    const int i = mediaPointIndex(id);
    return i < 0 ? nullptr : &mediaPoints[size_t(i)];
}

PathSegment *Path::segmentForKeyPoint(uint32_t keyPointId)
{
    for (PathSegment &s : pathSegments) {
        if (s.keyPointId == keyPointId)
            return &s;
    }
    return nullptr;
}

PathSegment *Path::segmentById(uint32_t segmentId)
{
    const int i = indexOfId(pathSegments, segmentId);
    return i < 0 ? nullptr : &pathSegments[size_t(i)];
}

PathSegment *Path::nextSegment(uint32_t &segmentId)
{
    size_t next = 0;
    if (segmentId != 0) {
        const int i = indexOfId(pathSegments, segmentId);
        next = i < 0 ? pathSegments.size() : size_t(i) + 1;
    }
    if (next >= pathSegments.size()) {
        segmentId = 0;
        return nullptr;
    }
    segmentId = pathSegments[next].id;
    return &pathSegments[next];
}

void Path::reduceToEnds()
{
    if (keyPoints.size() <= 2)
        return;
    // Done in one pass: deleting thousands of track points one by one would
    // rescan the curve for each.
    std::unordered_set<uint32_t> middle;
    for (size_t i = 1; i + 1 < keyPoints.size(); ++i)
        middle.insert(keyPoints[i].id);
    const bool fixedTrack = isFixedTrack();
    for (CurvePoint &p : curvePoints) {
        if (p.correspondingKeyPoint == 0 || !middle.count(p.correspondingKeyPoint))
            continue;
        if (p.correspondingMediaPoint != 0) {
            deleteMediaPoint(p.correspondingMediaPoint);
            p.correspondingMediaPoint = 0;
        }
        if (fixedTrack)
            p.correspondingKeyPoint = 0;
    }
    std::vector<PathSegment> kept;
    for (PathSegment &s : pathSegments) {
        if (!middle.count(s.keyPointId)) {
            kept.push_back(std::move(s));
        } else if (fixedTrack && !kept.empty()) {
            auto &into = kept.back().curvePoints;
            into.insert(into.end(), s.curvePoints.begin(), s.curvePoints.end());
            kept.back().changed = true;
        }
    }
    for (PathSegment &s : kept) {
        for (CurvePoint &p : s.curvePoints) {
            if (middle.count(p.correspondingKeyPoint))
                p.correspondingKeyPoint = 0;
        }
    }
    pathSegments = std::move(kept);
    keyPoints.erase(keyPoints.begin() + 1, keyPoints.end() - 1);
    update();
}

void Path::initCorrespondingObjectIds()
{
    if (pathSegments.size() != keyPoints.size())
        logTrace(3, QStringLiteral("initCorrespondingObjectIds: number of pathsegments not equal to number ob keypoints"));
    for (PathSegment &s : pathSegments)
        s.remapCorrespondingIds(keyPoints, mediaPoints);
    for (CurvePoint &p : curvePoints) {
        p.correspondingKeyPoint = p.correspondingKeyPoint < keyPoints.size() ? keyPoints[p.correspondingKeyPoint].id : 0;
        p.correspondingMediaPoint =
            p.correspondingMediaPoint < mediaPoints.size() ? mediaPoints[p.correspondingMediaPoint].id : 0;
    }
}

bool Path::LoadCurvePoints(ProjectController &store, const QString &section)
{
    int32_t count = 0;
    initInt(store.readProperty(section, QStringLiteral("elements"), QString()), count);
    const std::vector<int32_t> present = store.numberedSections(QStringLiteral("curvepoint"), count);
    if (present.size() != size_t(std::max(count, 0)))
        logTrace(3, QStringLiteral("Path::LoadCurvePoints -> %d of %d sections present"), int(present.size()), count);
    curvePoints.reserve(curvePoints.size() + present.size());
    for (const int32_t i : present) {
        CurvePoint p;
        p.Load(store, QStringLiteral("curvepoint%1").arg(i));
        curvePoints.push_back(std::move(p));
    }
    return true;
}

void Path::insertSampleCopy(size_t index)
{
    CurvePoint copy = curvePoints[index];
    copy.correspondingKeyPoint = 0;
    copy.correspondingMediaPoint = 0;
    curvePoints.insert(curvePoints.begin() + long(index) + 1, copy);
}

void Path::renewIdsFrom(size_t index)
{
    for (size_t i = index; i < curvePoints.size(); ++i)
        curvePoints[i].id = drawPointId();
}

void Path::rebuildSegmentSamples(int segmentIndex)
{
    if (segmentIndex < 0 || size_t(segmentIndex) >= pathSegments.size() || size_t(segmentIndex) >= keyPoints.size())
        return;
    const int first = curvePointIndexNaming(keyPoints[size_t(segmentIndex)].id);
    if (first < 0)
        return;
    int last = int(curvePoints.size()) - 1;
    if (size_t(segmentIndex) + 1 < keyPoints.size()) {
        const int next = curvePointIndexNaming(keyPoints[size_t(segmentIndex) + 1].id);
        if (next >= first)
            last = next;
    }
    pathSegments[size_t(segmentIndex)].setCurvePoints(
        std::vector<CurvePoint>(curvePoints.begin() + first, curvePoints.begin() + last + 1));
}

int Path::nearestCurvePoint(double x, double y, size_t from, size_t to) const
{
    to = std::min(to, curvePoints.size());
    const GeoDistanceFrom origin(y, x);
    // A first guess from a few samples lets the full pass skip, by a bound that needs no
    // trigonometry, the samples that can't come nearer: long tracks are searched often.
    constexpr size_t guessStride = 64;
    double bound = std::numeric_limits<double>::infinity();
    for (size_t i = from; i < to; i += guessStride)
        bound = std::min(bound, origin.term(curvePoints[i].y, curvePoints[i].x));
    double best = std::numeric_limits<double>::infinity();
    int nearest = -1;
    for (size_t i = from; i < to; ++i) {
        const CurvePoint &p = curvePoints[i];
        if (origin.termAtLeast(p.y, p.x) > bound)
            continue;
        const double d = origin.term(p.y, p.x);
        if (d < best) {
            best = d;
            bound = std::min(bound, d);
            nearest = int(i);
        }
    }
    return nearest;
}
