// The map view's answers to the pointer and keyboard: hover over key points and the
// route, the marker of a key point dragged along a track, moved key points and the
// view state that the map reports.

#include "mapview/MapView.h"

#include "app/Trace.h"
#include "path/GeoDistance.h"
#include "path/PointerSearch.h"
#include "project/PainterPathRenderer_Controller.h"

#include <QKeyEvent>

#include <limits>

namespace {

KeyPoint geoPoint(double longitude, double latitude)
{
    KeyPoint point;
    point.setLongitude(longitude, true);
    point.setLatitude(latitude, true);
    return point;
}

} // namespace

void MapView::setMouseOverPath(bool over)
{
    m_mouseOverPath = over;
    emit mouseOverPathChanged();
}

void MapView::setDebugText(const QString &text)
{
    m_debugText = text;
    emit debugInfoChanged();
}

void MapView::applyMarkerLock(uint32_t keyPointId)
{
    if (!m_mainController.updateMarkerLock(keyPointId))
        return;
    if (m_mainController.markerLocked()) {
        m_markerMoveSID1 = 0;
        emit markerMoveSID1Changed();
        emit markerMoveSID2Changed();
    }
    emit markerLockedChanged();
}

bool MapView::mouseMoved(double longitude, double latitude)
{
    if (hoverKeyPoint(longitude, latitude))
        return true;
    return hoverPath(longitude, latitude);
}

bool MapView::hoverKeyPoint(double longitude, double latitude)
{
    setMouseOverPath(false);
    const PathManager &paths = m_document->pathManager();
    const Path *path = paths.active();
    const uint32_t hit =
        path ? PointerSearch::keyPointAt(path->keyPoints, paths.scale(), latitude, longitude, m_moveDistance) : 0;
    const int hovered = int(hit);
    if (hovered != m_keypointHoveredID) {
        m_keypointHoveredID = hovered;
        emit keypointHoveredIDChanged();
    }
    applyMarkerLock(hit);
    if (hit == 0) {
        setMouseOverPath(false);
        return false;
    }
    return true;
}

bool MapView::hoverPath(double longitude, double latitude)
{
    Path *path = m_document->pathManager().active();
    if (!path) {
        setMouseOverPath(false);
        return false;
    }
    std::vector<CurvePoint> &samples = path->curvePoints;
    // The mark of the sample under the pointer is the drop target of a click on the
    // route: one sample at most carries it.
    for (CurvePoint &sample : samples)
        sample.tt = 0;
    const PointerSearch::SampleHit hit =
        PointerSearch::sampleAt(samples, m_document->pathManager().scale(), latitude, longitude, m_moveDistance);
    if (hit.index < 0) {
        setMouseOverPath(false);
        return false;
    }

    m_mouseOverPath = true;
    CurvePoint &sample = samples[size_t(hit.index)];
    logTrace(0, QStringLiteral("mouseMove: distance = %d [min %f, max %f]"), int(sample.id), hit.distance,
             hit.farthest);
    m_mouseOverPathPosition = QGeoCoordinate(sample.y, sample.x);
    sample.tt = 1;
    emit mouseOverPathPositionChanged();

    const auto distanceTo = [&](int index) {
        if (index < 0 || size_t(index) >= samples.size())
            return std::numeric_limits<double>::max();
        return geoDistance(sample.y, sample.x, samples[size_t(index)].y, samples[size_t(index)].x);
    };
    setDebugText(QStringLiteral("cp: %1\ndist to prev(%2) = %3\ndist to succ(%4) = %5")
                     .arg(sample.id)
                     .arg(0)
                     .arg(distanceTo(hit.index - 1))
                     .arg(0)
                     .arg(distanceTo(hit.index + 1)));
    emit mouseOverPathChanged();
    m_mouseOverPathPositionPercentage = double(hit.index) / double(samples.size());
    emit mouseOverPathPositionPercentageChanged();
    return true;
}

