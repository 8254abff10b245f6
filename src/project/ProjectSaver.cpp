#include "project/ProjectSaver.h"

#include "path/KeyPoints.h"
#include "path/PointRecord.h"
#include "project/PainterPathRenderer_Controller.h"
#include "project/ProjectFieldSink.h"

#include <functional>
#include <unordered_map>

namespace {

const QString animator = QStringLiteral("animator");

// Position of each point id in a list; anything unknown (0 among it) names nothing.
class IndexOfId
{
public:
    template <typename Points>
    explicit IndexOfId(const Points &points)
    {
        m_index.reserve(points.size());
        for (size_t i = 0; i < points.size(); ++i)
            m_index.emplace(points[i].id, uint32_t(i));
    }
    uint32_t operator()(uint32_t id) const
    {
        const auto found = m_index.find(id);
        return found == m_index.end() ? noPointIndex : found->second;
    }

private:
    std::unordered_map<uint32_t, uint32_t> m_index;
};

QString numbered(const char *stem, size_t index)
{
    return QLatin1String(stem) + QString::number(index);
}

} // namespace

void ProjectSaver::writeLeadingFields(const PainterPathRenderer_Controller &document, ProjectFieldSink &out)
{
    const ProjectFields &f = document.fields();
    const AnimationTiming &timing = document.timing();
    const Path *path = document.pathManager().active();

    out.put(QStringLiteral("Header"), QStringLiteral("hostName"), f.hostName);
    out.put(QStringLiteral("Header"), QStringLiteral("version"), f.versionText);

    out.put(animator, QStringLiteral("drawmode"), f.sceneMode);
    if (path) {
        out.put(animator, QStringLiteral("curvemode"), path->curveMode);
        out.put(animator, QStringLiteral("pathtype"), path->pathType);
    }
    out.put(animator, QStringLiteral("projectTitle"), f.projectTitle);
    out.put(animator, QStringLiteral("projectWidth"), f.projectWidth);
    out.put(animator, QStringLiteral("projectHeight"), f.projectHeight);
    out.put(animator, QStringLiteral("hostDimension_width"), f.hostWidth);
    out.put(animator, QStringLiteral("hostDimension_height"), f.hostHeight);
    out.put(animator, QStringLiteral("sceneDimension_width"), f.sceneWidth);
    out.put(animator, QStringLiteral("sceneDimension_height"), f.sceneHeight);
    out.put(animator, QStringLiteral("pathMode"), f.pathMode);
    out.put(animator, QStringLiteral("animationMode"), f.animationMode);
    out.put(animator, QStringLiteral("animationFrame"), f.animationFrame);
    out.put(animator, QStringLiteral("animationFrameSource"), f.animationFrameSource);
    out.put(animator, QStringLiteral("backgroundMap"), f.backgroundMap);
    out.put(animator, QStringLiteral("backgroundMapColor"), f.backgroundMapColor);
    out.put(animator, QStringLiteral("ignorePauseOnKeyPoint"), f.ignorePauseOnKeyPoint);
    out.put(animator, QStringLiteral("showKeyPointsOnAnimationPosition"), f.showKeyPointsOnAnimationPosition);
    out.put(animator, QStringLiteral("animateKeyPoints"), f.animateKeyPoints);
    out.put(animator, QStringLiteral("keyPointsLocked"), f.keyPointsLocked);
    out.put(animator, QStringLiteral("currentZoomLevel"), f.currentZoomLevel);
    out.put(animator, QStringLiteral("currentBearing"), f.currentBearing);
    out.put(animator, QStringLiteral("currentTilt"), f.currentTilt);

    out.putPoint(QStringLiteral("centerPosition"), f.centerPosition);
    out.putPoint(QStringLiteral("visibleBoundariesTL"), f.visibleBoundariesTL);
    out.putPoint(QStringLiteral("visibleBoundariesBR"), f.visibleBoundariesBR);
    out.putPoint(QStringLiteral("pseudoBoundariesTL"), f.pseudoBoundariesTL);
    out.putPoint(QStringLiteral("pseudoBoundariesBR"), f.pseudoBoundariesBR);

    out.put(animator, QStringLiteral("showCompass"), f.showCompass);
    out.put(animator, QStringLiteral("sendExportToHost"), f.sendExportToHost);

    const QString flyIn = QStringLiteral("flyIn");
    out.put(flyIn, QStringLiteral("enabled"), f.flyInEnabled);
    out.put(flyIn, QStringLiteral("enableRotation"), f.flyInRotation);
    out.put(flyIn, QStringLiteral("enableTilt"), f.flyInTilt);

    out.put(flyIn, QStringLiteral("duration"), timing.flyInDuration);
    out.put(flyIn, QStringLiteral("rotationStartAngle"), timing.flyInRotation);
    out.put(flyIn, QStringLiteral("tiltEndAngel"), timing.flyInTilt);
    out.put(QStringLiteral("route"), QStringLiteral("animationDurationPerc"), timing.durationFactor);
    out.put(animator, QStringLiteral("kpad"), timing.keyPointAnimationDuration);

    out.put(animator, QStringLiteral("linearAnimationDurations"), f.linearAnimationDurations);

    const QString pathSection = QStringLiteral("path");
    const PathSettings &look = f.pathSettings;
    out.put(pathSection, QStringLiteral("color"), look.color);
    out.put(pathSection, QStringLiteral("opacity"), look.opacity);
    out.put(pathSection, QStringLiteral("width"), look.width);
    out.put(pathSection, QStringLiteral("shadowEnabled"), look.shadowEnabled);
    out.put(pathSection, QStringLiteral("shadowDistance"), look.shadowDistance);
    out.put(pathSection, QStringLiteral("shadowWidth"), look.shadowWidth);
    out.put(pathSection, QStringLiteral("shadowOpacity"), look.shadowOpacity);

    const QString fullFrame = QStringLiteral("fullframe");
    out.put(animator, QStringLiteral("pad"), f.pad);
    out.put(fullFrame, QStringLiteral("duration"), f.fullFrameDuration);
    out.put(fullFrame, QStringLiteral("fadeDuration"), f.fullFrameFadeDuration);
    out.put(fullFrame, QStringLiteral("fullscreen"), f.fullFrameFullscreen);
    out.put(fullFrame, QStringLiteral("transitionMode"), f.fullFrameTransitionMode);

    const QString altitude = QStringLiteral("altprs.");
    out.put(altitude, QStringLiteral("index"), f.altitudePresetIndex);
    out.put(altitude, QStringLiteral("x"), f.altitudeBoardX);
    out.put(altitude, QStringLiteral("y"), f.altitudeBoardY);
    out.put(altitude, QStringLiteral("width"), f.altitudeBoardWidth);
    out.put(altitude, QStringLiteral("height"), f.altitudeBoardHeight);
    out.put(fullFrame, QStringLiteral("x"), f.fullFrameX);
    out.put(fullFrame, QStringLiteral("y"), f.fullFrameY);
    out.put(fullFrame, QStringLiteral("width"), f.fullFrameWidth);
    out.put(fullFrame, QStringLiteral("height"), f.fullFrameHeight);

    const QString pseudoMaps = QStringLiteral("pseudomaps");
    out.put(pseudoMaps, QStringLiteral("cropMode"), f.pseudoMapCropMode);
    out.put(pseudoMaps, QStringLiteral("initialZoom"), f.pseudoMapInitialZoom);
    out.putPoint(QStringLiteral("pseudomap_center"), f.pseudoMapCenter);
}

