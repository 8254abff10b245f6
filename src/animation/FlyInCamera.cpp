#include "animation/FlyInCamera.h"

#include "animation/VisibleRegionProvider.h"
#include "app/Trace.h"
#include "path/PathManager.h"

#include <algorithm>
#include <cmath>

namespace {

CameraView &processSavedView()
{
    static CameraView view;
    return view;
}

}

FlyInCamera::FlyInCamera(AnimationSource &source, const VisibleRegionProvider *map) : m_source(source), m_map(map) {}

const CameraView &FlyInCamera::savedView()
{
    return processSavedView();
}

void FlyInCamera::saveView()
{
    const CameraView view = m_source.cameraView();
    logTrace(0, QStringLiteral("currentZoomLevel = %f"), view.zoom);
    processSavedView() = view;
}

void FlyInCamera::restoreView()
{
    const CameraView &saved = processSavedView();
    logTrace(0, QStringLiteral("setZoomLevel = %f"), saved.zoom);
    CameraView view = m_source.cameraView();
    view.zoom = saved.zoom;
    view.centre.setLatitude(saved.centre.latitude, false);
    view.centre.setLongitude(saved.centre.longitude, false);
    view.bearing = saved.bearing;
    view.tilt = saved.tilt;
    m_source.setCameraView(view);
}

GeoRect FlyInCamera::visibleRegion() const
{
    GeoRect region;
    if (m_map && m_map->visibleRegion(region))
        return region;
    return m_source.visibleBoundaries();
}

double FlyInCamera::prepareFlyIn()
{
    saveView();
    const double startZoom = m_source.cameraView().zoom;
    logTrace(0, QStringLiteral("currentZoomLevel = %f"), startZoom);
    if (!m_source.flyInSwitches().enabled)
        return startZoom;

    const auto curve = m_source.pathManager().curvePointsVector();
    if (!curve->empty()) {
        double minX = curve->front().x, maxX = minX;
        double minY = curve->front().y, maxY = minY;
        for (const CurvePoint &c : *curve) {
            minX = std::min(minX, c.x);
            maxX = std::max(maxX, c.x);
            minY = std::min(minY, c.y);
            maxY = std::max(maxY, c.y);
        }
        setZoomForExtent(maxX - minX, maxY - minY);
        logTrace(0, QStringLiteral("currentZoomLevel = %f"), m_source.cameraView().zoom);
    }
    return startZoom;
}

void FlyInCamera::setZoomForExtent(double w, double h)
{
    const GeoRect visible = visibleRegion();
    const double vw = visible.width();
    const double vh = visible.height();
    CameraView view = m_source.cameraView();
    double z = std::trunc(view.zoom);
    logTrace(0, QStringLiteral("currentZoomLevel = %f"), view.zoom);

    // Without finite sizes and a non-empty view there is nothing to fit, and the
    // loops below would not end.
    w = std::abs(w);
    h = std::abs(h);
    const bool usableView = std::isfinite(vw) && std::isfinite(vh) && vw > 0.0 && vh > 0.0 && std::isfinite(w) &&
                            std::isfinite(h);
    if (usableView && w != 0.0 && h != 0.0 && (vw > w || vh > h)) {
        while (vw > 2 * w || vh > 2 * h) {
            w *= 2;
            h *= 2;
            z -= 1;
        }
        z -= 1;
    }
    w *= 0.85;
    h *= 0.85;
    if (usableView) {
        while (w * 0.5 > vw && h * 0.5 > vh) {
            w *= 0.5;
            h *= 0.5;
            z += 1;
        }
    }
    logTrace(0, QStringLiteral("setZoomLevel = %f"), z);
    view.zoom = z;
    m_source.setCameraView(view);
}
