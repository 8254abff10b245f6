// Conversion of a track's points into a fixed track path.
#include "path/Path.h"

#include "app/Trace.h"
#include "path/TrackThinning.h"
#include "path/GeoDistance.h"

#include <limits>

namespace {
constexpr int32_t samplesPerLegBeforeThinning = 200;
constexpr int32_t msPerSample = 3;
}

double Path::gpxThreshold(uint32_t aliasing, int32_t fixedDuration)
{
    if (aliasing == 0)
        return std::numeric_limits<double>::max();
    const bool big = aliasing == 1 && keyPoints.size() > 10000;
    logTrace(0, QStringLiteral("m_GPXFixedDuration %d"), fixedDuration);

    // Repeated positions go; a titled repeat replaces the point before it.
    double complete = 0.0;
    double minDistance = std::numeric_limits<double>::max();
    int count = 0;
    size_t kept = keyPoints.empty() ? 0 : 1;
    for (size_t i = 1; i < keyPoints.size(); ++i) {
        KeyPoint &previous = keyPoints[kept - 1];
        KeyPoint &point = keyPoints[i];
        if (point.x == previous.x && point.y == previous.y) {
            if (!point.title().isEmpty())
                previous = std::move(point);
            continue;
        }
        const double d = geoDistance(point.y, point.x, previous.y, previous.x);
        complete += d;
        ++count;
        minDistance = std::min(minDistance, d);
        if (kept != i)
            keyPoints[kept] = std::move(point);
        ++kept;
    }
    keyPoints.resize(kept);

    const double byCount = complete / count;
    const double byTarget = complete / fixedDuration;
    logTrace(0, QStringLiteral("fMinDistance: %f"), minDistance);
    logTrace(0, QStringLiteral("fDistanceComplete: %f"), complete);
    logTrace(0, QStringLiteral("fDistanceAverage: %f"), byCount);
    if (aliasing == 2 || big)
        return std::min(byTarget, byCount);
    return std::min(byTarget, minDistance);
}

void Path::setFixedKeyPoints(std::vector<FixedKeyPoint> &fixed, bool ownFile)
{
    keyPoints.clear();
    pathSegments.clear();
    if (fixed.empty())
        return;
    const bool longCurve = curvePoints.size() > size_t(samplesPerLegBeforeThinning);
    const int32_t longDuration = int32_t(msPerSample * curvePoints.size());

    if (!ownFile) {
        std::vector<FixedKeyPoint> ends{fixed.front()};
        if (fixed.size() > 1)
            ends.push_back(fixed.back());
        if (longCurve)
            ends.front().point.properties.durationToNextKP = longDuration;
        for (FixedKeyPoint &entry : ends)
            addKeyPoint(entry.point, false);
        if (!curvePoints.empty()) {
            curvePoints.front().correspondingKeyPoint = keyPoints.front().id;
            curvePoints.back().correspondingKeyPoint = keyPoints.back().id;
        }
        return;
    }
    for (size_t n = 0; n < fixed.size(); ++n) {
        FixedKeyPoint &entry = fixed[n];
        if (longCurve)
            entry.point.properties.durationToNextKP = longDuration;
        if (entry.index < curvePoints.size()) {
            CurvePoint &sample = curvePoints[entry.index];
            sample.correspondingKeyPoint = entry.point.id;
            if (sample.x != entry.point.x || sample.y != entry.point.y) {
                logTrace(0, QStringLiteral("Path::convertFromGPX::setFixedKeyPoints - fixedKP %d has no valid Position (distance = %f)"),
                         int(n), geoDistance(sample.y, sample.x, entry.point.y, entry.point.x));
            }
        }
        addKeyPoint(entry.point, false);
    }
}

bool Path::convertFromGPX(uint32_t aliasing, bool ownFile, int32_t fixedDuration)
{
    const double threshold = gpxThreshold(aliasing, fixedDuration);
    std::vector<FixedKeyPoint> fixed;
    if (aliasing == 0 || keyPoints.size() < 2) {
        curvePoints.clear();
        curvePoints.reserve(keyPoints.size());
        for (size_t i = 0; i < keyPoints.size(); ++i) {
            const KeyPoint &k = keyPoints[i];
            curvePoints.emplace_back(k.x, k.y, k.z);
            if (i == 0 || i + 1 == keyPoints.size() || !k.title().isEmpty())
                fixed.push_back({k, i, true});
        }
    } else {
        fixed = thinTrack(keyPoints, threshold, curvePoints);
    }
    setFixedKeyPoints(fixed, ownFile);
    if (!pathSegments.empty())
        pathSegments.front().curvePoints = curvePoints;
    return true;
}