void ProjectSaver::writeTrailingFields(const PainterPathRenderer_Controller &document, ProjectFieldSink &out)
{
    out.put(QStringLiteral("exporter"), QStringLiteral("fileNameChangedByUser"), document.fields().fileNameChangedByUser);
}

void ProjectSaver::write()
{
    StoreFieldSink sink(m_store);
    writeLeadingFields(m_document, sink);
    writeKeyPoints();
    writeSegments();
    writeMediaPoints();
    writeCurvePoints();
    writeTrailingFields(m_document, sink);
    m_document.photoPool().Save(m_store);
}

void ProjectSaver::writeKeyPoints()
{
    const Path *path = m_document.pathManager().active();
    if (!path) {
        saveKeyPoints(m_store, {}, [](uint32_t) { return noPointIndex; });
        return;
    }
    const IndexOfId segmentIndex(path->pathSegments);
    const QVector<KeyPoint> keyPoints(path->keyPoints.begin(), path->keyPoints.end());
    saveKeyPoints(m_store, keyPoints, segmentIndex);
}

void ProjectSaver::writeSegments()
{
    const Path *path = m_document.pathManager().active();
    const size_t count = path ? path->pathSegments.size() : 0;
    if (path) {
        const IndexOfId keyIndex(path->keyPoints);
        const IndexOfId mediaIndex(path->mediaPoints);
        for (size_t i = 0; i < count; ++i)
            path->pathSegments[i].Save(m_store, numbered("pathsegment", i), std::cref(keyIndex), std::cref(mediaIndex));
    }
    PointRecordWriter(m_store, QStringLiteral("pathSegments")).write(QStringLiteral("elements"), int32_t(count));
}

void ProjectSaver::writeMediaPoints()
{
    const Path *path = m_document.pathManager().active();
    const size_t count = path ? path->mediaPoints.size() : 0;
    PointRecordWriter(m_store, QStringLiteral("mediapoints")).write(QStringLiteral("elements"), int32_t(count));
    for (size_t i = 0; i < count; ++i)
        path->mediaPoints[i].Save(m_store, numbered("mediapoint", i));
}

void ProjectSaver::writeCurvePoints()
{
    const Path *path = m_document.pathManager().active();
    if (!path || path->pathType == PathType::Ordinary)
        return;
    const IndexOfId keyIndex(path->keyPoints);
    const IndexOfId mediaIndex(path->mediaPoints);
    PointRecordWriter(m_store, QStringLiteral("curvepoints"))
        .write(QStringLiteral("elements"), int32_t(path->curvePoints.size()));
    for (size_t i = 0; i < path->curvePoints.size(); ++i) {
        CurvePoint stored = path->curvePoints[i];
        stored.correspondingKeyPoint = keyIndex(stored.correspondingKeyPoint);
        stored.correspondingMediaPoint = mediaIndex(stored.correspondingMediaPoint);
        stored.Save(m_store, numbered("curvepoint", i));
    }
}
