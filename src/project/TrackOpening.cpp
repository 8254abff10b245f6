#include "project/TrackOpening.h"

#include "app/Trace.h"
#include "gpx/TrackImport.h"
#include "project/PainterPathRenderer_Controller.h"

#include <QFile>

#include <algorithm>

namespace {

struct Extent
{
    double west, south, east, north;
};

// The path's extent as the reader set it; a path without one (all corners 0) takes
// that of its points.
Extent extentOf(const Path &path)
{
    const KeyPoint &a = path.boundaryMin, &b = path.boundaryMax;
    const bool unset = a.longitude == 0 && a.latitude == 0 && b.longitude == 0 && b.latitude == 0;
    if (!unset)
        return {std::min(a.longitude, b.longitude), std::min(a.latitude, b.latitude),
                std::max(a.longitude, b.longitude), std::max(a.latitude, b.latitude)};

    bool first = true;
    Extent e{0, 0, 0, 0};
    auto include = [&](double x, double y) {
        if (first) {
            e = {x, y, x, y};
            first = false;
            return;
        }
        e.west = std::min(e.west, x);
        e.east = std::max(e.east, x);
        e.south = std::min(e.south, y);
        e.north = std::max(e.north, y);
    };
    for (const CurvePoint &p : path.curvePoints)
        include(p.x, p.y);
    for (const KeyPoint &p : path.keyPoints)
        include(p.x, p.y);
    return e;
}

} // namespace

TrackOpeningResult openTrackIntoDocument(PainterPathRenderer_Controller &document, const QString &fileName)
{
    QFile probe(fileName);
    if (!probe.open(QIODevice::ReadOnly))
        return {false, QStringLiteral("can't be opened (%1)").arg(probe.errorString())};
    probe.close();

    Path track;
    if (!TrackImport::read(fileName, track, document.gpxAliasing(), TrackImport::fixedDuration)) {
        logTrace(0, QStringLiteral("openTrackIntoDocument[%s] - no track in the file"), fileName);
        return {false, QStringLiteral("no track, route or waypoint of a GPX, KML, KMZ, TCX or TRK file")};
    }

    PathManager &paths = document.pathManager();
    paths.addPath(track, QStringLiteral("gpxFile"));
    // The manager keeps one path: the track went into it under its old name, which
    // then stays the active one.
    if (!paths.setActivePath(QStringLiteral("gpxFile")) && paths.activePath < 0)
        paths.activePath = 0;

    const Extent e = extentOf(track);
    KeyPoint topLeft, bottomRight;
    topLeft.setLongitude(e.west, false);
    topLeft.setLatitude(e.north, false);
    bottomRight.setLongitude(e.east, false);
    bottomRight.setLatitude(e.south, false);
    document.setViewBoundaries(topLeft, bottomRight);
    logTrace(0, QStringLiteral("openTrackIntoDocument[%s] - %d key points, %d curve points"), fileName,
             int(track.keyPoints.size()), int(track.curvePoints.size()));
    return {true, QString()};
}
