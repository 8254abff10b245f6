#include "project/DocumentAnimationSource.h"

#include "project/PainterPathRenderer_Controller.h"

DocumentAnimationSource::DocumentAnimationSource(PainterPathRenderer_Controller &document) : m_document(document) {}

const PathManager &DocumentAnimationSource::pathManager() const
{
    return m_document.pathManager();
}

AnimationTiming &DocumentAnimationSource::timing()
{
    return m_document.timing();
}

const AnimationTiming &DocumentAnimationSource::timing() const
{
    return m_document.timing();
}

CameraView DocumentAnimationSource::cameraView() const
{
    const ProjectFields &f = m_document.fields();
    CameraView view;
    view.zoom = f.currentZoomLevel;
    view.centre = f.centerPosition;
    view.bearing = f.currentBearing;
    view.tilt = f.currentTilt;
    return view;
}

void DocumentAnimationSource::setCameraView(const CameraView &view)
{
    ProjectFields &f = m_document.fields();
    f.currentZoomLevel = view.zoom;
    f.centerPosition = view.centre;
    f.currentBearing = view.bearing;
    f.currentTilt = view.tilt;
}

GeoRect DocumentAnimationSource::visibleBoundaries() const
{
    const ProjectFields &f = m_document.fields();
    GeoRect rect;
    rect.left = f.visibleBoundariesTL.longitude;
    rect.top = f.visibleBoundariesTL.latitude;
    rect.right = f.visibleBoundariesBR.longitude;
    rect.bottom = f.visibleBoundariesBR.latitude;
    return rect;
}

FlyInSwitches DocumentAnimationSource::flyInSwitches() const
{
    const ProjectFields &f = m_document.fields();
    FlyInSwitches switches;
    switches.enabled = f.flyInEnabled;
    switches.enableRotation = f.flyInRotation;
    switches.enableTilt = f.flyInTilt;
    return switches;
}

bool DocumentAnimationSource::linearAnimationDurations() const
{
    return m_document.fields().linearAnimationDurations;
}

FullFrameTiming DocumentAnimationSource::fullFrameTiming() const
{
    const ProjectFields &f = m_document.fields();
    FullFrameTiming timing;
    timing.duration = f.fullFrameDuration;
    timing.fadeDuration = f.fullFrameFadeDuration;
    return timing;
}

QSize DocumentAnimationSource::photoPoolSize(const QString &file) const
{
    for (const PoolPhoto &photo : m_document.photoPool().photos) {
        if (photo.path == file)
            return QSize(photo.sizeW, photo.sizeH);
    }
    return QSize();
}
