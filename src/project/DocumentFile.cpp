#include "project/DocumentFile.h"

#include "project/PainterPathRenderer_Controller.h"
#include "project/TrackOpening.h"

#include <QFileInfo>

namespace {

// An ordinary path's curve is made from its key points. The stored samples of its
// segments still name points by index; dropping them lets the rebuild put fresh
// samples with ids in their place. A fixed track keeps its curve.
void rebuildLoadedPath(Path &path)
{
    if (path.isFixedTrack())
        return;
    for (PathSegment &segment : path.pathSegments)
        segment.curvePoints.clear();
    path.update();
}

} // namespace

DocumentOpenResult openDocumentFile(PainterPathRenderer_Controller &document, const QString &fileName)
{
    DocumentOpenResult result;
    document.newProject();
    if (!QFileInfo(fileName).isFile()) {
        result.reason = QStringLiteral("file not found");
        return result;
    }

    const ProjectLoadResult loaded = document.LoadProject(fileName);
    if (loaded.status == ProjectLoadResult::Status::Damaged) {
        result.status = DocumentOpenResult::Status::DamagedProject;
        result.reason = loaded.reason;
        return result;
    }
    if (loaded) {
        document.setKeyPointsFixed(false);
        if (Path *path = document.pathManager().active())
            rebuildLoadedPath(*path);
        document.fields().keyPointsLocked = false;
        // A project without a theme keeps the current one.
        AltitudePreset preset = document.altitudePreset();
        if (document.loadAltitudePreset(fileName, QStringLiteral("altprs."), preset))
            document.altitudePreset() = preset;
        // The theme's reader leaves the container open after a refused header.
        document.projectController().closeProjectFile();
        document.projectController().forgetReadFile();
        result.status = DocumentOpenResult::Status::Project;
        return result;
    }

    document.setKeyPointsFixed(true);
    const TrackOpeningResult track = openTrackIntoDocument(document, fileName);
    if (!track.ok) {
        document.newProject();
        result.reason = QStringLiteral("neither a project nor a readable track: %1").arg(track.reason);
        return result;
    }
    result.status = DocumentOpenResult::Status::Track;
    return result;
}

bool saveDocumentFile(PainterPathRenderer_Controller &document, const QString &fileName)
{
    return document.SaveProjectWithTheme(fileName) && !document.projectController().lastWriteFailed();
}
