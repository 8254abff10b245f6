#include "project/ProjectLoader.h"

#include "app/Trace.h"
#include "path/KeyPoints.h"
#include "path/PointRecord.h"
#include "project/PainterPathRenderer_Controller.h"
#include "project/ValueParsers.h"

#include <algorithm>

namespace {

const QString animator = QStringLiteral("animator");

// The two path values bypass the value parsers, as a plain base-10 conversion:
// text that is no number gives 0 instead of ending the load.
int32_t parsePathValue(const QString &text)
{
    int32_t value = 0;
    try {
        initInt(text, value);
    } catch (const DamagedNumberError &) {
        value = 0;
    }
    return value;
}

// The samples name key points and media points by the number of their section.
// Where a section in the middle is missing the loaded list is shorter, and the
// numbers become positions in it; a number without a loaded point names none.
void renumberReferences(Path &path, uint32_t CurvePoint::*reference, const std::vector<int32_t> &numbers)
{
    if (numbers.empty() || numbers.back() == int32_t(numbers.size()) - 1)
        return;
    const auto position = [&](uint32_t number) {
        const auto at = std::lower_bound(numbers.begin(), numbers.end(), int64_t(number),
                                         [](int32_t a, int64_t b) { return int64_t(a) < b; });
        return at != numbers.end() && *at == int64_t(number) ? uint32_t(at - numbers.begin()) : noPointIndex;
    };
    for (CurvePoint &p : path.curvePoints)
        p.*reference = position(p.*reference);
    for (PathSegment &segment : path.pathSegments) {
        for (CurvePoint &p : segment.curvePoints)
            p.*reference = position(p.*reference);
    }
}

} // namespace

QString ProjectLoader::text(const QString &section, const QString &key) const
{
    return m_store.readProperty(section, key, QString());
}

void ProjectLoader::read()
{
    readPathKind();
    readScene();
    readViews();
    readFlyIn();
    const double routeFactor = readRouteFactor();
    readLook();

    Path *path = m_document.pathManager().active();
    if (path && path->pathType != PathType::Ordinary)
        path->LoadCurvePoints(m_store, QStringLiteral("curvepoints"));

    readGeometry();
    const std::vector<int32_t> keyPointNumbers = readKeyPoints();
    readSegments();
    if (path)
        renumberReferences(*path, &CurvePoint::correspondingKeyPoint, keyPointNumbers);
    readMediaPoints();

    initBool(text(QStringLiteral("exporter"), QStringLiteral("fileNameChangedByUser")),
             m_document.fields().fileNameChangedByUser);
    m_document.photoPool().Load(m_store);

    if (path && path->pathType == PathType::GPX)
        path->initCorrespondingObjectIds();
    convertOldRouteDuration(routeFactor);
}

void ProjectLoader::readPathKind()
{
    ProjectFields &f = m_document.fields();
    initSceneMode(text(animator, QStringLiteral("drawmode")), f.sceneMode);

    Path *path = m_document.pathManager().active();
    const QString curveMode = text(animator, QStringLiteral("curvemode"));
    if (curveMode.isEmpty())
        logTrace(3, QStringLiteral("m_projectController.readProperty(L'animator', L'curvemode') -> result is empty"));
    else if (path)
        path->curveMode = parsePathValue(curveMode);
    const QString pathType = text(animator, QStringLiteral("pathtype"));
    if (pathType.isEmpty())
        logTrace(3, QStringLiteral("m_projectController.readProperty(L'animator', L'pathtype') -> result is empty"));
    else if (path)
        path->pathType = parsePathValue(pathType);
}

void ProjectLoader::readScene()
{
    ProjectFields &f = m_document.fields();
    initString(text(animator, QStringLiteral("projectTitle")), f.projectTitle);
    initInt(text(animator, QStringLiteral("projectWidth")), f.projectWidth);
    initInt(text(animator, QStringLiteral("projectHeight")), f.projectHeight);
    initDimension(text(animator, QStringLiteral("hostDimension_width")), text(animator, QStringLiteral("hostDimension_height")),
                  f.hostWidth, f.hostHeight);
    initDimension(text(animator, QStringLiteral("sceneDimension_width")),
                  text(animator, QStringLiteral("sceneDimension_height")), f.sceneWidth, f.sceneHeight);
    initInt(text(animator, QStringLiteral("pathMode")), f.pathMode);
    initInt(text(animator, QStringLiteral("animationMode")), f.animationMode);
    // Saved as "animationFrame": the frame comes back through the interface, not from here.
    initInt(text(animator, QStringLiteral("m_animationFrame")), f.animationFrame);
    initString(text(animator, QStringLiteral("animationFrameSource")), f.animationFrameSource);
    initString(text(animator, QStringLiteral("backgroundMap")), f.backgroundMap);
    initString(text(animator, QStringLiteral("backgroundMapColor")), f.backgroundMapColor);
    initBool(text(animator, QStringLiteral("ignorePauseOnKeyPoint")), f.ignorePauseOnKeyPoint);
    initBool(text(animator, QStringLiteral("showKeyPointsOnAnimationPosition")), f.showKeyPointsOnAnimationPosition);
    initBool(text(animator, QStringLiteral("animateKeyPoints")), f.animateKeyPoints);
    initBool(text(animator, QStringLiteral("keyPointsLocked")), f.keyPointsLocked);
    initDouble(text(animator, QStringLiteral("currentZoomLevel")), f.currentZoomLevel);
    initDouble(text(animator, QStringLiteral("currentBearing")), f.currentBearing);
    initDouble(text(animator, QStringLiteral("currentTilt")), f.currentTilt);
}

