#include "project/TrackImport.h"

#include "app/Trace.h"
#include "project/PainterPathRenderer_Controller.h"

TrackImportResult openTrackIntoDocument(PainterPathRenderer_Controller &document, const QString &fileName)
{
    Q_UNUSED(document);
    logTrace(3, QStringLiteral("openTrackIntoDocument[%s] - track files are not readable yet"), fileName);
    return {false, QStringLiteral("track files are not readable yet")};
}
