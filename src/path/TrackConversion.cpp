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

namespace {

KeyPoint keyPointOf(const KeyPoint &k)
{
    return k;
}

KeyPoint keyPointOf(const TrackPoint &p)
{
    return keyPointFromTrack(p);
}

// The fixed points with their places; made before the path's key points go.
template<typename Points>
std::vector<FixedKeyPoint> thinOrCopy(const Points &points, double threshold, bool thin, std::vector<CurvePoint> &curve)
{
    std::vector<FixedPlace> places;
    if (thin) {
        places = thinTrack(points, threshold, curve);
    } else {
        curve.clear();
        curve.reserve(size_t(points.size()));
        for (size_t i = 0; i < size_t(points.size()); ++i) {
            const auto &p = points[i];
            curve.emplace_back(trackpoint::x(p), trackpoint::y(p), trackpoint::z(p));
            if (i == 0 || i + 1 == size_t(points.size()) || trackpoint::titled(p))
                places.push_back({i, i, true});
        }
    }
    std::vector<FixedKeyPoint> fixed;
    fixed.reserve(places.size());
    for (const FixedPlace &place : places)
        fixed.push_back({keyPointOf(points[place.source]), place.index, place.placed});
    return fixed;
}

} // namespace

template<typename Points>
bool Path::convertTrack(Points &points, uint32_t aliasing, bool ownFile, int32_t fixedDuration)
{
    const double threshold = gpxThresholdOf(points, aliasing, fixedDuration);
    std::vector<FixedKeyPoint> fixed = thinOrCopy(points, threshold, aliasing != 0 && points.size() >= 2, curvePoints);
    setFixedKeyPoints(fixed, ownFile);
    if (!pathSegments.empty())
        pathSegments.front().curvePoints = curvePoints;
    return true;
}

bool Path::convertFromGPX(uint32_t aliasing, bool ownFile, int32_t fixedDuration)
{
    return convertTrack(keyPoints, aliasing, ownFile, fixedDuration);
}

bool Path::convertFromGPX(TrackPoints points, uint32_t aliasing, bool ownFile, int32_t fixedDuration)
{
    return convertTrack(points, aliasing, ownFile, fixedDuration);
}
