// The preview: the playback loop, the camera and the avatar it drives, and the
// settings of the film.
#include "mapview/MapView.h"

#include "animation/FlyInCamera.h"
#include "animation/RoutePose.h"
#include "app/Trace.h"
#include "content/ContentItems.h"
#include "project/PainterPathRenderer_Controller.h"

#include <QKeyEvent>
#include <QMouseEvent>
#include <QQuickItem>
#include <QTimer>

#include <algorithm>
#include <cmath>

namespace {

constexpr int stopAfterClick = 300; // ms: a click into the running preview ends it

QVariantMap poseMap(const RoutePose &pose)
{
    return {{QStringLiteral("valid"), pose.valid},
            {QStringLiteral("longitude"), pose.longitude},
            {QStringLiteral("latitude"), pose.latitude},
            {QStringLiteral("heading"), pose.heading}};
}

}

bool MapView::visibleRegion(GeoRect &region) const
{
    QQuickItem *root = rootObject();
    QVariant corners;
    if (!root || !QMetaObject::invokeMethod(root, "visibleRegion", Q_RETURN_ARG(QVariant, corners)))
        return false;
    const QVariantList list = corners.toList();
    if (list.size() != 4)
        return false;
    region.left = list[0].toDouble();
    region.top = list[1].toDouble();
    region.right = list[2].toDouble();
    region.bottom = list[3].toDouble();
    return region.width() > 0.0 && region.height() > 0.0;
}

void MapView::startAnimation()
{
    logTrace(0, QStringLiteral("tracking: start animation"));
    m_animationRunning = true;
    emit animationRunningChanged();

    logTrace(0, QStringLiteral("currentZoomLevel = %f"), m_document->fields().currentZoomLevel);
    FlyInCamera camera(m_animationSource, this);
    const double startZoom = camera.prepareFlyIn();

    m_keyPointItemsModel.refreshOrderIndices();
    m_keyPointItemsModel.setAllVisibleForAnimation(false);

    m_eventList.build(m_document->fields().linearAnimationDurations, m_document->fields().flyInEnabled, startZoom);

    const std::vector<CurvePoint> curve = m_document->pathManager().curvePoints();
    m_headingSpan = headingSpanFor(curve);
    double west = 0.0, east = 0.0, south = 0.0, north = 0.0;
    if (!curve.empty()) {
        west = east = curve.front().x;
        south = north = curve.front().y;
        for (const CurvePoint &point : curve) {
            west = std::min(west, point.x);
            east = std::max(east, point.x);
            south = std::min(south, point.y);
            north = std::max(north, point.y);
        }
    }
    CameraView user = FlyInCamera::savedView();
    if (curve.empty())
        user.centre = m_document->fields().centerPosition;
    m_playbackCamera.prepare(user, m_eventList, curve.empty() ? user.centre.longitude : (west + east) / 2,
                             curve.empty() ? user.centre.latitude : (south + north) / 2);
    m_playback.start();
}

void MapView::stopAnimation(bool clicked)
{
    if (clicked)
        logTrace(0, QStringLiteral("tracking: stop animation"));
    m_keyPointItemsModel.setAllVisibleForAnimation(true);
    m_animationRunning = false;
    emit animationRunningChanged();
    m_playback.stop();
}

void MapView::killAnimation()
{
    if (m_exportRunning)
        return;
    if (m_animationRunning)
        stopAnimation(true);
}

void MapView::resetAnimationLoop()
{
    m_keyPointItemsModel.setAllVisibleForAnimation(false);
}

void MapView::setCurrentAnimationPosition(int nArrayIndex)
{
    logTrace(0, QStringLiteral("setCurrentAnimationPosition: %d"), nArrayIndex);
    if (m_document->fields().showKeyPointsOnAnimationPosition)
        m_keyPointItemsModel.setVisibleForAnimation(0, nArrayIndex, true);
    else if (nArrayIndex != 0)
        m_keyPointItemsModel.setAllVisibleForAnimation(true);
}

void MapView::setTimelinePosition(double position)
{
    if (!std::isfinite(position))
        return;
    m_timelinePosition = std::clamp(position, 0.0, 1.0);
    if (m_animationRunning && !m_exportRunning)
        m_playback.seek(m_timelinePosition);
    emit currentPositionChanged();
    emit animationDurationAsStringChanged();
    emit timeLinePositionAsStringChanged();
}

double MapView::animationDurationPerc() const
{
    const AnimationTiming &timing = m_document->timing();
    return timing.durationFactor < 0.0 ? 1.0 / timing.stretchLimit : timing.durationFactor;
}

void MapView::setAnimationDurationPerc(double perc)
{
    AnimationTiming &timing = m_document->timing();
    if (!std::isfinite(perc) || perc == timing.durationFactor)
        return;
    timing.setDurationFactor(std::clamp(perc, 0.0, 1.0));
    m_eventList.updateDuration();
    emit animationDurationChanged();
    emit animationDurationAsStringChanged();
    emit timeLinePositionAsStringChanged();
    setProjectModified(true);
}

