#include "gpx/TrackImport.h"

#include "gpx/TrackFile.h"
#include "path/Path.h"

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
    // Waypoints of the other items would be matched against the route with a
    // tolerance of 0, which never matches: they leave the route as it is.
    path.setBoundaries(topLeft, bottomRight);
    outPath = std::move(path);
}
