#pragma once

#include <QString>

class PainterPathRenderer_Controller;

struct TrackImportResult
{
    bool ok = false;
    QString reason; // why the file was not taken, for the user
};

// Reads a track file into the document's active path, named "gpxFile", with the
// document's aliasing setting, and sets the view boundary and centre from the
// track's corners. The document has been reset to a new project before.
TrackImportResult openTrackIntoDocument(PainterPathRenderer_Controller &document, const QString &fileName);
