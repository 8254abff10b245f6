#pragma once

#include <QString>

class PainterPathRenderer_Controller;

struct TrackOpeningResult
{
    bool ok = false;
    QString reason; // why the file was not taken, for the user
};

// Reads a track file into the document's path, named "gpxFile", with the document's
// aliasing setting, and sets the view boundary from the track's corners and the
// centre between them. The document has been reset to a new project before.
TrackOpeningResult openTrackIntoDocument(PainterPathRenderer_Controller &document, const QString &fileName);