void ProjectLoader::readViews()
{
    ProjectFields &f = m_document.fields();
    f.centerPosition.Load(m_store, QStringLiteral("centerPosition"));
    f.visibleBoundariesTL.Load(m_store, QStringLiteral("visibleBoundariesTL"));
    f.visibleBoundariesBR.Load(m_store, QStringLiteral("visibleBoundariesBR"));
    f.pseudoBoundariesTL.Load(m_store, QStringLiteral("pseudoBoundariesTL"));
    f.pseudoBoundariesBR.Load(m_store, QStringLiteral("pseudoBoundariesBR"));
    initBool(text(animator, QStringLiteral("showCompass")), f.showCompass);
    initBool(text(animator, QStringLiteral("sendExportToHost")), f.sendExportToHost);
}

void ProjectLoader::readFlyIn()
{
    ProjectFields &f = m_document.fields();
    AnimationTiming &timing = m_document.timing();
    const QString flyIn = QStringLiteral("flyIn");

    // Projects from before the fly-in have none of its keys.
    const QString enabled = text(flyIn, QStringLiteral("enabled"));
    if (enabled.isEmpty()) {
        f.flyInEnabled = false;
        f.flyInRotation = true;
        f.flyInTilt = true;
    } else {
        initBool(enabled, f.flyInEnabled);
        initBool(text(flyIn, QStringLiteral("enableRotation")), f.flyInRotation);
        initBool(text(flyIn, QStringLiteral("enableTilt")), f.flyInTilt);
    }

    const QString duration = text(flyIn, QStringLiteral("duration"));
    if (duration.isEmpty()) {
        timing.flyInRotation = 60.0;
        timing.flyInTilt = 54.0;
        timing.flyInDuration = 5;
    } else {
        initInt(duration, timing.flyInDuration);
        initDouble(text(flyIn, QStringLiteral("rotationStartAngle")), timing.flyInRotation);
        initDouble(text(flyIn, QStringLiteral("tiltEndAngel")), timing.flyInTilt);
    }
    int32_t pad = timing.keyPointAnimationDuration;
    if (initInt(text(animator, QStringLiteral("kpad")), pad))
        timing.setKeyPointAnimationDuration(pad);
}

double ProjectLoader::readRouteFactor()
{
    double factor = -1.0;
    initDouble(text(QStringLiteral("route"), QStringLiteral("animationDurationPerc")), factor);
    if (factor != -1.0)
        m_document.timing().setDurationFactor(factor);
    return factor;
}

void ProjectLoader::readLook()
{
    ProjectFields &f = m_document.fields();
    initBool(text(animator, QStringLiteral("linearAnimationDurations")), f.linearAnimationDurations);

    const PointRecordReader look(m_store, QStringLiteral("path"));
    PathSettings &s = f.pathSettings;
    look.read(QStringLiteral("color"), s.color);
    look.read(QStringLiteral("opacity"), s.opacity);
    look.read(QStringLiteral("width"), s.width);
    look.read(QStringLiteral("shadowEnabled"), s.shadowEnabled);
    look.read(QStringLiteral("shadowDistance"), s.shadowDistance);
    look.read(QStringLiteral("shadowWidth"), s.shadowWidth);
    look.read(QStringLiteral("shadowOpacity"), s.shadowOpacity);

    const QString fullFrame = QStringLiteral("fullframe");
    initInt(text(fullFrame, QStringLiteral("duration")), f.fullFrameDuration);
    initInt(text(fullFrame, QStringLiteral("fadeDuration")), f.fullFrameFadeDuration);
    initBool(text(fullFrame, QStringLiteral("fullscreen")), f.fullFrameFullscreen);
    initInt(text(fullFrame, QStringLiteral("transitionMode")), f.fullFrameTransitionMode);
    initInt(text(animator, QStringLiteral("pad")), f.pad);
}