void MapView::setAnimationMode(int mode)
{
    if (mode < int(CameraMode::Static) || mode > int(CameraMode::CropByRectangle) ||
        mode == m_document->fields().animationMode)
        return;
    m_document->fields().animationMode = mode;
    setProjectModified(true);
    emit currentAnimationModeChanged();
    // Each crop mode starts from its own shape: the first mask is the circle, the
    // second the rectangle.
    if (mode == int(CameraMode::CropByCircle))
        setAnimationFrame(0);
    else if (mode == int(CameraMode::CropByRectangle))
        setAnimationFrame(1);
}

void MapView::rebuildAnimationFrames()
{
    m_animationFrames.clear();
    for (const MaskItem &mask : m_document->catalogue().masks()) {
        QVariantMap frame = contentItemMap(mask, ItemMapField::MaskList | ItemMapField::SourceFile);
        frame.remove(QStringLiteral("groupeId"));
        frame.remove(QStringLiteral("groupeName"));
        m_animationFrames.append(frame);
    }
    emit animationFramesChanged();
}

void MapView::setAnimationFrame(int index)
{
    if (index < 0 || index >= m_animationFrames.size())
        return;
    ProjectFields &fields = m_document->fields();
    const QString source = m_animationFrames.at(index).toMap().value(QStringLiteral("sourceFileName")).toString();
    if (index == fields.animationFrame && source == fields.animationFrameSource)
        return;
    fields.animationFrame = index;
    fields.animationFrameSource = source;
    setProjectModified(true);
    emit currentAnimationFrameChanged();
    emit mapFrameSourceChanged();
}

void MapView::setKeyPointAnimationDuration(int value)
{
    if (!m_document->timing().setKeyPointAnimationDuration(value))
        return;
    setProjectModified(true);
    emit keyPointAnimationDurationChanged();
    emit keyPointImageAnimationDurationChanged();
}

void MapView::slotLinearAnimationDuration(bool state)
{
    if (m_document->fields().linearAnimationDurations == state)
        return;
    m_document->fields().linearAnimationDurations = state;
    setProjectModified(true);
    emit linearAnimationDurationChanged();
}

void MapView::slotFlyInAnimation(bool state)
{
    if (m_document->fields().flyInEnabled == state)
        return;
    m_document->fields().flyInEnabled = state;
    setProjectModified(true);
    emit flyInAnimationChanged();
}

void MapView::setEnableFlyInRotation(bool state)
{
    if (m_document->fields().flyInRotation == state)
        return;
    m_document->fields().flyInRotation = state;
    setProjectModified(true);
    emit enableFlyInRotationChanged();
}

void MapView::setEnableFlyInTilt(bool state)
{
    if (m_document->fields().flyInTilt == state)
        return;
    m_document->fields().flyInTilt = state;
    setProjectModified(true);
    emit enableFlyInTiltChanged();
}

void MapView::setFlyInDuration(int seconds)
{
    if (seconds < 0 || seconds == m_document->timing().flyInDuration)
        return;
    m_document->timing().flyInDuration = seconds;
    setProjectModified(true);
    emit flyInDurationChanged();
}

void MapView::setFlyInEndTilt(int degrees)
{
    if (double(degrees) == m_document->timing().flyInTilt)
        return;
    m_document->timing().flyInTilt = std::clamp(degrees, 0, 90);
    setProjectModified(true);
    emit flyInEndTiltChanged();
}

void MapView::setFlyInStartRotation(int degrees)
{
    if (double(degrees) == m_document->timing().flyInRotation)
        return;
    m_document->timing().flyInRotation = degrees;
    setProjectModified(true);
    emit flyInStartRotationChanged();
}

void MapView::stepAnimation()
{
    m_playback.stepAnimation();
}

void MapView::seekToEnd()
{
    m_playback.seekToEnd();
}

void MapView::showPlaybackEvent()
{
    m_animationEvent = m_playback.animationEvent();
    const uint32_t sample = m_animationEvent.value(QStringLiteral("pathPosition")).toUInt();
    const Path *path = m_document->pathManager().active();
    const RoutePose pose = path ? routePoseAt(path->curvePoints, sample, m_headingSpan) : RoutePose();
    m_avatarPose = poseMap(pose);
    m_animationCamera =
        m_playbackCamera.viewFor(m_animationEvent, pose, CameraMode(m_document->fields().animationMode));
    if (!m_exportRunning && m_playback.share() != m_timelinePosition) {
        m_timelinePosition = m_playback.share();
        emit currentPositionChanged();
        emit timeLinePositionAsStringChanged();
    }
    emit animationEventChanged();
}

void MapView::playbackEndShown()
{
    if (m_animationRunning)
        return;
    FlyInCamera(m_animationSource, this).restoreView();
    rebuildLocationSettings();
    emit locationSettingsChanged();
    emit currentZoomLevelChanged();
    emit currentBearingChanged();
    emit currentTiltChanged();
    emit centerPositionChanged();
}

// A click on the map, not on one of the controls over it such as the timeline.
bool MapView::releaseIsOnTheMap() const
{
    for (const QQuickItem *item = mouseGrabberItem(); item; item = item->parentItem()) {
        if (item->objectName() == QLatin1String("mapStage"))
            return true;
    }
    return mouseGrabberItem() == nullptr;
}

void MapView::mouseReleaseEvent(QMouseEvent *event)
{
    if (m_animationRunning && releaseIsOnTheMap())
        QTimer::singleShot(stopAfterClick, this, &MapView::killAnimation);
    QQuickView::mouseReleaseEvent(event);
}
