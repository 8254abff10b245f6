#include "gpx/TrackImport.h"

#include "gpx/TrackFile.h"
#include "path/Path.h"

namespace {

void fillKeyPoint(KeyPoint &key, const TrackPoint &p)
{
    key.setLongitude(p.longitude, true);
    key.setLatitude(p.latitude, true);
    if (p.hasAltitude)
        key.setAltitude(p.altitude, true);
    if (!p.name.isEmpty()) {
        key.name = p.name;
        key.properties.title = p.name;
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
    const TrackItem &item = track.items()[size_t(chosen)];

    Path path;
    path.curveMode = CurveMode::Straight;
    path.pathType = PathType::GPX;
    path.fixedCurve = item.fixedGpxPath;
    // Points that the conversion thins away need no segments of their own.
    const bool converted = item.fixedGpxPath;
    path.keyPoints.reserve(size_t(item.points.size()));
    for (const TrackPoint &p : item.points) {
        if (converted) {
            fillKeyPoint(path.keyPoints.emplace_back(), p);
        } else {
            KeyPoint key;
            fillKeyPoint(key, p);
            path.addKeyPoint(key, false);
        }
    }

    KeyPoint topLeft, bottomRight;
    topLeft.setLongitude(item.bounds.left, false);
    topLeft.setLatitude(item.bounds.top, false);
    bottomRight.setLongitude(item.bounds.right, false);
    bottomRight.setLatitude(item.bounds.bottom, false);

    if (converted) {
        path.convertFromGPX(aliasing, track.isOwnFile(), fixedDurationSamples);
    } else {
        path.pathType = PathType::Ordinary;
        path.update(true);
    }
    // Waypoints of the other items would be matched against the route with a
    // tolerance of 0, which never matches: they leave the route as it is.
    path.setBoundaries(topLeft, bottomRight);
    outPath = std::move(path);
    return true;
}
