#include "gpx/TrackImport.h"

#include "gpx/TrackFile.h"
#include "path/Path.h"

#include <algorithm>

namespace {

struct Placement
{
    size_t sample;
    const TrackPoint *point;
};

bool samePosition(const CurvePoint &a, const CurvePoint &b)
{
    return a.x == b.x && a.y == b.y;
}

// The points of the file's other items (waypoints a device stored along the way) go onto the
// nearest samples of a converted track: a sample that starts a leg gives its key point the
// point's name, any other becomes a new key point. Placing them in the order of the curve keeps
// the sample lists of the legs already made in step with the curve.
void placeOtherItems(const std::vector<TrackItem> &items, int chosen, Path &path)
{
    std::vector<Placement> placements;
    for (size_t i = 0; i < items.size(); ++i) {
        if (int(i) == chosen || items[i].type == TrackItem::Track)
            continue;
        for (const TrackPoint &p : items[i].points) {
            const int nearest = path.nearestCurvePoint(p.longitude, p.latitude, 0, path.curvePoints.size());
            if (nearest >= 0)
                placements.push_back({size_t(nearest), &p});
        }
    }
    std::stable_sort(placements.begin(), placements.end(),
                     [](const Placement &a, const Placement &b) { return a.sample < b.sample; });

    // Each insertion adds one sample behind the one it was made at.
    size_t inserted = 0, insertedHere = 0, lastSample = 0;
    for (const Placement &placement : placements) {
        if (placement.sample != lastSample) {
            inserted += insertedHere;
            insertedHere = 0;
            lastSample = placement.sample;
        }
        size_t at = placement.sample + inserted;
        std::vector<CurvePoint> &curve = path.curvePoints;
        // A key point inserted earlier names the copy behind the sample that was nearest.
        if (curve[at].correspondingKeyPoint == 0 && at + 1 < curve.size() && curve[at + 1].correspondingKeyPoint != 0 &&
            samePosition(curve[at], curve[at + 1]))
            ++at;
        const TrackPoint &point = *placement.point;
        if (curve[at].correspondingKeyPoint != 0) {
            const int k = path.keyPointIndex(curve[at].correspondingKeyPoint);
            // A nameless point leaves the name that is there.
            if (k >= 0 && !point.name.isEmpty()) {
                path.keyPoints[size_t(k)].name = point.name;
                path.keyPoints[size_t(k)].properties.title = point.name;
            }
            continue;
        }
        size_t before = at;
        while (before > 0 && curve[before].correspondingKeyPoint == 0)
            --before;
        const uint32_t afterId = curve[before].correspondingKeyPoint;
        if (afterId == 0)
            continue;
        KeyPoint key = keyPointFromTrack(point);
        key.setLongitude(curve[at].x, true);
        key.setLatitude(curve[at].y, true);
        key.setAltitude(curve[at].z, true);
        path.insertKeyPoint(afterId, key, false);
        ++insertedHere;
    }
}

} // namespace

bool TrackImport::read(const QString &fileName, Path &outPath, uint32_t aliasing, int32_t fixedDurationSamples,
                       TrackFile *file)
{
    TrackFile own;
    TrackFile &track = file ? *file : own;
    if (!track.load(fileName))
        return false;
    const int chosen = track.selectItem();
    if (chosen < 0)
        return false;
    toPath(track, chosen, outPath, aliasing, fixedDurationSamples);
    return true;
}

void TrackImport::toPath(const TrackFile &track, int chosen, Path &outPath, uint32_t aliasing,
                         int32_t fixedDurationSamples)
{
    const TrackItem &item = track.items()[size_t(chosen)];

    Path path;
    path.curveMode = CurveMode::Straight;
    path.pathType = PathType::GPX;
    path.fixedCurve = item.fixedGpxPath;
    const bool converted = item.fixedGpxPath;
    if (!converted) {
        for (const TrackPoint &p : item.points) {
            path.addKeyPoint(keyPointFromTrack(p), false);
        }
    }

    KeyPoint topLeft, bottomRight;
    topLeft.setLongitude(item.bounds.left, false);
    topLeft.setLatitude(item.bounds.top, false);
    bottomRight.setLongitude(item.bounds.right, false);
    bottomRight.setLatitude(item.bounds.bottom, false);

    if (converted) {
        path.convertFromGPX(item.points, aliasing, track.isOwnFile(), fixedDurationSamples);
    } else {
        path.pathType = PathType::Ordinary;
        path.update(true);
    }
    if (converted)
        placeOtherItems(track.items(), chosen, path);
    path.setBoundaries(topLeft, bottomRight);
    outPath = std::move(path);
}