void MapView::markerMoved(double longitude, double latitude)
{
    PathManager &paths = m_document->pathManager();
    const Path *path = paths.active();
    if (!path || !path->isFixedTrack())
        return;

    // The key point ahead of the hovered one, or the hovered one when it is the first.
    uint32_t previousId = uint32_t(m_keypointHoveredID);
    for (const KeyPoint &point : path->keyPoints) {
        if (int(point.id) == m_keypointHoveredID)
            break;
        previousId = point.id;
    }

    // Both legs that touch the hovered key point: behind the previous key point up to
    // the key point behind the hovered one.
    double best = std::numeric_limits<double>::max();
    int nearest = 0;
    QGeoCoordinate candidate(latitude, longitude);
    const std::vector<CurvePoint> &samples = path->curvePoints;
    int crossed = 0;
    for (size_t i = 0; i < samples.size(); ++i) {
        const CurvePoint &sample = samples[i];
        if (crossed == 0) {
            if (sample.correspondingKeyPoint == previousId)
                crossed = 1;
            continue;
        }
        if (sample.correspondingKeyPoint != 0 && ++crossed > 2)
            break;
        const double distance = geoDistance(latitude, longitude, sample.y, sample.x);
        if (distance < best) {
            best = distance;
            nearest = int(i);
            candidate = QGeoCoordinate(sample.y, sample.x);
        }
    }

    if (!m_mainController.markerLocked()) {
        if (const PathSegment *segment = paths.segmentForKeyPoint(previousId))
            m_markerMoveSID1 = int(segment->id);
        if (const PathSegment *segment = paths.segmentForKeyPoint(uint32_t(m_keypointHoveredID)))
            m_markerMoveSID2 = int(segment->id);
        emit markerMoveSID1Changed();
        emit markerMoveSID2Changed();
    }

    const CurvePoint *at = samples.empty() ? nullptr : &samples[size_t(nearest)];
    const QString text = QStringLiteral("nearestIdx: %1\nlat: %2, long: %3\ncurrent = lat: %4, long: %5\n distance = %6")
                             .arg(nearest)
                             .arg(at ? at->y : 0.0)
                             .arg(at ? at->x : 0.0)
                             .arg(latitude)
                             .arg(longitude)
                             .arg(best);
    logTrace(0, text);
    setDebugText(text);

    m_mouseOverPath = true;
    m_mouseOverPathPosition = candidate;
    emit mouseOverPathPositionChanged();
    emit mouseOverPathChanged();
}

void MapView::setMoveDistance(double distance)
{
    m_moveDistance = distance;
}

void MapView::changeKeyPointPosition(int kpId, double longitude, double latitude)
{
    Path *path = m_document->pathManager().active();
    double x = longitude;
    double y = latitude;
    if (path && path->changeKeyPointPosition(uint32_t(kpId), x, y)) {
        if (x != longitude || y != latitude)
            emit keyPointPositionChanged(kpId, x, y);
        setProjectModified(true);
        keyPointsMoved();
        emit mediaPointsChanged();
    }
    m_markerMoveSID1 = 0;
    emit markerMoveSID1Changed();
    emit markerMoveSID2Changed();
}

void MapView::setCenterPosition(double latitude, double longitude)
{
    if (m_loading || m_animationRunning)
        return;
    m_document->fields().centerPosition = geoPoint(longitude, latitude);
}

void MapView::saveBoundaries(double longitudeTL, double latitudeTL, double longitudeBR, double latitudeBR)
{
    if (m_loading || m_animationRunning)
        return;
    ProjectFields &fields = m_document->fields();
    fields.visibleBoundariesTL = geoPoint(longitudeTL, latitudeTL);
    fields.visibleBoundariesBR = geoPoint(longitudeBR, latitudeBR);
    logTrace(0, QStringLiteral("MapView::saveBoundaries: %f, %f - %f, %f"), latitudeTL, longitudeTL, latitudeBR,
             longitudeBR);
}

void MapView::setZoom(double current)
{
    if (m_loading || m_animationRunning)
        return;
    logTrace(0, QStringLiteral("setZoomLevel = %f"), current);
    m_document->fields().currentZoomLevel = current;
    setMouseOverPath(false);
    emit currentZoomLevelChanged();
}

void MapView::setCurrentTilt(double current)
{
    if (m_loading || m_animationRunning)
        return;
    logTrace(0, QStringLiteral("setCurrentTilt %f"), current);
    if (m_document->fields().currentTilt != current) {
        m_document->fields().currentTilt = current;
        emit currentTiltChanged();
    }
    if (m_mouseOverPath)
        setMouseOverPath(false);
}

void MapView::resetPhotoDrop()
{
    if (m_keypointHoveredID != 0) {
        m_keypointHoveredID = 0;
        emit keypointHoveredIDChanged();
    }
    applyMarkerLock(0);
    setMouseOverPath(false);
}

void MapView::keyPressEvent(QKeyEvent *event)
{
    if (event->key() == Qt::Key_Escape)
        leaveFullscreen();
    if (event->key() == Qt::Key_Space && (event->modifiers() & Qt::ControlModifier) && !m_exportRunning) {
        if (m_animationRunning)
            stopAnimation(true);
        else
            startAnimation();
    }
    advanceDebugKeys(event);
    QQuickView::keyPressEvent(event);
}

void MapView::advanceDebugKeys(const QKeyEvent *event)
{
    // Control, Alt and Shift held, then D, B, G: the overlay of hover reports.
    const Qt::KeyboardModifiers all = Qt::ControlModifier | Qt::AltModifier | Qt::ShiftModifier;
    const int key = event->key();
    if ((event->modifiers() & all) == all && key >= Qt::Key_Shift && key <= Qt::Key_Alt)
        m_debugKeyState = key == Qt::Key_Meta ? 0 : 1;
    else if (m_debugKeyState == 1 && key == Qt::Key_D)
        m_debugKeyState = 2;
    else if (m_debugKeyState == 2 && key == Qt::Key_B)
        m_debugKeyState = 3;
    else if (m_debugKeyState == 3 && key == Qt::Key_G) {
        m_debugKeyState = 0;
        setDebugInfoActive(true);
    } else {
        m_debugKeyState = 0;
    }
}

void MapView::keyPointsMoved()
{
    m_keyPointItemsModel.updatePathSegments();
}
