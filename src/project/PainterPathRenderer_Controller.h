#pragma once

#include "animation/AnimationTiming.h"
#include "content/ContentCatalogue.h"
#include "models/AltitudePreset.h"
#include "models/PhotoPool.h"
#include "path/PathManager.h"
#include "project/ExportProperties.h"
#include "project/ProjectFields.h"
#include "project/ProjectLoadResult.h"
#include "project/QProjectController.h"

#include <QString>

#include <cstdint>

// The project document: the fields of a project, the paths, the timing, the photo
// pool and the active altitude theme, with saving and loading of the project file.
class PainterPathRenderer_Controller
{
public:
    PainterPathRenderer_Controller();

    PainterPathRenderer_Controller(const PainterPathRenderer_Controller &) = delete;
    PainterPathRenderer_Controller &operator=(const PainterPathRenderer_Controller &) = delete;

    // Fields and timing back to the defaults of a new project. The host name and
    // the two user settings (track aliasing, longest film) stay.
    void reset();
    // What "new project" does to the document: reset, an empty path named
    // "newProject", an empty photo pool and active theme, key points not fixed.
    void newProject();

    // Writes the document into the file, which is replaced whole at the close; false
    // when the container refused to start. Whether the file reached the disk tells
    // the container's lastWriteFailed(). The container is closed in every case.
    bool SaveProject(const QString &fileName);
    // SaveProject, then the active theme with the prefix "altprs." into the same
    // file, as saveAltitudePreset adds it, but in one writing of the file: the bytes
    // are those of the two steps, without reading a large file back in between.
    bool SaveProjectWithTheme(const QString &fileName);
    // Reads the file into the document, which the caller has reset. A damaged number
    // ends the load and leaves the document as a new project.
    ProjectLoadResult LoadProject(const QString &fileName);

    bool loadAltitudePreset(const QString &fileName, const QString &prefix, AltitudePreset &preset);
    // Writes with the document's version text in the preset's header.
    bool saveAltitudePreset(const QString &fileName, const QString &prefix, const AltitudePreset &preset);

    // Frames of the route at its natural speed: the legs of all key points but the last.
    int32_t naturalFrames() const;

    // The view: boundary corners and the centre between them.
    void setViewBoundaries(const KeyPoint &topLeft, const KeyPoint &bottomRight);

    ProjectFields &fields() { return m_fields; }
    const ProjectFields &fields() const { return m_fields; }
    AnimationTiming &timing() { return m_timing; }
    const AnimationTiming &timing() const { return m_timing; }
    PathManager &pathManager() { return m_pathManager; }
    const PathManager &pathManager() const { return m_pathManager; }
    PhotoPool &photoPool() { return m_photoPool; }
    const PhotoPool &photoPool() const { return m_photoPool; }
    AltitudePreset &altitudePreset() { return m_altitudePreset; }
    const AltitudePreset &altitudePreset() const { return m_altitudePreset; }
    QProjectController &projectController() { return m_projectController; }

    // "GpxAliasing" of the settings: 0 off, 1 auto, 2 default, 3 max.
    uint32_t gpxAliasing() const { return m_gpxAliasing; }
    void setGpxAliasing(uint32_t value) { m_gpxAliasing = value; }
    // "MaxAnimationDuration" of the settings.
    void setMaxAnimationDuration(uint32_t index) { m_timing.maxDurationIndex = index; }

    // The window's scale: 1.0, or 2.0 on a high-density screen. Set once at start.
    double scale() const { return m_scale; }
    void setScale(double scale) { m_scale = scale; }
    // The program's version as four dot-separated numbers. Set once at start.
    QString programVersion() const { return m_programVersion; }
    void setProgramVersion(const QString &version) { m_programVersion = version; }

    // The installed and user content, scanned once when the window sets up its lists.
    ContentCatalogue &catalogue() { return m_catalogue; }
    const ContentCatalogue &catalogue() const { return m_catalogue; }

    ExportProperties &exportProperties() { return m_exportProperties; }
    const ExportProperties &exportProperties() const { return m_exportProperties; }

    // Set while the open document is a track whose key points may not be edited freely.
    bool keyPointsFixed() const { return m_keyPointsFixed; }
    void setKeyPointsFixed(bool on) { m_keyPointsFixed = on; }

private:
    bool save(const QString &fileName, bool withTheme);

    ProjectFields m_fields;
    AnimationTiming m_timing;
    PathManager m_pathManager;
    PhotoPool m_photoPool;
    AltitudePreset m_altitudePreset = AltitudePreset::activeThemeDefaults();
    QProjectController m_projectController;
    uint32_t m_gpxAliasing = 1;
    bool m_keyPointsFixed = false;
    double m_scale = 1.0;
    QString m_programVersion = QStringLiteral("0.0.0.0");
    ExportProperties m_exportProperties;
    ContentCatalogue m_catalogue;
};