void ProjectLoader::readGeometry()
{
    ProjectFields &f = m_document.fields();
    const QString altitude = QStringLiteral("altprs.");
    initInt(text(altitude, QStringLiteral("index")), f.altitudePresetIndex);
    initInt(text(altitude, QStringLiteral("x")), f.altitudeBoardX);
    initInt(text(altitude, QStringLiteral("y")), f.altitudeBoardY);
    initInt(text(altitude, QStringLiteral("width")), f.altitudeBoardWidth);
    initInt(text(altitude, QStringLiteral("height")), f.altitudeBoardHeight);
    const QString fullFrame = QStringLiteral("fullframe");
    initInt(text(fullFrame, QStringLiteral("x")), f.fullFrameX);
    initInt(text(fullFrame, QStringLiteral("y")), f.fullFrameY);
    initInt(text(fullFrame, QStringLiteral("width")), f.fullFrameWidth);
    initInt(text(fullFrame, QStringLiteral("height")), f.fullFrameHeight);

    const QString pseudoMaps = QStringLiteral("pseudomaps");
    f.pseudoMapCropMode = false;
    initBool(text(pseudoMaps, QStringLiteral("cropMode")), f.pseudoMapCropMode);
    initDouble(text(pseudoMaps, QStringLiteral("initialZoom")), f.pseudoMapInitialZoom);
    f.pseudoMapCenter.Load(m_store, QStringLiteral("pseudomap_center"));
}

std::vector<int32_t> ProjectLoader::readKeyPoints()
{
    Path *path = m_document.pathManager().active();
    if (!path)
        return {};
    QVector<KeyPoint> keyPoints;
    std::vector<int32_t> numbers;
    loadKeyPoints(m_store, m_store.projectVersion(), keyPoints, &numbers);
    path->keyPoints.reserve(path->keyPoints.size() + size_t(keyPoints.size()));
    // Only the last key point asks for the curve, so that media points find their samples.
    for (int i = 0; i < keyPoints.size(); ++i)
        path->addKeyPoint(keyPoints[i], i + 1 == keyPoints.size());
    return numbers;
}

void ProjectLoader::readSegments()
{
    Path *path = m_document.pathManager().active();
    if (!path)
        return;
    const QString listSection = QStringLiteral("pathSegments");
    int32_t count = -1;
    initInt(text(listSection, QStringLiteral("elements")), count);
    if (count >= 0 && size_t(count) == path->keyPoints.size() && path->pathSegments.size() == path->keyPoints.size()) {
        for (size_t i = 0; i < path->pathSegments.size(); ++i) {
            PathSegment stored(path->keyPoints[i].id);
            stored.Load(m_store, QStringLiteral("pathsegment%1").arg(i));
            path->pathSegments[i].assign(stored, false);
        }
        return;
    }
    logTrace(3, QStringLiteral("PathSegment::Load[%s] - number of pathsegments differs to number of keypoints"), listSection);
    // Older projects have one avatar for the whole route.
    for (PathSegment &segment : path->pathSegments)
        segment.pilot.Load(m_store, QStringLiteral("pilot"));
}

void ProjectLoader::readMediaPoints()
{
    Path *path = m_document.pathManager().active();
    if (!path)
        return;
    int32_t count = 0;
    PointRecordReader(m_store, QStringLiteral("mediapoints")).read(QStringLiteral("elements"), count);
    const std::vector<int32_t> numbers = m_store.numberedSections(QStringLiteral("mediapoint"), count);
    if (numbers.size() != size_t(std::max(count, 0)))
        logTrace(3, QStringLiteral("ProjectLoader -> %d of %d media point sections present"), int(numbers.size()), count);
    // Before the points are added, which name their samples by position.
    renumberReferences(*path, &CurvePoint::correspondingMediaPoint, numbers);
    const bool useIndex = path->pathType == PathType::GPX;
    for (const int32_t i : numbers) {
        MediaPoint point;
        point.Load(m_store, QStringLiteral("mediapoint%1").arg(i));
        uint32_t keyPointId = 0;
        for (const KeyPoint &k : path->keyPoints) {
            if (k.x == point.longitude && k.y == point.latitude) {
                keyPointId = k.id;
                break;
            }
        }
        path->addMediaPoint(point, keyPointId, useIndex);
    }
}

void ProjectLoader::convertOldRouteDuration(double routeFactor)
{
    if (routeFactor != -1.0)
        return;
    double oldPercent = -1.0;
    initDouble(text(QStringLiteral("route"), QStringLiteral("animationDuration")), oldPercent);
    if (oldPercent != -1.0)
        m_document.timing().setFromOldPercent(oldPercent, m_document.naturalFrames());
}
