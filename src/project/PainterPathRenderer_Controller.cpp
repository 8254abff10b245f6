#include "project/PainterPathRenderer_Controller.h"

#include "animation/FrameRate.h"
#include "app/Trace.h"
#include "path/DefaultTitle.h"
#include "project/ProjectLoader.h"
#include "project/ProjectSaver.h"
#include "project/ValueParsers.h"

#include <QElapsedTimer>

PainterPathRenderer_Controller::PainterPathRenderer_Controller() = default;

void PainterPathRenderer_Controller::reset()
{
    const QString hostName = m_fields.hostName;
    m_fields = ProjectFields();
    m_fields.hostName = hostName;

    const uint32_t maxDurationIndex = m_timing.maxDurationIndex;
    m_timing = AnimationTiming();
    m_timing.maxDurationIndex = maxDurationIndex;
}

void PainterPathRenderer_Controller::newProject()
{
    m_keyPointsFixed = false;
    reset();
    if (Path *path = m_pathManager.active()) {
        path->curvePoints.clear();
        path->keyPoints.clear();
        path->mediaPoints.clear();
        path->pathSegments.clear();
    }
    m_pathManager.addPath(QStringLiteral("newProject"));
    resetDefaultKeyPointTitleCounter();
    m_photoPool.clear();
    m_photoPool.fullFrameBorderEffect = false;
    m_photoPool.fullFrameCropping = false;
    m_altitudePreset = AltitudePreset::activeThemeDefaults();
}

bool PainterPathRenderer_Controller::SaveProject(const QString &fileName)
{
    return save(fileName, false);
}

bool PainterPathRenderer_Controller::SaveProjectWithTheme(const QString &fileName)
{
    return save(fileName, true);
}

bool PainterPathRenderer_Controller::save(const QString &fileName, bool withTheme)
{
    QElapsedTimer timer;
    timer.start();
    const bool created = m_projectController.createProjectFile(fileName);
    if (created) {
        ProjectSaver(*this, m_projectController).write();
        if (withTheme) {
            AltitudePreset stamped = m_altitudePreset;
            stamped.version = m_fields.versionText;
            writeAltitudePreset(m_projectController, altitudePresetPrefix(), stamped);
        }
    }
    const qint64 written = timer.elapsed();
    m_projectController.closeProjectFile();
    logTrace(0, QStringLiteral("PainterPathRenderer_Controller::SaveProject[%s] - %d ms to write, %d ms to close"), fileName,
             written, timer.elapsed() - written);
    return created;
}

ProjectLoadResult PainterPathRenderer_Controller::LoadProject(const QString &fileName)
{
    ProjectLoadResult result;
    if (!m_projectController.openProjectFile(fileName, true)) {
        m_projectController.closeProjectFile();
        result.reason = QStringLiteral("no project file of a readable version");
        return result;
    }
    m_pathManager.addPath(QStringLiteral("fileName"));
    QElapsedTimer timer;
    timer.start();
    try {
        ProjectLoader(*this, m_projectController).read();
        logTrace(0, QStringLiteral("PainterPathRenderer_Controller::LoadProject[%s] - read in %d ms"), fileName, timer.elapsed());
        result.status = ProjectLoadResult::Status::Loaded;
    } catch (const DamagedNumberError &error) {
        logTrace(3, QStringLiteral("PainterPathRenderer_Controller::LoadProject[%s] - damaged number: %s"), fileName,
                 error.what());
        m_projectController.closeProjectFile();
        newProject();
        result.status = ProjectLoadResult::Status::Damaged;
        result.reason = QStringLiteral("damaged number (%1)").arg(QString::fromLatin1(error.what()));
        return result;
    }
    m_projectController.closeProjectFile();
    return result;
}

bool PainterPathRenderer_Controller::loadAltitudePreset(const QString &fileName, const QString &prefix, AltitudePreset &preset)
{
    return ::loadAltitudePreset(m_projectController, fileName, prefix, preset);
}

bool PainterPathRenderer_Controller::saveAltitudePreset(const QString &fileName, const QString &prefix,
                                                        const AltitudePreset &preset)
{
    AltitudePreset stamped = preset;
    stamped.version = m_fields.versionText;
    return ::saveAltitudePreset(m_projectController, fileName, prefix, stamped);
}

int32_t PainterPathRenderer_Controller::naturalFrames() const
{
    const Path *path = m_pathManager.active();
    if (!path || path->keyPoints.empty())
        return 0;
    int32_t frames = 0;
    for (size_t i = 0; i + 1 < path->keyPoints.size(); ++i)
        frames += FrameRate::framesFromMs(path->keyPoints[i].properties.durationToNextKP);
    return frames;
}

void PainterPathRenderer_Controller::setViewBoundaries(const KeyPoint &topLeft, const KeyPoint &bottomRight)
{
    m_fields.visibleBoundariesTL = topLeft;
    m_fields.visibleBoundariesBR = bottomRight;
    KeyPoint center;
    center.setLongitude((topLeft.longitude + bottomRight.longitude) * 0.5, true);
    center.setLatitude((topLeft.latitude + bottomRight.latitude) * 0.5, true);
    m_fields.centerPosition = center;
}
