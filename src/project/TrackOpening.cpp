#include "project/TrackOpening.h"

#include "app/Trace.h"
#include "gpx/TrackImport.h"
#include "project/PainterPathRenderer_Controller.h"

#include <QFile>


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

    const Path::Extent e = track.extent();
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
